#include "edid_composer/new_edid/deep_color.h"

#include "edid_composer/new_edid/population.h"

namespace edid_composer {

REPORTS_AS(_populate_new_edid);

deep_color_t offer_deep_color(const platform_values_t &platform) {
  const bool bits_30 = platform.dc_30bit != 0;
  const bool bits_36 = platform.dc_36bit != 0;
  const bool requires_36 = bits_30 && !bits_36;
  LOG_TRACE("\tdc_30bit = %d", bits_30);
  LOG_TRACE("\tdc_36bit = %d", bits_36);
  if (requires_36) {
    LOG_WARNING(
        "The HDMI standard requires 36bit Deep Color to be supported when 30bit or 48bit is supported. Please correct "
        "this in your platform configuration file. DC_30bit:%s DC_36bit:%s DC_48bit:%s Setting 36bit support to true.",
        true_or_false(bits_30), true_or_false(bits_36), true_or_false(false));
  }
  return {bits_30, bits_36 || requires_36, requires_36};
}

}  // namespace edid_composer
