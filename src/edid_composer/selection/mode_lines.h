// The trace line of a mode in a list.
#pragma once

#include "edid_composer.h"

namespace edid_composer {

/// @p native_column is what stands where native modes say so.
void print_mode(u32 vic, u32 stereo, const char *native_column);

inline void print_mode(const short_video_desc_t &video) {
  print_mode(video.vic, video.stereo, video.native != 0 ? "Native" : "      ");
}

}  // namespace edid_composer
