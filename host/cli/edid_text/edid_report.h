// The readable report of an EDID, as the library prints it.
#pragma once

#include <string>
#include <vector>

#include "edid_composer.h"

namespace edid_cli {

/// What there is to report of an EDID.
struct report_content_t {
  bool is_complete;  ///< All of it decoded.
  bool has_hdmi2;    ///< It has data blocks or modes that came with HDMI 2, HDR or wide colour.
};

/// Decodes unseen: printing itself returns nothing.
report_content_t report_content(const std::vector<u8> &edid);

/// Prints the report, and after it that of HDMI 2 where there is any and @p brief does not leave it out.
void print_report(const std::vector<u8> &edid, const report_content_t &content, const std::string &title, bool brief);

}  // namespace edid_cli
