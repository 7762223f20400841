#include "explain/byte_fields.h"

#include <algorithm>
#include <cstdarg>
#include <cstdio>

namespace edid_cli {
namespace {

struct block_name_t {
  const char *id;
  const char *title;
};

constexpr block_name_t block_names[byte_block_count] = {
    {"identity", "Header and identity"},
    {"display", "Display and colours"},
    {"timings", "Established and standard timings"},
    {"descriptor", "Descriptor"},
    {"extension", "Extension header and checksums"},
    {"speakers", "Speaker allocation data block"},
    {"video", "Video data block"},
    {"audio", "Audio data block"},
    {"hdmi", "HDMI data block"},
    {"forum", "HDMI Forum data block"},
    {"capability", "Video capability data block"},
    {"colorimetry", "Colorimetry data block"},
    {"hdr", "HDR data block"},
    {"y420", "YCbCr 4:2:0 data block"},
    {"freesync", "FreeSync data block"},
    {"other", "Other data block"},
    {"unused", "Unused"},
};

}  // namespace

const char *byte_block_title(byte_block_t block) {
  return block_names[static_cast<std::size_t>(block)].title;
}

const char *byte_block_id(byte_block_t block) {
  return block_names[static_cast<std::size_t>(block)].id;
}

std::span<const u8> byte_naming_t::bytes(std::size_t begin, std::size_t end) const {
  const std::size_t last = std::min(end, edid_.size());
  return begin < last ? edid_.subspan(begin, last - begin) : std::span<const u8>();
}

void byte_naming_t::name(byte_block_t block, std::size_t size, const std::string &name, const std::string &meaning) {
  const std::size_t room = end_ > position_ ? end_ - position_ : 0;
  if (const std::size_t there = std::min(size, room); there != 0) {
    fields_.push_back({position_, there, block, name, meaning});
    position_ += there;
  }
}

void byte_naming_t::name(byte_block_t block, std::span<const field_row_t> rows, std::size_t end) {
  const std::size_t base = position_;
  for (const field_row_t &row : rows) {
    if (position_ < end) {
      name(block, std::min(row.size, end - position_), row.name, row.meaning(place(base)));
    }
  }
}

std::string checksum_meaning(const field_place_t &place) {
  unsigned sum = 0;
  for (std::size_t offset = place.base; offset <= place.offset; ++offset) {
    sum += place.at(offset);
  }
  return sum % 256 == 0 ? "right: the block's bytes add up to 0" : "wrong: the block's bytes don't add up to 0";
}

std::string number_text(unsigned number, const char *unit) {
  return std::to_string(number) + " " + unit;
}

std::string field_text(const char *format, ...) {
  char text[256];
  va_list arguments;
  va_start(arguments, format);
  std::vsnprintf(text, sizeof text, format, arguments);
  va_end(arguments);
  return text;
}

std::string set_bit_names(unsigned value, std::span<const field_bit_t> bits, const char *none) {
  std::string text;
  for (const field_bit_t &bit : bits) {
    if ((value & bit.mask) != 0) {
      text += (text.empty() ? "" : ", ") + std::string(bit.name);
    }
  }
  return text.empty() ? none : text;
}

}  // namespace edid_cli
