// The report of what an EDID says of HDMI 2.
#include <algorithm>
#include <iterator>

#include "edid_composer/hdmi2/codec/extended_vics.h"
#include "edid_composer/hdmi2/codec/hdmi2_record.h"
#include "edid_composer/hdmi2/codec/luminance.h"
#include "edid_composer/hdmi2/codec/passed_on_report.h"
#include "edid_composer/hdmi2/codec/report_lines.h"
#include "edid_composer/hdmi2/codec/short_video_descriptors.h"
#include "output.h"

namespace edid_composer {
namespace {

REPORTS_AS(print_hdmi2);

constexpr const char *not_declared = "not declared";

const char *vic_name(u32 vic) {
  return timing_of_extended_vic(vic) != nullptr ? extended_vic_string(vic) : short_video_timing_string(vic);
}

void print_mode(u8 code, bool marked_420) {
  const svd_t svd = decode_svd(code);
  print("\t%u\t%s%s%s\n", svd.vic, vic_name(svd.vic), svd.native ? " Native" : "", marked_420 ? " YCbCr 4:2:0" : "");
}

void print_modes(const hdmi2_t &hdmi2) {
  const u32 count = std::min<u32>(hdmi2.svd_count, HDMI2_MOST_SVDS);
  print("\nShort Video Codes, with YCbCr 4:2:0: Num:%u\n", count);
  for (u32 i = 0; i < count; ++i)
    print_mode(hdmi2.svds[i], is_marked_420(hdmi2, i));
}

void print_modes_420(const hdmi2_t &hdmi2) {
  const u32 count = std::min<u32>(hdmi2.y420_count, HDMI2_MOST_BLOCK_BYTES - 1);
  print("\nModes in YCbCr 4:2:0 only: Num:%u\n", count);
  for (u32 i = 0; i < count; ++i)
    print_mode(hdmi2.y420_vics[i], false);
  if (!print_heading("YCbCr 4:2:0 capability map", hdmi2.y420_map_present != 0)) return;
  if (hdmi2.y420_map_bytes == 0) {
    print_word("Short Video Codes", "all");
  } else {
    print_number("Bytes", hdmi2.y420_map_bytes, "");
  }
}

constexpr const char *fixed_rate_links[] = {
    "none",
    "3 Gbit/s on 3 lanes",
    "6 Gbit/s on 3 lanes",
    "6 Gbit/s on 4 lanes",
    "8 Gbit/s on 4 lanes",
    "10 Gbit/s on 4 lanes",
    "12 Gbit/s on 4 lanes",
};

void print_link(const hdmi2_t &hdmi2) {
  if (hdmi2.max_tmds_rate == 0) {
    print_word("Max TMDS rate", "340 MHz or less");
  } else {
    print_number("Max TMDS rate", hdmi2.max_tmds_rate, " MHz");
  }
  print_support("SCDC", hdmi2.scdc != 0);
  print_support("SCDC read request", hdmi2.read_request != 0);
  print_support("Scrambling to 340 MHz", hdmi2.scramble_low != 0);
  if (hdmi2.frl_rate < std::size(fixed_rate_links)) {
    print_word("Fixed rate link", fixed_rate_links[hdmi2.frl_rate]);
  } else {
    print_number("Fixed rate link", hdmi2.frl_rate, " (unknown)");
  }
}

void print_variable_refresh_rate(const hdmi2_t &hdmi2) {
  if (hdmi2.vrr_present == 0) {
    print_word("Variable refresh rate", not_declared);
    return;
  }
  print_number("Min variable rate", hdmi2.vrr_min, hdmi2.vrr_min != 0 ? " Hz" : " Hz (unsupported)");
  print_number("Max variable rate", hdmi2.vrr_max, hdmi2.vrr_max != 0 ? " Hz" : " Hz (no limit declared)");
}

void print_forum(const hdmi2_t &hdmi2) {
  if (!print_heading("HDMI Forum", hdmi2.forum_present != 0)) return;
  print_number("Version", hdmi2.forum_version, "");
  print_link(hdmi2);
  print_support("VICs of HDMI_VIC modes", hdmi2.uhd_vic != 0);
  print_support("30 bits in 4:2:0", hdmi2.dc_30bit_420 != 0);
  print_support("36 bits in 4:2:0", hdmi2.dc_36bit_420 != 0);
  print_support("48 bits in 4:2:0", hdmi2.dc_48bit_420 != 0);
  if (hdmi2.allm_present != 0) {
    print_support("Auto low-latency mode", hdmi2.allm != 0);
  } else {
    print_word("Auto low-latency mode", not_declared);
  }
  print_variable_refresh_rate(hdmi2);
}

/// Two bits each; the first word depends on the timings that they are for.
const char *scan_behavior(u32 code, const char *first) {
  const char *const words[] = {first, "always overscanned", "always underscanned", "overscanned or underscanned"};
  return words[code % std::size(words)];
}

void print_video_capability(const hdmi2_t &hdmi2) {
  if (!print_heading("Video capability", hdmi2.video_capability_present != 0)) return;
  const auto range = [](u8 selectable) { return selectable != 0 ? "selectable" : "not selectable"; };
  print_word("RGB quantization range", range(hdmi2.rgb_quantization));
  print_word("YCC quantization range", range(hdmi2.ycc_quantization));
  print_word("Preferred timing", scan_behavior(hdmi2.preferred_scan, "as the other timings"));
  print_word("IT timings", scan_behavior(hdmi2.it_scan, "unsupported"));
  print_word("CE timings", scan_behavior(hdmi2.ce_scan, "unsupported"));
}

constexpr const char *color_spaces[bits_of_a_byte] = {
    "xvYCC601", "xvYCC709", "sYCC601", "opYCC601", "opRGB", "BT2020cYCC", "BT2020YCC", "BT2020RGB",
};
constexpr const char *gamut_metadata[bits_of_a_byte] = {
    "metadata profile 0",
    "metadata profile 1",
    "metadata profile 2",
    "metadata profile 3",
    "default RGB",
    "sRGB",
    "ICtCp",
    "ST2113RGB",
};

void print_colorimetry(const hdmi2_t &hdmi2) {
  if (!print_heading("Colorimetry", hdmi2.colorimetry_present != 0)) return;
  print_bits("Color spaces", hdmi2.colorimetry, color_spaces);
  print_bits("Gamut", hdmi2.gamut_metadata, gamut_metadata);
}

constexpr const char *eotfs[bits_of_a_byte] = {"SDR gamma", "HDR gamma", "PQ (SMPTE ST 2084)", "HLG"};
constexpr const char *metadata_types[bits_of_a_byte] = {"type 1"};

void print_luminance(const hdmi2_t &hdmi2) {
  constexpr const char *labels[] = {"Max luminance", "Max average luminance", "Min luminance"};
  constexpr u32 minimum = 2;
  for (u32 i = 0; i < std::size(labels); ++i) {
    const u8 code = hdmi2.luminance[i];
    if (i >= hdmi2.luminance_count) {
      print_word(labels[i], not_declared);
      continue;
    }
    print_label(labels[i]);
    if (i == minimum) {
      const u32 value = minimum_luminance(hdmi2.luminance[0], code);
      print("%u.%04u cd/m2 (code %u)\n", value / minimum_luminance_units, value % minimum_luminance_units, code);
    } else {
      const u32 value = maximum_luminance(code);
      print("%u.%02u cd/m2 (code %u)\n", value / maximum_luminance_units, value % maximum_luminance_units, code);
    }
  }
}

void print_hdr_static(const hdmi2_t &hdmi2) {
  if (!print_heading("HDR static metadata", hdmi2.hdr_static_present != 0)) return;
  print_bits("Transfer functions", hdmi2.eotfs, eotfs);
  print_bits("Static metadata", hdmi2.metadata_types, metadata_types);
  print_luminance(hdmi2);
}

}  // namespace
}  // namespace edid_composer

using namespace edid_composer;  // NOLINT(google-build-using-namespace): the operation below is the namespace's API

bool print_hdmi2(const hdmi2_t *hdmi2, const char *title) {
  if (!is_record(site, hdmi2)) return false;
  print("%s\n", title == nullptr ? "" : title);
  print_modes(*hdmi2);
  print_modes_420(*hdmi2);
  print_forum(*hdmi2);
  print_video_capability(*hdmi2);
  print_colorimetry(*hdmi2);
  print_hdr_static(*hdmi2);
  print_passed_on_blocks(*hdmi2);
  return true;
}
