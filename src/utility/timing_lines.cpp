#include "utility/timing_lines.h"

#include <cstdio>

#include "utility/timing.h"

namespace edid_composer {

timing_lines_t::timing_lines_t(const detailed_timing_t &timing) {
  add("Pixel Clock:", timing.pixel_clock);
  add("Refresh Rate:", refresh_rate(timing));
  add("H Active:", timing.h_active);
  add("H Blanking:", timing.h_blanking);
  add("V Active:", timing.v_active);
  add("V Blanking:", timing.v_blanking);
  add("H sync offset:", timing.h_sync_offset);
  add("H sync width:", timing.h_sync_width);
  add("V sync offset:", timing.v_sync_offset);
  add("V sync width:", timing.v_sync_width);
  add_size("H image size:", timing.h_image_size);
  add_size("V image size:", timing.v_image_size);
  add("H Border:", timing.h_border);
  add("V Border:", timing.v_border);
  add("Scan:", timing.progressive != 0 ? "Progressive" : "Interlaced");
  add("Stereo:", timing.stereo != 0 ? "Yes" : "No");
  add("H sync:", timing.h_sync_positive != 0 ? "Positive" : "Negative");
  add("V sync:", timing.v_sync_positive != 0 ? "Positive" : "Negative");
}

void timing_lines_t::add(const char *label, u32 number) {
  std::snprintf(lines_[count_++], sizeof(line_t), "\t%-17s%d", label, number);
}

void timing_lines_t::add(const char *label, const char *word) {
  std::snprintf(lines_[count_++], sizeof(line_t), "\t%-17s%s", label, word);
}

void timing_lines_t::add_size(const char *label, u32 millimetres) {
  std::snprintf(lines_[count_++], sizeof(line_t), "\t%-17s%d mm (%d in)", label, millimetres, millimetres * 5 / 127);
}

}  // namespace edid_composer
