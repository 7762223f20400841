#include "explain/descriptor_bytes.h"

#include "text/hexadecimal.h"

namespace edid_cli {
namespace {

/// A number whose high bits stand in another byte of the descriptor.
unsigned joined(const field_place_t &place, std::size_t low, std::size_t high, unsigned shift) {
  return place.of_base(low) | (place.of_base(high) >> shift & 15U) << 8;
}

bool is_interlaced(const field_place_t &place) {
  return (place.of_base(17) & 0x80U) != 0;
}

std::string horizontal_active(const field_place_t &place) {
  return number_text(joined(place, 2, 4, 4), "pixels");
}

std::string horizontal_blanking(const field_place_t &place) {
  return number_text(joined(place, 3, 4, 0), "pixels");
}

std::string vertical_active(const field_place_t &place) {
  return number_text(joined(place, 5, 7, 4), is_interlaced(place) ? "lines in a field" : "lines");
}

std::string vertical_blanking(const field_place_t &place) {
  return number_text(joined(place, 6, 7, 0), is_interlaced(place) ? "lines in a field" : "lines");
}

std::string horizontal_porch(const field_place_t &place) {
  return number_text(place.of_base(8) | (place.of_base(11) >> 6 & 3U) << 8, "pixels");
}

std::string horizontal_sync(const field_place_t &place) {
  return number_text(place.of_base(9) | (place.of_base(11) >> 4 & 3U) << 8, "pixels");
}

std::string vertical_porch_and_sync(const field_place_t &place) {
  const unsigned high = place.of_base(11);
  return field_text("%u and %u lines", place.of_base(10) >> 4 | (high >> 2 & 3U) << 4,
                    (place.of_base(10) & 15U) | (high & 3U) << 4);
}

std::string flags(const field_place_t &place) {
  const unsigned value = place.here();
  return field_text("%s, horizontal sync %c, vertical sync %c", is_interlaced(place) ? "interlaced" : "progressive",
                    (value & 2U) != 0 ? '+' : '-', (value & 4U) != 0 ? '+' : '-');
}

std::string pixel_clock(const field_place_t &place) {
  const unsigned clock = place.here() | place.here(1) << 8;
  return field_text("%u.%02u MHz", clock / 100, clock % 100);
}

constexpr field_row_t timing_rows[] = {
    {2, "Pixel clock", pixel_clock},
    {1, "Horizontal active", horizontal_active},
    {1, "Horizontal blanking", horizontal_blanking},
    {1, "Horizontal, high bits",
     [](const field_place_t &place) {
       return horizontal_active(place) + " active, " + horizontal_blanking(place) + " blanking";
     }},
    {1, "Vertical active", vertical_active},
    {1, "Vertical blanking", vertical_blanking},
    {1, "Vertical, high bits",
     [](const field_place_t &place) {
       return vertical_active(place) + " active, " + vertical_blanking(place) + " blanking";
     }},
    {1, "Horizontal front porch", horizontal_porch},
    {1, "Horizontal sync width", horizontal_sync},
    {1, "Vertical front porch and sync width", vertical_porch_and_sync},
    {1, "Porches and syncs, high bits",
     [](const field_place_t &place) {
       return "porch " + horizontal_porch(place) + ", sync " + horizontal_sync(place) + "; " +
              vertical_porch_and_sync(place);
     }},
    {1, "Image width", [](const field_place_t &place) { return number_text(joined(place, 12, 14, 4), "mm"); }},
    {1, "Image height", [](const field_place_t &place) { return number_text(joined(place, 13, 14, 0), "mm"); }},
    {1, "Image size, high bits",
     [](const field_place_t &place) {
       return field_text("%u x %u mm", joined(place, 12, 14, 4), joined(place, 13, 14, 0));
     }},
    {1, "Horizontal border", [](const field_place_t &place) { return number_text(place.here(), "pixels"); }},
    {1, "Vertical border", [](const field_place_t &place) { return number_text(place.here(), "lines"); }},
    {1, "Flags", flags},
};

struct display_descriptor_t {
  unsigned tag;
  bool is_text;
  const char *name;
};

constexpr unsigned range_limits_tag = 0xFD;
constexpr display_descriptor_t display_descriptors[] = {
    {0xFF, true, "Serial number text"}, {0xFE, true, "Text"},           {range_limits_tag, false, "Range limits"},
    {0xFC, true, "Monitor name"},       {0xFB, false, "Colour points"}, {0xFA, false, "Standard timings"},
    {0x10, false, "Dummy descriptor"},
};

constexpr field_row_t range_rows[] = {
    {1, "Lowest vertical rate", [](const field_place_t &place) { return number_text(place.here(), "Hz"); }},
    {1, "Highest vertical rate", [](const field_place_t &place) { return number_text(place.here(), "Hz"); }},
    {1, "Lowest horizontal rate", [](const field_place_t &place) { return number_text(place.here(), "kHz"); }},
    {1, "Highest horizontal rate", [](const field_place_t &place) { return number_text(place.here(), "kHz"); }},
    {1, "Highest pixel clock", [](const field_place_t &place) { return number_text(place.here() * 10, "MHz"); }},
    {8, "Secondary timing formula",
     [](const field_place_t &place) -> std::string {
       return place.here() == 0 ? "none" : field_text("code %u", place.here());
     }},
};

std::string text_of(const byte_naming_t &naming) {
  std::string text;
  for (std::size_t index = 0; index < 13 && naming.next(index) != '\n'; ++index) {
    const unsigned character = naming.next(index);
    text += character >= 0x20 && character < 0x7F ? static_cast<char>(character) : '?';
  }
  return "\"" + text + "\"";
}

void name_display_descriptor(byte_naming_t &naming, std::size_t end) {
  const unsigned tag = naming.next(3);
  display_descriptor_t kind{tag, false, "Descriptor"};
  for (const display_descriptor_t &row : display_descriptors) {
    kind = row.tag == tag ? row : kind;
  }
  naming.name(byte_block_t::descriptor, 3, "No pixel clock", "not a timing");
  naming.name(byte_block_t::descriptor, 1, "Descriptor tag", hex_number(tag, 2) + ": " + kind.name);
  naming.name(byte_block_t::descriptor, 1, "Reserved", "0");
  if (tag == range_limits_tag) {
    naming.name(byte_block_t::descriptor, range_rows, end);
  } else {
    naming.name(byte_block_t::descriptor, 13, kind.name, kind.is_text ? text_of(naming) : "not looked at");
  }
}

}  // namespace

void name_descriptor(byte_naming_t &naming) {
  const std::size_t end = naming.position() + descriptor_size;
  if (naming.next(0) != 0 || naming.next(1) != 0) {
    naming.name(byte_block_t::descriptor, timing_rows, end);
  } else {
    name_display_descriptor(naming, end);
  }
}

}  // namespace edid_cli
