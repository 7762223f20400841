#include "explain/hdmi_bytes.h"

#include <algorithm>

#include "edid_text/mode_names.h"
#include "edid_text/physical_address_text.h"

namespace edid_cli {
namespace {

constexpr byte_block_t block = byte_block_t::hdmi;
constexpr unsigned latencies_present = 0x80;
constexpr unsigned interlaced_latencies_present = 0x40;
constexpr unsigned video_present = 0x20;

constexpr field_bit_t support_bits[] = {{0x80, "Supports_AI"},
                                        {0x40, "48 bits"},
                                        {0x20, "36 bits"},
                                        {0x10, "30 bits"},
                                        {0x08, "deep colour in YCbCr 4:4:4"},
                                        {0x01, "DVI dual link"}};
constexpr field_bit_t presence_bits[] = {{latencies_present, "latencies follow"},
                                         {interlaced_latencies_present, "interlaced latencies follow"},
                                         {video_present, "HDMI video follows"},
                                         {0x08, "game"},
                                         {0x04, "cinema"},
                                         {0x02, "photo"},
                                         {0x01, "graphics"}};

std::string address(const field_place_t &place) {
  return physical_address_text(place.here() << 8 | place.here(1));
}

std::string tmds_clock(const field_place_t &place) {
  return place.here() == 0 ? "not declared" : number_text(place.here() * 5, "MHz");
}

std::string latency(const field_place_t &place) {
  return place.here() == 0     ? "not known"
         : place.here() == 255 ? "no valid latency"
                               : number_text((place.here() - 1) * 2, "ms");
}

constexpr field_row_t fixed_rows[] = {
    {3, "IEEE identifier", [](const field_place_t &) -> std::string { return "00-0C-03: HDMI"; }},
    {2, "Physical address", address},
    {1, "Support", [](const field_place_t &place) { return set_bit_names(place.here(), support_bits); }},
    {1, "Highest TMDS clock", tmds_clock},
};
constexpr field_row_t latency_rows[] = {{1, "Video latency", latency}, {1, "Audio latency", latency}};
constexpr field_row_t interlaced_latency_rows[] = {{1, "Interlaced video latency", latency},
                                                   {1, "Interlaced audio latency", latency}};

constexpr const char *structures[] = {"frame packing",       "field alternative", "line alternative",
                                      "side-by-side (full)", "L + depth",         "L + depth + graphics",
                                      "top-and-bottom",      "reserved",          "side-by-side (half)"};
constexpr unsigned side_by_side_half = 8;

/// One mode's 3D structure; from side-by-side (half) on with a byte of detail after it.
void name_3d_entry(byte_naming_t &naming) {
  const unsigned byte = naming.next();
  const unsigned structure = byte & 15U;
  const char *const name = structure <= side_by_side_half ? structures[structure] : "reserved";
  naming.name(block, structure >= side_by_side_half ? 2 : 1,
              "3D of video descriptor " + std::to_string((byte >> 4) + 1), name);
}

void name_video(byte_naming_t &naming, std::size_t end) {
  const unsigned flags = naming.next();
  naming.name(block, 1, "3D and image size",
              field_text("%s, 3D_Multi_present %u, Image_Size %u",
                         (flags & 0x80U) != 0 ? "mandatory 3D formats" : "no 3D", flags >> 5 & 3U, flags >> 3 & 3U));
  const unsigned lengths = naming.next();
  naming.name(block, 1, "Lengths", field_text("%u 4Kx2K modes, %u bytes of 3D", lengths >> 5, lengths & 0x1FU));
  for (unsigned number = 1; number <= lengths >> 5 && naming.position() < end; ++number) {
    naming.name(block, 1, "4Kx2K mode " + std::to_string(number), mode_4k_name(naming.next()));
  }
  const bool is_by_mode = (flags >> 5 & 3U) == 0;
  const std::size_t end_3d = std::min<std::size_t>(end, naming.position() + (lengths & 0x1FU));
  while (is_by_mode && naming.position() < end_3d) {
    name_3d_entry(naming);
  }
}

}  // namespace

void name_hdmi_block(byte_naming_t &naming, std::size_t end) {
  naming.name(block, fixed_rows, end);
  if (naming.position() >= end) {
    return;
  }
  const unsigned presence = naming.next();
  naming.name(block, 1, "Content types and what follows", set_bit_names(presence, presence_bits));
  if ((presence & latencies_present) != 0) {
    naming.name(block, latency_rows, end);
  }
  if ((presence & latencies_present) != 0 && (presence & interlaced_latencies_present) != 0) {
    naming.name(block, interlaced_latency_rows, end);
  }
  if ((presence & video_present) != 0 && naming.position() < end) {
    name_video(naming, end);
  }
}

}  // namespace edid_cli
