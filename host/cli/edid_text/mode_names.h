// Modes and formats as people call them.
#pragma once

#include <cstdint>
#include <optional>
#include <string>

#include "edid_composer.h"

namespace edid_cli {

/// The last VIC that the library knows and offers.
inline constexpr u32 last_library_vic = 64;
inline constexpr u32 last_vic = 219;
inline constexpr u32 last_hdmi_vic = 4;
inline constexpr u32 last_audio_type = 18;

/// What a mode's name is made of.
struct raster_t {
  u32 width = 0;
  u32 doubled_width = 0;  ///< Of pixels that are sent twice, as 1440 for 720; else 0.
  u32 lines = 0;
  bool interlaced = false;
  u32 rate = 0;  ///< Whole Hz, 60 for 59.94.

  /// For comparing modes: pixels a second.
  std::uint64_t pixel_rate() const;
};

/// None for a VIC that no standard defines.
std::optional<raster_t> raster_of_vic(u32 vic);
std::optional<raster_t> raster_of_hdmi_vic(u32 hdmi_vic);
/// The VIC that a short video descriptor means. The library reads 7 bits and a native bit; CTA-861-F made the bytes
/// from 193 on VICs of their own.
u32 vic_of(const short_video_desc_t &descriptor);
/// A short video descriptor as it is stored (CTA-861, section 7.5.1).
struct svd_t {
  u32 vic;
  bool native;
};
svd_t decoded_svd(u32 code);
/// The pixel clock that a VIC above the library's needs, kHz; 0 for any other.
u32 pixel_clock_of_vic(u32 vic);

/// "1920x1080p60 16:9 (VIC 16)".
std::string video_mode_name(u32 vic);
/// "1920x1080p60".
std::string short_mode_name(u32 vic);
/// The HDMI_VIC of the same mode (HDMI 1.4b, table 8-13), as 1 for VIC 95; 0 when there is none.
u32 hdmi_vic_of_vic(u32 vic);
/// "3840x2160p30 (4k:1)".
std::string mode_4k_name(u32 hdmi_vic);
/// "AC3".
std::string audio_type_name(u32 type);
/// "2 channels".
std::string channels_name(u32 channels);
/// "1920x1080p60"; without the lines where they are 0.
std::string raster_name(i32 width, i32 lines, i32 refresh, bool interlaced);

}  // namespace edid_cli
