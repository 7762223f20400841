// The names of codes and single bits.
#include "utility/timing.h"

namespace {

constexpr const char *unknown_value = "Unknown Value";

constexpr const char *audio_names[] = {
    "AUDIO_TYPE_INVALID",
    "PCM",
    "AC3",
    "MPEG1",
    "MP3",
    "MPEG2",
    "AAC",
    "DTS",
    "ATRAC",
    "DSD",
    "EAC3/DD+",
    "DTS HD",
    "MLP/TrueHD",
    "DST",
    "WMA pro",
    "AUDIO_TYPE_EXTENSION",
    "HE AAC",
    "HE AACv2",
    "MPEG SURROUND",
};

constexpr const char *hdmi_vic_names[] = {"3840x2160p30Hz", "3840x2160p25Hz", "3840x2160p24Hz", "4096x2160p24Hz"};

// Bit 0 first.
constexpr const char *est_timing_1_names[] = {"800x600p60", "800x600p56", "640x480p75", "640x480p72",
                                              "640x480p67", "640x480p60", "720x400p88", "720x400p70"};
constexpr const char *est_timing_2_names[] = {"1280x1024p75", "1024x768p75", "1024x768p70", "1024x768p60",
                                              "1024x768p87",  "832x624p75",  "800x600p75",  "800x600p72"};
constexpr u32 man_timing_1152x870p75 = 1U << 7;

// VIC 1 first.
constexpr const char *vic_names[] = {
    "640x480p60Hz4x3",        "720x480p60Hz4x3",         "720x480p60Hz16x9",       "1280x720p60Hz16x9",
    "1920x1080i60Hz16x9",     "720(1440)x480i60Hz4x3",   "720(1440)x480i60Hz16x9", "720(1440)x240p60Hz4x3",
    "720(1440)x240p60Hz16x9", "2880x480i60Hz4x3",        "2880x480i60Hz16x9",      "2880x240p60Hz4x3",
    "2880x240p60Hz16x9",      "1440x480p60Hz4x3",        "1440x480p60Hz16x9",      "1920x1080p60Hz16x9",
    "720x576p50Hz4x3",        "720x576p50Hz16x9",        "1280x720p50Hz16x9",      "1920x1080i50Hz16x9",
    "720(1440)x576i50Hz4x3",  "720(1440)x576i50Hz16x9",  "720(1440)x288p50Hz4x3",  "720(1440)x288p50Hz16x9",
    "2880x576i50Hz4x3",       "2880x576i50Hz16x9",       "2880x288p50Hz4x3",       "2880x288p50Hz16x9",
    "1440x576p50Hz4x3",       "1440x576p50Hz16x9",       "1920x1080p50Hz16x9",     "1920x1080p24Hz16x9",
    "1920x1080p25Hz16x9",     "1920x1080p30Hz16x9",      "2880x480p60Hz4x3",       "2880x480p60Hz16x9",
    "2880x576p50Hz4x3",       "2880x576p50Hz16x9",
    "1920x10801250i50Hz16x9",  // kept: 1080 and 1250 run together
    "1920x1080i100Hz16x9",    "1280x720p100Hz16x9",      "720x576p100Hz4x3",       "720x576p100Hz16x9",
    "720(1440)x576i100Hz4x3", "720(1440)x576i100Hz16x9", "1920x1080i120Hz16x9",    "1280x720p120Hz16x9",
    "720x480p120Hz4x3",       "720x480p120Hz16x9",       "720(1440)x480i120Hz4x3", "720(1440)x480i120Hz16x9",
    "720x576p200Hz4x3",       "720x576p200Hz16x9",       "720(1440)x576i200Hz4x3", "720(1440)x576i200Hz16x9",
    "720x480p240Hz4x3",       "720x480p240Hz16x9",       "720(1440)x480i240Hz4x3", "720(1440)x480i240Hz16x9",
    "1280x720p24Hz16x9",      "1280x720p25Hz16x9",       "1280x720p30Hz16x9",      "1920x1080p120Hz16x9",
    "1920x1080p100Hz16x9",
};

/// The name at @p index, which may lie anywhere.
template <u32 size>
constexpr const char *name_at(const char *const (&names)[size], u32 index, const char *otherwise) {
  return index < size ? names[index] : otherwise;
}

/// The name of a value in which one bit is set.
template <u32 size>
constexpr const char *name_of_bit(const char *const (&names)[size], u32 value) {
  for (u32 bit = 0; bit < size; ++bit) {
    if (value == 1U << bit) return names[bit];
  }
  return unknown_value;
}

}  // namespace

const char *std_aspect_string(u32 ratio) {
  return ratio < std::size(edid_composer::aspect_ratios) ? edid_composer::aspect_ratios[ratio].name : "InvalidRatio";
}

const char *short_audio_string(u32 type) {
  return name_at(audio_names, type, "AUDIO_TYPE_UNKNOWN");
}

// HDMI_VICs and VICs count from 1; 0 wraps to an index without a name.
const char *hdmi_vic_string(u32 hdmi_vic) {
  return name_at(hdmi_vic_names, hdmi_vic - 1, unknown_value);
}

const char *short_video_timing_string(u32 vic) {
  return name_at(vic_names, vic - 1, unknown_value);
}

const char *est_timing_1_string(u32 bit) {
  return name_of_bit(est_timing_1_names, bit);
}

const char *est_timing_2_string(u32 bit) {
  return name_of_bit(est_timing_2_names, bit);
}

const char *man_timing_string(u32 bit) {
  return bit == man_timing_1152x870p75 ? "1152x870p75" : unknown_value;
}
