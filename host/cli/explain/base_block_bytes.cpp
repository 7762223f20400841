#include "explain/base_block_bytes.h"

#include "edid_text/edid_value_texts.h"
#include "explain/descriptor_bytes.h"
#include "text/hexadecimal.h"

namespace edid_cli {
namespace {

constexpr field_bit_t feature_bits[] = {{0x80, "stand-by"},
                                        {0x40, "suspend"},
                                        {0x20, "active off"},
                                        {0x04, "sRGB"},
                                        {0x02, "the first detailed timing is preferred"},
                                        {0x01, "default GTF"}};

std::string manufacturer(const field_place_t &place) {
  const unsigned letters = place.here(0) << 8 | place.here(1);
  std::string name;
  for (const unsigned shift : {10U, 5U, 0U}) {
    name += static_cast<char>('@' + (letters >> shift & 0x1FU));
  }
  return name;
}

std::string serial_number(const field_place_t &place) {
  return std::to_string(place.here(0) | place.here(1) << 8 | place.here(2) << 16 | place.here(3) << 24);
}

std::string week(const field_place_t &place) {
  return place.here() == 0     ? "not given"
         : place.here() == 255 ? "the year is a model year"
                               : "week " + std::to_string(place.here());
}

/// A coordinate: its two low bits stand in one of two bytes before, its high bits in a byte of its own.
std::string chromaticity(const field_place_t &place) {
  constexpr std::size_t low_bits = 25;
  constexpr std::size_t high_bits = 27;
  const std::size_t number = place.offset - high_bits;
  const unsigned low = place.at(low_bits + number / 4) >> (6 - 2 * (number % 4)) & 3U;
  return field_text("%.4f", (place.here() * 4 + low) / 1024.0);
}

template <const char *(*name_of)(u32)>
std::string timing_names(const field_place_t &place) {
  std::string names;
  for (u32 bit = 0x80; bit != 0; bit >>= 1) {
    if ((place.here() & bit) != 0) {
      names += (names.empty() ? "" : ", ") + std::string(name_of(bit));
    }
  }
  return names.empty() ? "none" : names;
}

std::string standard_timing(const field_place_t &place) {
  if (place.here(0) == 1 && place.here(1) == 1) {
    return "unused";
  }
  const std_timing_t timing{(place.here(0) + 31) * 8, place.here(1) >> 6, (place.here(1) & 0x3FU) + 60};
  return field_text("%ux%u, %u Hz", timing.h_active, standard_timing_lines(timing), timing.refresh_rate);
}

constexpr field_row_t identity_rows[] = {
    {8, "Header", [](const field_place_t &) -> std::string { return "fixed: an EDID begins here"; }},
    {2, "Manufacturer", manufacturer},
    {2, "Product code", [](const field_place_t &place) { return hex_number(place.here() | place.here(1) << 8, 4); }},
    {4, "Serial number", serial_number},
    {1, "Week of manufacture", week},
    {1, "Year of manufacture", [](const field_place_t &place) { return std::to_string(1990 + place.here()); }},
    {1, "EDID version", [](const field_place_t &place) { return std::to_string(place.here()); }},
    {1, "EDID revision", [](const field_place_t &place) { return std::to_string(place.here()); }},
};

std::string low_bits(const field_place_t &) {
  return "two low bits of each coordinate, see the bytes after them";
}

constexpr field_row_t display_rows[] = {
    {1, "Video input",
     [](const field_place_t &place) -> std::string { return (place.here() & 0x80U) != 0 ? "digital" : "analogue"; }},
    {1, "Width", [](const field_place_t &place) { return number_text(place.here(), "cm"); }},
    {1, "Height", [](const field_place_t &place) { return number_text(place.here(), "cm"); }},
    {1, "Gamma", [](const field_place_t &place) { return field_text("%.2f", (place.here() + 100) / 100.0); }},
    {1, "Features", [](const field_place_t &place) { return set_bit_names(place.here(), feature_bits); }},
    {1, "Red and green, low bits", low_bits},
    {1, "Blue and white, low bits", low_bits},
    {1, "Red x", chromaticity},
    {1, "Red y", chromaticity},
    {1, "Green x", chromaticity},
    {1, "Green y", chromaticity},
    {1, "Blue x", chromaticity},
    {1, "Blue y", chromaticity},
    {1, "White x", chromaticity},
    {1, "White y", chromaticity},
};

constexpr field_row_t timing_rows[] = {
    {1, "Established timings I", timing_names<est_timing_1_string>},
    {1, "Established timings II", timing_names<est_timing_2_string>},
    {1, "Manufacturer's timings", timing_names<man_timing_string>},
    {2, "Standard timing 1", standard_timing},
    {2, "Standard timing 2", standard_timing},
    {2, "Standard timing 3", standard_timing},
    {2, "Standard timing 4", standard_timing},
    {2, "Standard timing 5", standard_timing},
    {2, "Standard timing 6", standard_timing},
    {2, "Standard timing 7", standard_timing},
    {2, "Standard timing 8", standard_timing},
};

}  // namespace

void name_base_block(byte_naming_t &naming) {
  constexpr std::size_t end = 128;
  constexpr int descriptors = 4;
  naming.name(byte_block_t::identity, identity_rows, end);
  naming.name(byte_block_t::display, display_rows, end);
  naming.name(byte_block_t::timings, timing_rows, end);
  for (int descriptor = 0; descriptor < descriptors; ++descriptor) {
    name_descriptor(naming);
  }
  naming.name(byte_block_t::extension, 1, "Extension blocks", std::to_string(naming.next()));
  naming.name(byte_block_t::extension, 1, "Checksum", checksum_meaning(naming.place(0)));
}

}  // namespace edid_cli
