#include "video_mode_text.h"

#include <string>

#include "bad_input.h"
#include "whole_number.h"

namespace edid_cli {

video_mode_t parse_video_mode(std::string_view text) {
  const std::size_t cross = text.find('x');
  const std::size_t scan = text.find_first_of("pi");
  if (cross != std::string_view::npos && scan != std::string_view::npos && cross < scan) {
    const auto width = parse_whole_number(text.substr(0, cross));
    const auto height = parse_whole_number(text.substr(cross + 1, scan - cross - 1));
    const auto refresh = parse_whole_number(text.substr(scan + 1));
    if (width && height && refresh) {
      const u32 interlaced = text[scan] == 'i' ? 1 : 0;
      return {*width, *height, interlaced, *refresh};
    }
  }
  throw bad_input_t("\"" + std::string(text) + "\" is not a mode such as 1920x1080p60 or 1920x1080i50");
}

}  // namespace edid_cli
