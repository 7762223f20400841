#include "random_sink.h"

#include <algorithm>
#include <array>

#include "plain_record.h"

namespace properties {
namespace {

using test_support::bytes_t;

constexpr std::size_t block_size = 128;
constexpr u32 room_in_extension = 127;
constexpr u32 descriptor_size = 18;

/// Adds a timing of a VIC, or one that has none; answers its descriptor.
bytes_t add_timing(random_source_t &random, random_sink_t *sink) {
  constexpr u32 vic_39 = 39;
  constexpr u32 vic_that_39_reads_back_as = 20;
  u32 vic = random.chance(70) ? random_vic(random, 64) : 0;
  detailed_timing_t timing = vic == 0 ? random_timing(random) : test_support::timing_of_vic(vic);
  timing.pixel_clock = timing.pixel_clock / 10000 * 10000;
  sink->timings.push_back(timing);
  sink->timing_vics.push_back(vic == vic_39 ? vic_that_39_reads_back_as : vic);
  return test_support::timing_descriptor(timing);
}

bytes_t random_base_block(random_source_t &random, random_sink_t *sink) {
  test_support::base_block_builder_t base;
  base.extensions(1);
  for (u32 offset = 10; offset < 38; ++offset) {
    if (offset < 18 || offset > 20) base.byte(offset, random.byte());
  }
  for (u32 slot = 0; slot < 8; ++slot) {
    if (random.chance(60)) continue;
    const u8 a = random.byte();
    const u8 b = random.byte();
    if (a == 1 && b == 1) continue;
    base.standard_timing(slot, a, b);
    sink->std_timings.push_back({(a + 31u) * 8, u32{b} >> 6, (b & 0x3Fu) + 60});
  }
  u32 slot = 0;
  for (u32 i = random.between(0, 2); i > 0; --i)
    base.descriptor(slot++, add_timing(random, sink));
  base.descriptor(slot, test_support::text_descriptor(0xFC, "Random"));
  return base.build();
}

// A vendor-specific data block with the sink's 4Kx2K and 3D capabilities.
bytes_t random_hdmi_block(random_source_t &random, random_sink_t *sink) {
  constexpr std::array<std::array<u8, 2>, 7> structures{
      {{0, 0x01}, {1, 0x08}, {2, 0x10}, {3, 0x20}, {4, 0x40}, {5, 0x80}, {6, 0x04}}};
  bytes_t payload{random.byte(), random.byte(), random.byte(), random.byte()};
  sink->has_3d = random.flag() != 0;
  for (u32 i = random.between(0, 4); i > 0; --i)
    sink->hdmi_vics.push_back(random.between(1, 5));
  bytes_t orders;
  if (sink->has_3d && !sink->video.empty()) {
    const u32 last = static_cast<u32>(std::min<std::size_t>(sink->video.size(), 16)) - 1;
    for (u32 i = random.between(0, 10); i > 0; --i) {
      const u32 index = random.between(0, last);
      const auto [code, stereo] = random.one_of(structures);
      orders.push_back(static_cast<u8>(index << 4 | code));
      sink->video[index].second |= stereo;
    }
  }
  const u32 latencies = random.between(0, 2);
  payload.push_back(
      static_cast<u8>((latencies > 0 ? 0x80 : 0) | (latencies > 1 ? 0x40 : 0) | 0x20 | random.between(0, 15)));
  for (u32 i = 2 * latencies; i > 0; --i)
    payload.push_back(random.byte());
  payload.push_back(sink->has_3d ? 0x80 : 0x00);
  payload.push_back(static_cast<u8>(sink->hdmi_vics.size() << 5 | orders.size()));
  for (const u32 vic : sink->hdmi_vics)
    payload.push_back(static_cast<u8>(vic));
  return test_support::hdmi_block(test_support::join(payload, orders));
}

bytes_t random_audio_block(random_source_t &random, random_sink_t *sink) {
  bytes_t descriptors;
  for (u32 i = random.between(0, 8); i > 0; --i) {
    const u32 type = random.between(1, 17);
    const u32 code = std::min(type, 15u);
    // The extension codes 1 to 3; rarely one that nobody knows.
    const u32 extension = random.chance(2) ? 4 : type - 14;
    descriptors.push_back(static_cast<u8>(code << 3 | random.between(0, 7)));
    descriptors.push_back(static_cast<u8>(random.between(0, 127)));
    descriptors.push_back(code == 15 ? static_cast<u8>(extension << 3) : random.byte());
    sink->audio_types.push_back(code < 15 ? code : extension > 3 ? 0 : 15 + extension);
  }
  return test_support::audio_block(descriptors);
}

bytes_t random_extension(random_source_t &random, random_sink_t *sink) {
  test_support::extension_builder_t extension;
  extension.flags(random.byte());
  bytes_t video;
  for (u32 i = random.between(0, 20); i > 0; --i) {
    const u32 vic = random_vic(random, 127);
    video.push_back(static_cast<u8>(vic | (random.chance(20) ? 0x80 : 0)));
    sink->video.emplace_back(vic, 0);
  }
  bytes_t blocks = test_support::video_block(video);
  const auto append = [&blocks](const bytes_t &block) { blocks = test_support::join(blocks, block); };
  if (random.chance(90)) append(random_audio_block(random, sink));
  if (random.chance(50)) append(test_support::data_block(4, {random.byte(), random.byte(), random.byte()}));
  if (random.chance(90)) append(random_hdmi_block(random, sink));
  if (random.chance(50)) append(test_support::data_block(7, {0x05, random.byte(), random.byte()}));
  extension.block(blocks);
  const u32 most_timings = (room_in_extension - 4 - static_cast<u32>(blocks.size())) / descriptor_size;
  for (u32 i = random.between(0, std::min(most_timings, 2u)); i > 0; --i)
    extension.timing(add_timing(random, sink));
  return extension.build();
}

}  // namespace

random_sink_t random_sink(random_source_t &random) {
  random_sink_t sink;
  const bytes_t base = random_base_block(random, &sink);
  sink.bytes = test_support::join(base, random_extension(random, &sink));
  return sink;
}

u32 random_vic(random_source_t &random, u32 last) {
  if (random.chance(15)) return random.between(1, last);
  return random.one_of(std::array<u32, 14>{1, 2, 3, 4, 5, 16, 17, 19, 20, 31, 32, 33, 34, 39});
}

bytes_t random_bytes_of_a_sink(random_source_t &random) {
  bytes_t bytes = random_sink(random).bytes;
  if (random.chance(50)) {
    for (std::size_t i = 18; i < bytes.size(); ++i) {
      const bool fixed = i < 20 || (i >= block_size && i < block_size + 3);
      if (!fixed) bytes[i] = random.byte();
    }
    // The end of the data blocks: also in the header, also at the end of the block.
    bytes[block_size + 2] = static_cast<u8>(random.between(0, 112));
  } else {
    for (u32 i = random.between(1, 8); i > 0; --i)
      bytes[random.between(8, static_cast<u32>(bytes.size()) - 1)] = random.byte();
  }
  const u32 blocks = random.between(0, 4);
  bytes.resize(block_size * blocks, random.byte());
  for (std::size_t offset = 0; offset < bytes.size(); offset += block_size) {
    if (random.chance(95)) test_support::mend_checksum(bytes, offset);
  }
  return bytes;
}

}  // namespace properties
