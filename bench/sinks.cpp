#include "sinks.h"

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <stdexcept>

#include "support/hex_text.h"

namespace bench {
namespace {

constexpr std::size_t block_size = 128;

bytes_t raw_bytes(const std::filesystem::path &file) {
  std::ifstream stream(file, std::ios::binary);
  return {std::istreambuf_iterator<char>(stream), {}};
}

/// A data block with a payload of @p size bytes, made from one descriptor over and over again.
bytes_t block_of(u8 tag, std::size_t size, const bytes_t &descriptor) {
  bytes_t payload;
  while (payload.size() < size)
    payload.insert(payload.end(), descriptor.begin(), descriptor.end());
  payload.resize(size);
  return test_support::data_block(tag, payload);
}

/// @p count descriptors, each one larger than the one before.
bytes_t ascending(u8 first, u8 count, u8 step, const bytes_t &rest) {
  bytes_t descriptors;
  for (u8 i = 0; i < count; ++i) {
    descriptors.push_back(static_cast<u8>(first + i * step));
    descriptors.insert(descriptors.end(), rest.begin(), rest.end());
  }
  return descriptors;
}

/// A detailed timing with that pixel clock; of the rest only the width is there.
bytes_t timing_bytes(u8 clock_low, u8 clock_high) {
  constexpr std::size_t descriptor_size = 18;
  bytes_t bytes{clock_low, clock_high, 0x03};
  bytes.resize(descriptor_size);
  return bytes;
}

}  // namespace

std::vector<sink_t> sinks_of(const std::string &folder) {
  std::vector<sink_t> sinks;
  for (const auto &file : std::filesystem::directory_iterator(folder)) {
    const std::string name = file.path().stem().string();
    if (file.path().extension() == ".bin") sinks.push_back({name, raw_bytes(file.path())});
    if (file.path().extension() == ".txt")
      sinks.push_back({name, test_support::bytes_of_hex_file(file.path().string())});
  }
  std::sort(sinks.begin(), sinks.end(), [](const sink_t &a, const sink_t &b) { return a.name < b.name; });
  return sinks;
}

sink_t sink_of(const std::string &folder, const std::string &name) {
  for (sink_t &sink : sinks_of(folder)) {
    if (sink.name == name) return sink;
  }
  throw std::runtime_error("no sink " + name + " in " + folder);
}

const std::vector<hostile_family_t> &hostile_families() {
  constexpr u8 audio = 1;
  constexpr u8 video = 2;
  constexpr u8 longest = 31;
  constexpr u8 unbounded = 0;
  constexpr u8 timings_only = 4;
  constexpr u8 first_vic_without_timing = 95;
  // 3D is present with structures for all of a mask of modes; 30 bytes of 3D information.
  const bytes_t full_hdmi_block =
      test_support::hdmi_block({0x10, 0x00, 0xB8, 60,   0x20, 0xC0, 0x1E, 0xFF, 0xFF, 0xFF, 0xFF, 0x10, 0x20, 0x30,
                                0x40, 0x50, 0x60, 0x70, 0x80, 0x80, 0x90, 0xA0, 0xB0, 0xC0, 0xD0, 0xE0, 0xF0, 0xF1});
  static const std::vector<hostile_family_t> families = {
      {"known_vics", "short video descriptors", unbounded, {}, test_support::video_block(ascending(1, longest, 1, {}))},
      // The first block is shorter so that the last one begins at the last byte but one, and reads 30 bytes that are
      // not there.
      {"unknown_vics", "short video descriptors of a VIC without a timing", unbounded,
       block_of(video, 25, {first_vic_without_timing}), block_of(video, longest, {first_vic_without_timing})},
      {"audio_formats",
       "short audio descriptors, of ten types",
       unbounded,
       {},
       test_support::audio_block(ascending(0x0F, 10, 8, {0x07, 0x07}))},
      {"malformed_audio", "short audio descriptors of type 0", unbounded, {}, block_of(audio, 30, {0x00, 0x07, 0x07})},
      {"hdmi_blocks", "16 short video descriptors, then HDMI blocks that give all of them 3D", unbounded,
       test_support::video_block(ascending(1, 16, 1, {})), full_hdmi_block},
      {"overlapping_hdmi",
       "HDMI blocks of 11 bytes, each with 31 bytes of 3D information after its end",
       unbounded,
       {},
       test_support::hdmi_block({0x00, 0x00, 0x00, 0x00, 0x20, 0x80, 0x1F})},
      {"empty_blocks", "data blocks without a payload", unbounded, {}, {0x00}},
      {"timings", "detailed timings that no VIC has", timings_only, {}, timing_bytes(0x01, 0x01)},
      {"malformed_timings",
       "18 bytes that are neither a detailed timing nor a descriptor",
       timings_only,
       {},
       timing_bytes(0x00, 0x00)},
  };
  return families;
}

bytes_t hostile_sink(const hostile_family_t &family, std::size_t size) {
  bytes_t extension{0x02, 0x03, family.timings_offset, 0x00};
  extension.insert(extension.end(), family.begin.begin(), family.begin.end());
  while (extension.size() < size - block_size)
    extension.insert(extension.end(), family.pattern.begin(), family.pattern.end());
  extension.resize(size - block_size);
  test_support::mend_checksum(extension, 0);
  const auto announced = static_cast<u8>(std::min<std::size_t>(size / block_size - 1, 255));
  return test_support::join(test_support::base_block_builder_t().extensions(announced).build(), extension);
}

}  // namespace bench
