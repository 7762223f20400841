#include "edid_text/edid_report.h"

#include <cstdio>

#include "edid_text/decoded_edid.h"
#include "io/standard_output.h"

namespace edid_cli {

report_content_t report_content(const std::vector<u8> &edid) {
  const discarded_output_t unseen;
  const decoded_edid_t decoded(edid);
  return {decoded.is_complete(), has_hdmi2(decoded.hdmi2())};
}

void print_report(const std::vector<u8> &edid, const report_content_t &content, const std::string &title, bool brief) {
  print_edid(edid.data(), static_cast<u32>(edid.size()), brief ? 1 : 0, title.c_str());
  if (!content.has_hdmi2 || brief) return;
  std::fputs("\n", stdout);
  const hdmi2_t hdmi2 = decoded_hdmi2(edid);
  print_hdmi2(&hdmi2, (title + ": HDMI 2").c_str());
}

}  // namespace edid_cli
