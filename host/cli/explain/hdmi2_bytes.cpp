#include "explain/hdmi2_bytes.h"

#include <algorithm>
#include <iterator>

#include "edid_text/hdmi2_texts.h"
#include "edid_text/mode_names.h"

namespace edid_cli {
namespace {

constexpr unsigned vendor_specific = 3;
constexpr unsigned extended = 7;
constexpr unsigned vendor_video = 0x01;

// --- HDMI Forum (HDMI 2.1, section 10.3.2): bytes 4 to 10 of the data block.

constexpr field_bit_t link_bits[] = {{0x80, "SCDC"},
                                     {0x40, "read request"},
                                     {0x20, "cable status"},
                                     {0x10, "colour content bits"},
                                     {0x08, "scrambling at or below 340 MHz"},
                                     {0x04, "3D independent view"},
                                     {0x02, "3D dual view"},
                                     {0x01, "3D OSD disparity"}};
constexpr field_bit_t mode_bits[] = {{0x08, "VICs of the modes that have an HDMI_VIC"},
                                     {0x04, "48 bits in 4:2:0"},
                                     {0x02, "36 bits in 4:2:0"},
                                     {0x01, "30 bits in 4:2:0"}};
constexpr field_bit_t game_bits[] = {{0x80, "FAPA end extended"},
                                     {0x40, "quick media switching"},
                                     {0x20, "negative MVRR"},
                                     {0x10, "cinema VRR"},
                                     {0x08, "MDelta"},
                                     {0x04, "quick frame transport"},
                                     {0x02, "auto low-latency mode"},
                                     {0x01, "FAPA start location"}};

unsigned highest_variable_rate(const field_place_t &place) {
  return (place.here() & 0xC0U) << 2 | place.here(1);
}

constexpr field_row_t forum_rows[] = {
    {1, "Version", [](const field_place_t &place) { return std::to_string(place.here()); }},
    {1, "Highest TMDS rate", [](const field_place_t &place) { return tmds_rate_text(place.here() * 5); }},
    {1, "Link", [](const field_place_t &place) { return set_bit_names(place.here(), link_bits); }},
    {1, "Fixed rate link, UHD and deep colour in 4:2:0",
     [](const field_place_t &place) {
       return "fixed rate link: " + fixed_rate_link_text(place.here() >> 4) + "; " +
              set_bit_names(place.here() & 0x0FU, mode_bits, "no other");
     }},
    {1, "Low latency and gaming", [](const field_place_t &place) { return set_bit_names(place.here(), game_bits); }},
    {2, "Variable refresh rate",
     [](const field_place_t &place) {
       return "lowest " + lowest_variable_rate_text(place.here() & 0x3FU) + "; highest " +
              highest_variable_rate_text(highest_variable_rate(place));
     }},
};

void name_forum(byte_naming_t &naming, std::size_t end) {
  naming.name(byte_block_t::forum, 3, "IEEE identifier", "C4-5D-D8: HDMI Forum");
  naming.name(byte_block_t::forum, forum_rows, end);
}

void name_sink_capability(byte_naming_t &naming, std::size_t end) {
  naming.name(byte_block_t::forum, 1, "Extended tag", "0x79: HDMI Forum sink capability");
  naming.name(byte_block_t::forum, 2, "Reserved", "two bytes in the place of an identifier");
  naming.name(byte_block_t::forum, forum_rows, end);
}

// --- What the picture may be.

void name_video_capability(byte_naming_t &naming, std::size_t) {
  constexpr byte_block_t block = byte_block_t::capability;
  naming.name(block, 1, "Extended tag", "0: video capability");
  const unsigned byte = naming.next();
  const auto range = [byte](unsigned mask) {
    return (byte & mask) != 0 ? std::string("selectable") : std::string("not selectable");
  };
  naming.name(block, 1, "Quantization and scan",
              "RGB quantization range " + range(0x40) + ", YCC quantization range " + range(0x80) +
                  "; preferred timing " + scan_text(byte >> 4 & 3U, scan_as_other_timings) + ", IT timings " +
                  scan_text(byte >> 2 & 3U, scan_unsupported) + ", CE timings " +
                  scan_text(byte & 3U, scan_unsupported));
}

constexpr field_row_t colorimetry_rows[] = {
    {1, "Extended tag", [](const field_place_t &) -> std::string { return "5: colorimetry"; }},
    {1, "Colorimetry", [](const field_place_t &place) { return joined(color_space_texts(place.here())); }},
    {1, "Gamut metadata", [](const field_place_t &place) { return joined(gamut_texts(place.here())); }},
};

void name_colorimetry(byte_naming_t &naming, std::size_t end) {
  naming.name(byte_block_t::colorimetry, colorimetry_rows, end);
}

constexpr field_row_t hdr_static_rows[] = {
    {1, "Extended tag", [](const field_place_t &) -> std::string { return "6: HDR static metadata"; }},
    {1, "Transfer functions", [](const field_place_t &place) { return joined(eotf_texts(place.here())); }},
    {1, "Static metadata", [](const field_place_t &place) { return joined(metadata_type_texts(place.here())); }},
    {1, "Highest luminance", [](const field_place_t &place) { return luminance_text(place.here()); }},
    {1, "Highest average luminance", [](const field_place_t &place) { return luminance_text(place.here()); }},
    {1, "Lowest luminance",
     [](const field_place_t &place) { return minimum_luminance_text(place.of_base(3), place.here()); }},
};

void name_hdr_static(byte_naming_t &naming, std::size_t end) {
  naming.name(byte_block_t::hdr, hdr_static_rows, end);
}

// --- YCbCr 4:2:0.

void name_modes_420(byte_naming_t &naming, std::size_t end) {
  naming.name(byte_block_t::y420, 1, "Extended tag", "14: modes in YCbCr 4:2:0 only");
  for (int number = 1; naming.position() < end; ++number) {
    naming.name(byte_block_t::y420, 1, "Mode in 4:2:0 only " + std::to_string(number),
                video_mode_name(decoded_svd(naming.next()).vic));
  }
}

/// Descriptors count through all video data blocks, so that a mark is of a place.
std::string marked_places(unsigned byte, std::size_t first) {
  texts_t places;
  for (std::size_t bit = 0; bit < 8; ++bit) {
    if ((byte >> bit & 1U) != 0) {
      places.push_back(std::to_string(first + bit));
    }
  }
  return places.empty() ? "none of these" : "video descriptor " + joined(places);
}

void name_map_420(byte_naming_t &naming, std::size_t end) {
  naming.name(byte_block_t::y420, 1, "Extended tag",
              naming.position() + 1 < end ? "15: YCbCr 4:2:0 capability map"
                                          : "15: YCbCr 4:2:0 capability map; without bytes it marks all descriptors");
  for (std::size_t first = 1; naming.position() < end; first += 8) {
    naming.name(byte_block_t::y420, 1,
                "Video descriptors " + std::to_string(first) + " to " + std::to_string(first + 7),
                "in 4:2:0 too: " + marked_places(naming.next(), first));
  }
}

// --- Blocks that are passed on: who they are of, and what is read of them.

void name_hdr_dynamic(byte_naming_t &naming, std::size_t end) {
  constexpr byte_block_t block = byte_block_t::hdr;
  naming.name(block, 1, "Extended tag", "7: HDR dynamic metadata");
  for (int number = 1; naming.position() < end; ++number) {
    const std::string name = "Dynamic metadata " + std::to_string(number);
    const std::size_t length = std::min<std::size_t>(naming.next(), end - naming.position() - 1);
    naming.name(block, 1, name + ": length", number_text(naming.next(), "bytes follow"));
    const std::size_t rest = naming.position() + length;
    if (length >= 2) {
      naming.name(block, 2, name + ": type", std::to_string(naming.next() | naming.next(1) << 8));
    }
    if (naming.position() < rest) {
      naming.name(block, rest - naming.position(), name + ": details", "not looked at");
    }
  }
}

void name_hdr10plus(byte_naming_t &naming, std::size_t) {
  naming.name(byte_block_t::hdr, 1, "Extended tag", "1: vendor-specific video");
  naming.name(byte_block_t::hdr, 3, "IEEE identifier", "90-84-8B: HDR10+");
  naming.name(byte_block_t::hdr, 1, "Application version", std::to_string(naming.next() & 3U));
}

void name_dolby_vision(byte_naming_t &naming, std::size_t end) {
  constexpr unsigned last_with_2160p60 = 1;
  naming.name(byte_block_t::hdr, 1, "Extended tag", "1: vendor-specific video");
  naming.name(byte_block_t::hdr, 3, "IEEE identifier", "00-D0-46: Dolby Vision");
  const unsigned version = naming.next() >> 5;
  const bool tells_2160p60 = version <= last_with_2160p60;
  naming.name(byte_block_t::hdr, 1, "Version",
              std::to_string(version) + (!tells_2160p60              ? ""
                                         : (naming.next() & 2U) != 0 ? ", with 2160p60"
                                                                     : ", without 2160p60"));
  if (naming.position() < end) {
    naming.name(byte_block_t::hdr, end - naming.position(), "Details", "of the display: not looked at");
  }
}

void name_freesync(byte_naming_t &naming, std::size_t) {
  constexpr byte_block_t block = byte_block_t::freesync;
  naming.name(block, 3, "IEEE identifier", "00-00-1A: FreeSync");
  naming.name(block, 2, "Version", std::to_string(naming.next()));
  naming.name(block, 1, "Lowest refresh rate", number_text(naming.next(), "Hz"));
  naming.name(block, 1, "Highest refresh rate", number_text(naming.next(), "Hz"));
}

constexpr known_block_t known_blocks[] = {
    {byte_block_t::forum, "HDMI Forum", vendor_specific, 3, {0xD8, 0x5D, 0xC4}, name_forum},
    {byte_block_t::forum, "HDMI Forum sink capability", extended, 1, {0x79}, name_sink_capability},
    {byte_block_t::capability, "Video capability", extended, 1, {0x00}, name_video_capability},
    {byte_block_t::colorimetry, "Colorimetry", extended, 1, {0x05}, name_colorimetry},
    {byte_block_t::hdr, "HDR static metadata", extended, 1, {0x06}, name_hdr_static},
    {byte_block_t::y420, "YCbCr 4:2:0 video", extended, 1, {0x0E}, name_modes_420},
    {byte_block_t::y420, "YCbCr 4:2:0 capability map", extended, 1, {0x0F}, name_map_420},
    {byte_block_t::hdr, "HDR dynamic metadata", extended, 1, {0x07}, name_hdr_dynamic},
    {byte_block_t::hdr, "HDR10+", extended, 4, {vendor_video, 0x8B, 0x84, 0x90}, name_hdr10plus},
    {byte_block_t::hdr, "Dolby Vision", extended, 4, {vendor_video, 0x46, 0xD0, 0x00}, name_dolby_vision},
    {byte_block_t::freesync, "FreeSync", vendor_specific, 3, {0x1A, 0x00, 0x00}, name_freesync},
};

}  // namespace

const known_block_t *find_hdmi2_block(std::span<const u8> payload, unsigned tag) {
  const auto *const found = std::find_if(std::begin(known_blocks), std::end(known_blocks), [=](const auto &known) {
    return known.tag == tag && known.identifier_size <= payload.size() &&
           std::equal(known.identifier, known.identifier + known.identifier_size, payload.begin());
  });
  return found != std::end(known_blocks) ? found : nullptr;
}

}  // namespace edid_cli
