#include "sinks.h"

#include <algorithm>
#include <filesystem>
#include <iterator>

#include "support/hex_text.h"

namespace bench {
namespace {

constexpr u32 vic_count = 64;
constexpr std::size_t largest_payload = 31;
constexpr std::size_t short_audio_size = 3;
/// Range limits as the base block has them.
constexpr u8 limits[] = {23, 61, 15, 90, 30};

bytes_t base_block() {
  return test_support::base_block_builder_t()
      .descriptor(0, test_support::timing_descriptor(test_support::timing_of_vic(16)))
      .descriptor(1, test_support::timing_descriptor(test_support::timing_of_vic(4)))
      .descriptor(2, test_support::text_descriptor(0xFC, "BENCH SINK"))
      .descriptor(3, test_support::range_limits_descriptor(limits[0], limits[1], limits[2], limits[3], limits[4]))
      .extensions(1)
      .build();
}

bytes_t hdmi_block() {
  return test_support::hdmi_block({0x10, 0x00, 0xB8, 0x3C});
}

/// Payload bytes as data blocks of one kind, as many as they need; none is cut inside of @p unit bytes.
void add_blocks(test_support::extension_builder_t *extension, const bytes_t &payload, std::size_t unit,
                bytes_t (*block)(const bytes_t &)) {
  const std::size_t step = largest_payload / unit * unit;
  for (std::size_t begin = 0; begin < payload.size(); begin += step) {
    const auto first = payload.begin() + static_cast<std::ptrdiff_t>(begin);
    const auto last = payload.begin() + static_cast<std::ptrdiff_t>(std::min(begin + step, payload.size()));
    extension->block(block(bytes_t(first, last)));
  }
}

bytes_t video_payload(u32 count) {
  bytes_t payload;
  for (u32 i = 0; i < count; ++i)
    payload.push_back(static_cast<u8>(1 + i % vic_count));
  return payload;
}

/// Types 2 to 14 over again, with 2 to 8 channels, so that no two are equal.
bytes_t audio_payload(u32 count) {
  bytes_t payload;
  for (u32 i = 0; i < count; ++i) {
    constexpr u32 first_type = 2;
    constexpr u32 types = 13;
    const u32 type = first_type + i % types;
    const u32 channels = 1 + i / types;
    payload.insert(payload.end(), {static_cast<u8>(type << 3 | channels), 0x07, 0x50});
  }
  return payload;
}

sink_t sink_of(const std::string &name, u32 video, u32 audio) {
  test_support::extension_builder_t extension;
  extension.flags(0xF0);
  add_blocks(&extension, video_payload(video), 1, test_support::video_block);
  add_blocks(&extension, audio_payload(audio), short_audio_size, test_support::audio_block);
  extension.block(hdmi_block());
  return {name, test_support::join(base_block(), extension.build())};
}

}  // namespace

const std::vector<sink_t> &sample_sinks() {
  static const std::vector<sink_t> sinks = [] {
    std::vector<sink_t> found;
    for (const auto &entry : std::filesystem::directory_iterator(EXAMPLES_DIR "/sinks")) {
      if (entry.path().extension() != ".txt") continue;
      found.push_back({entry.path().stem().string(), test_support::bytes_of_hex_file(entry.path().string())});
    }
    std::sort(found.begin(), found.end(), [](const sink_t &a, const sink_t &b) { return a.name < b.name; });
    return found;
  }();
  return sinks;
}

sink_t sink_with_video(u32 count) {
  return sink_of("video", count, 0);
}

sink_t sink_with_every_vic() {
  return sink_of("every_vic", vic_count, 0);
}

sink_t sink_with_audio(u32 count) {
  constexpr u32 video = 16;
  return sink_of("audio", video, count);
}

}  // namespace bench
