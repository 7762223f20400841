#include "edid_composer/selection/modes_4k_x_2k.h"

#include "diagnostics.h"

namespace edid_composer {
namespace {

REPORTS_AS(_filter_4k_modes);

hdmi_vics_t modes_of(const edid_t &sink) {
  hdmi_vics_t vics;
  for (u32 i = 0; i < std::min<u32>(sink.hdmi_vic_len, hdmi_vics_t::most); ++i)
    vics.add(sink.hdmi_vic[i]);
  return vics;
}

/// The entries of a platform list up to its first 0.
hdmi_vics_t modes_of(const i32 (&list)[hdmi_vics_t::most]) {
  hdmi_vics_t vics;
  for (const i32 vic : list) {
    if (vic == 0) break;
    vics.add(static_cast<u32>(vic));
  }
  return vics;
}

void trace_modes(const char *heading, const hdmi_vics_t &modes) {
  LOG_TRACE("%s", heading);
  for (const u32 vic : modes)
    LOG_TRACE("\t%d\t%s", vic, hdmi_vic_string(vic));
}

}  // namespace

selection_4k_t _filter_4k_modes(const inputs_t &inputs) {
  selection_4k_t modes{.of_sink = modes_of(inputs.sink),
                       .addition = modes_of(inputs.platform.modes_4k_x_2k_addition),
                       .priority = modes_of(inputs.platform.modes_4k_x_2k_priority),
                       .selected = {}};
  trace_modes("Downstream 4k x 2k:", modes.of_sink);
  trace_modes("Additional 4k x 2k:", modes.addition);
  trace_modes("Priority 4k x 2k:", modes.priority);
  for (const u32 vic : modes.priority) {
    if (!modes.of_sink.has(vic) && !modes.addition.has(vic)) continue;
    modes.selected.add(vic);
    LOG_TRACE("\tAdding 4k x 2k mode:%d:%s", vic, hdmi_vic_string(vic));
  }
  return modes;
}

}  // namespace edid_composer
