// Values of HDMI 2 in words: CTA-861, and the HDMI Forum's data block.
#pragma once

#include <string>
#include <vector>

#include "edid_composer.h"

namespace edid_cli {

using texts_t = std::vector<std::string>;

/// "BT2020RGB": CTA-861, colorimetry data block, byte 2.
texts_t color_space_texts(u32 bits);
/// "metadata profile 0": the same, byte 3.
texts_t gamut_texts(u32 bits);
/// "PQ (SMPTE ST 2084)": CTA-861, HDR static metadata data block, byte 2.
texts_t eotf_texts(u32 bits);
/// "type 1": the same, byte 3.
texts_t metadata_type_texts(u32 bits);
/// "1015.27 cd/m2", of a maximum or an average.
std::string luminance_text(u32 code);
/// "0.0500 cd/m2"; it depends on the maximum.
std::string minimum_luminance_text(u32 maximum_code, u32 code);

/// "600 MHz", or "340 MHz or less".
std::string tmds_rate_text(u32 megahertz);
/// "6 Gbit/s on 4 lanes", or "none".
std::string fixed_rate_link_text(u32 code);
std::string lowest_variable_rate_text(u32 hertz);
std::string highest_variable_rate_text(u32 hertz);

/// "always underscanned": CTA-861, video capability data block, two bits. @p first is what 0 means.
std::string scan_text(u32 code, const char *first);
inline constexpr const char *scan_as_other_timings = "as the other timings";
inline constexpr const char *scan_unsupported = "unsupported";

/// "a", "a, b"; @p none without any.
std::string joined(const texts_t &texts, const char *none = "none");

}  // namespace edid_cli
