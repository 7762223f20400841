#include "support/edid_builder.h"

#include <algorithm>
#include <numeric>
#include <stdexcept>

namespace test_support {
namespace {

constexpr std::size_t block_size = 128;
constexpr std::size_t descriptor_size = 18;
constexpr std::size_t checksum_offset = 127;

u8 low(u32 value) {
  return static_cast<u8>(value & 0xFF);
}

/// The bits of @p value above its low @p shift, cut to @p mask.
u32 high(u32 value, u32 shift, u32 mask) {
  return value >> shift & mask;
}

/// A display descriptor (EDID 1.3, section 3.10.3) of zeroes.
bytes_t display_descriptor(u8 tag) {
  bytes_t descriptor(descriptor_size);
  descriptor[3] = tag;
  return descriptor;
}

}  // namespace

u8 block_sum(const u8 *block) {
  return static_cast<u8>(std::accumulate(block, block + block_size, 0u));
}

void mend_checksum(bytes_t &edid, std::size_t offset) {
  u8 &checksum = edid.at(offset + checksum_offset);
  checksum = static_cast<u8>(checksum - block_sum(edid.data() + offset));
}

bytes_t timing_descriptor(const detailed_timing_t &timing) {
  const u32 clock = timing.pixel_clock / 10000;
  constexpr u32 digital_separate_sync = 0x18;
  const u32 flags = (timing.progressive ? 0u : 0x80u) | (timing.stereo ? 0x20u : 0u) | digital_separate_sync |
                    (timing.v_sync_positive ? 4u : 0u) | (timing.h_sync_positive ? 2u : 0u);
  return {low(clock),
          low(clock >> 8),
          low(timing.h_active),
          low(timing.h_blanking),
          low(high(timing.h_active, 8, 0xF) << 4 | high(timing.h_blanking, 8, 0xF)),
          low(timing.v_active),
          low(timing.v_blanking),
          low(high(timing.v_active, 8, 0xF) << 4 | high(timing.v_blanking, 8, 0xF)),
          low(timing.h_sync_offset),
          low(timing.h_sync_width),
          low((timing.v_sync_offset & 0xF) << 4 | (timing.v_sync_width & 0xF)),
          low(high(timing.h_sync_offset, 8, 3) << 6 | high(timing.h_sync_width, 8, 3) << 4 |
              high(timing.v_sync_offset, 4, 3) << 2 | high(timing.v_sync_width, 4, 3)),
          low(timing.h_image_size),
          low(timing.v_image_size),
          low(high(timing.h_image_size, 8, 0xF) << 4 | high(timing.v_image_size, 8, 0xF)),
          timing.h_border,
          timing.v_border,
          low(flags)};
}

bytes_t text_descriptor(u8 tag, const std::string &text) {
  constexpr std::size_t text_offset = 5;
  constexpr std::size_t text_size = 13;
  if (text.size() > text_size) throw std::length_error("a descriptor's text has 13 characters at most");
  bytes_t descriptor = display_descriptor(tag);
  std::fill(descriptor.begin() + text_offset, descriptor.end(), u8{' '});
  std::copy(text.begin(), text.end(), descriptor.begin() + text_offset);
  if (text.size() < text_size) descriptor[text_offset + text.size()] = '\n';
  return descriptor;
}

bytes_t range_limits_descriptor(u8 min_v, u8 max_v, u8 min_h, u8 max_h, u8 clock_in_10_mhz) {
  bytes_t descriptor = display_descriptor(0xFD);
  const bytes_t limits{min_v, max_v, min_h, max_h, clock_in_10_mhz, 0, '\n', ' ', ' ', ' ', ' ', ' ', ' '};
  std::copy(limits.begin(), limits.end(), descriptor.begin() + 5);
  return descriptor;
}

bytes_t dummy_descriptor() {
  return display_descriptor(0x10);
}

bytes_t data_block(u8 tag, const bytes_t &payload) {
  if (tag > 7 || payload.size() > 31) throw std::length_error("a data block has tags 0 to 7 and 31 bytes at most");
  return join({static_cast<u8>(u32{tag} << 5 | payload.size())}, payload);
}

bytes_t video_block(const bytes_t &descriptors) {
  return data_block(2, descriptors);
}

bytes_t audio_block(const bytes_t &descriptors) {
  return data_block(1, descriptors);
}

bytes_t hdmi_block(const bytes_t &payload_behind_oui) {
  return data_block(3, join({0x03, 0x0C, 0x00}, payload_behind_oui));
}

base_block_builder_t::base_block_builder_t() : bytes_{0, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 0} {
  byte(8, 0x52).byte(9, 0x74);  // "TST"
  byte(18, 1).byte(19, 3);
  byte(20, 0x80);
  for (u32 slot = 0; slot < 8; ++slot)
    standard_timing(slot, 1, 1);
  for (u32 slot = 0; slot < 4; ++slot)
    descriptor(slot, dummy_descriptor());
}

base_block_builder_t &base_block_builder_t::byte(u32 offset, u8 value) {
  bytes_.at(offset) = value;
  return *this;
}

base_block_builder_t &base_block_builder_t::standard_timing(u32 slot, u8 a, u8 b) {
  return byte(38 + 2 * slot, a).byte(39 + 2 * slot, b);
}

base_block_builder_t &base_block_builder_t::descriptor(u32 slot, const bytes_t &descriptor) {
  for (u32 i = 0; i < descriptor_size; ++i)
    byte(54 + static_cast<u32>(descriptor_size) * slot + i, descriptor.at(i));
  return *this;
}

base_block_builder_t &base_block_builder_t::extensions(u8 count) {
  return byte(126, count);
}

bytes_t base_block_builder_t::build() const {
  bytes_t block(bytes_.begin(), bytes_.end());
  mend_checksum(block, 0);
  return block;
}

extension_builder_t &extension_builder_t::byte(u32 offset, u8 value) {
  overrides_.emplace_back(offset, value);
  return *this;
}

extension_builder_t &extension_builder_t::flags(u8 value) {
  flags_ = value;
  return *this;
}

extension_builder_t &extension_builder_t::block(const bytes_t &data_block) {
  blocks_ = join(blocks_, data_block);
  return *this;
}

extension_builder_t &extension_builder_t::timing(const bytes_t &descriptor) {
  timings_ = join(timings_, descriptor);
  return *this;
}

bytes_t extension_builder_t::build() const {
  bytes_t block{0x02, 0x03, static_cast<u8>(4 + blocks_.size()), flags_};
  block = join(join(block, blocks_), timings_);
  if (block.size() > checksum_offset) throw std::length_error("data blocks and timings have no room in the extension");
  block.resize(block_size);
  for (const auto &[offset, value] : overrides_)
    block.at(offset) = value;
  const bool checksum_given = std::any_of(overrides_.begin(), overrides_.end(),
                                          [](const auto &override) { return override.first == checksum_offset; });
  if (!checksum_given) mend_checksum(block, 0);
  return block;
}

bytes_t join(const bytes_t &a, const bytes_t &b) {
  bytes_t joined(a);
  joined.insert(joined.end(), b.begin(), b.end());
  return joined;
}

detailed_timing_t timing_of_vic(u32 vic) {
  detailed_timing_t timing{};
  if (convert_vic_to_dtd(vic, &timing) == 0) throw std::out_of_range("VICs with a timing are 1 to 64");
  return timing;
}

}  // namespace test_support
