#include "explain/byte_names.h"

#include <algorithm>

#include "explain/base_block_bytes.h"
#include "explain/byte_fields.h"
#include "explain/data_block_bytes.h"
#include "explain/descriptor_bytes.h"
#include "text/hexadecimal.h"

namespace edid_cli {
namespace {

constexpr std::size_t block_size = 128;
constexpr unsigned cta_tag = 2;

constexpr field_bit_t flag_bits[] = {
    {0x80, "underscan"}, {0x40, "basic audio"}, {0x20, "YCbCr 4:4:4"}, {0x10, "YCbCr 4:2:2"}};

constexpr field_row_t header_rows[] = {
    {1, "Extension tag",
     [](const field_place_t &place) -> std::string {
       return place.here() == cta_tag ? "2: CEA-861" : std::to_string(place.here());
     }},
    {1, "Revision", [](const field_place_t &place) { return std::to_string(place.here()); }},
    {1, "Detailed timings begin",
     [](const field_place_t &place) {
       return "at byte " + std::to_string(place.here()) + " of this block, " + hex_number(place.base + place.here(), 2);
     }},
    {1, "Flags",
     [](const field_place_t &place) {
       return set_bit_names(place.here(), flag_bits) + ", " + number_text(place.here() & 15U, "native timings");
     }},
};

/// A descriptor begins with its clock, or with two zeros and a tag after them.
bool is_descriptor_next(const byte_naming_t &naming) {
  return naming.position() + descriptor_size <= naming.end() &&
         (naming.next(0) != 0 || naming.next(1) != 0 || naming.next(3) != 0);
}

void name_cta_extension(byte_naming_t &naming) {
  const std::size_t timings = naming.position() + naming.next(2);
  naming.name(byte_block_t::extension, header_rows, naming.end());
  while (naming.position() < std::min(timings, naming.end())) {
    name_data_block(naming);
  }
  while (is_descriptor_next(naming)) {
    name_descriptor(naming);
  }
  if (naming.position() < naming.end()) {
    naming.name(byte_block_t::unused, naming.end() - naming.position(), "Unused", "nothing is written here");
  }
}

void name_other_extension(byte_naming_t &naming) {
  naming.name(byte_block_t::extension, 1, "Extension tag", hex_number(naming.next(), 2) + ": not CTA-861");
  naming.name(byte_block_t::other, naming.end() - naming.position(), "Extension", "not looked at");
}

void name_extension(byte_naming_t &naming) {
  const std::size_t begin = naming.position();
  naming.set_end(begin + block_size - 1);
  if (naming.next() == cta_tag) {
    name_cta_extension(naming);
  } else {
    name_other_extension(naming);
  }
  naming.set_end(begin + block_size);
  naming.name(byte_block_t::extension, 1, "Checksum", checksum_meaning(naming.place(begin)));
}

}  // namespace

std::vector<byte_field_t> name_bytes(std::span<const u8> edid) {
  byte_naming_t naming(edid);
  name_base_block(naming);
  while (naming.position() < edid.size()) {
    name_extension(naming);
  }
  return std::move(naming).take();
}

}  // namespace edid_cli
