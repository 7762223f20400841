#include "edid_composer/selection/mode_lines.h"

#include "output.h"

namespace edid_composer {

void print_mode(u32 vic, u32 stereo, const char *native_column) {
  print("\t\tVIC:%d %s ", vic, short_video_timing_string(vic));
  print_stereo_type(stereo);
  print(" %s\n", native_column);
}

}  // namespace edid_composer
