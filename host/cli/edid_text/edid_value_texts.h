// Values of a decoded EDID that are more than a number, as texts. Of a list: one text for each entry.
#pragma once

#include <string>
#include <vector>

#include "edid_composer.h"

namespace edid_cli {

/// A standard timing holds its width and an aspect ratio (EDID 1.3, section 3.9), whose code 0 is 16:10. (In EDIDs
/// before 1.3, which the library doesn't read, it is 1:1.)
u32 standard_timing_lines(const std_timing_t &timing);

std::string version_text(const edid_t &edid);
std::string gamma_text(const edid_t &edid);
/// "AC3, 6 channels, 32kHz 44.1kHz 48kHz, 640 kbit/s".
std::string audio_format_text(const short_audio_desc_t &format);
std::string speaker_text(const edid_t &edid);
std::vector<std::string> standard_timing_texts(const edid_t &edid);
std::vector<std::string> detailed_timing_texts(const edid_t &edid);
std::vector<std::string> video_mode_texts(const edid_t &edid);
std::vector<std::string> audio_format_texts(const edid_t &edid);
std::vector<std::string> mode_4k_x_2k_texts(const edid_t &edid);

}  // namespace edid_cli
