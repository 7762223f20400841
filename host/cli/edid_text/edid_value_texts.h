// Values of a decoded EDID that are more than a number, as texts. Of a list: one text for each entry.
#pragma once

#include <string>
#include <vector>

#include "edid_composer.h"

namespace edid_cli {

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
