#include "cli/composed_edid.h"

namespace host_test {
namespace {

constexpr std::size_t extension = 128;
constexpr std::size_t first_descriptor = 54;
constexpr std::size_t descriptor_size = 18;

u8 sum_of(const std::string &bytes) {
  u8 sum = 0;
  for (const char byte : bytes) {
    sum = static_cast<u8>(sum + static_cast<u8>(byte));
  }
  return sum;
}

}  // namespace

bool composed_edid_t::is_well_formed() const {
  return bytes_.size() == 256 && bytes_.starts_with(std::string("\0\xFF\xFF\xFF\xFF\xFF\xFF\0", 8)) && at(126) == 1 &&
         at(extension) == 2 && at(extension + 1) == 3 && sum_of(bytes_.substr(0, extension)) == 0 &&
         sum_of(bytes_.substr(extension)) == 0;
}

std::string composed_edid_t::monitor_name() const {
  for (std::size_t offset = first_descriptor; offset < 126; offset += descriptor_size) {
    if (bytes_.substr(offset, 4) == std::string("\0\0\0\xFC", 4)) {
      const std::string text = bytes_.substr(offset + 5, 13);
      return text.substr(0, text.find('\n'));
    }
  }
  return "";
}

std::vector<u8> composed_edid_t::vics() const {
  std::vector<u8> vics;
  for (const char descriptor : data_block(2)) {
    vics.push_back(static_cast<u8>(descriptor) & 0x7F);
  }
  return vics;
}

std::vector<u8> composed_edid_t::audio_formats() const {
  std::vector<u8> formats;
  const std::string descriptors = data_block(1);
  for (std::size_t offset = 0; offset < descriptors.size(); offset += 3) {
    formats.push_back(static_cast<u8>((static_cast<u8>(descriptors[offset]) >> 3) & 0x0F));
  }
  return formats;
}

std::string composed_edid_t::hdmi() const {
  return data_block(3).substr(3);
}

std::string composed_edid_t::physical_address() const {
  const std::string block = hdmi();
  std::string address;
  for (const char byte : block.substr(0, 2)) {
    const auto value = static_cast<u8>(byte);
    address += (address.empty() ? "" : ".") + std::to_string(value >> 4) + "." + std::to_string(value & 0x0F);
  }
  return address;
}

std::string composed_edid_t::data_block(u8 tag) const {
  const std::size_t end = extension + at(extension + 2);
  std::size_t offset = extension + 4;
  while (offset < end) {
    const std::size_t length = at(offset) & 0x1F;
    if (at(offset) >> 5 == tag) {
      return bytes_.substr(offset + 1, length);
    }
    offset += length + 1;
  }
  return "";
}

}  // namespace host_test
