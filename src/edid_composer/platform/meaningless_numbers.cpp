#include "edid_composer/platform/meaningless_numbers.h"

#include "diagnostics.h"
#include "edid_composer/platform/platform_values_reader.h"

namespace edid_composer {
namespace {

REPORTS_AS(_read_platform_values);

/// The limits were the first to replace what is outside of them.
void replace(configuration_outcome_t *number, i32 replacement) {
  number->used = replacement;
  if (number->reason == CONFIGURATION_TAKEN) number->reason = CONFIGURATION_WITHOUT_MEANING;
}

}  // namespace

void settle_refresh_rate(configuration_outcome_t *rate) {
  constexpr i32 fallback = 60;
  if (rate->used == 50 || rate->used == 60) return;
  LOG_WARNING(
      "Value in the platform config file for the domain \"%s\" is an unrecognized value:%d. Valid values: "
      "50,60. Using:%d",
      CONFIGURATION_DOMAIN "native_refresh_rate", rate->used, fallback);
  replace(rate, fallback);
}

void settle_week(configuration_outcome_t *week) {
  constexpr i32 last_week = 53;
  constexpr i32 model_year = 255;
  if (week->used > last_week && week->used != model_year) replace(week, last_week);
}

void settle_deep_color(configuration_outcome_t *deep_color) {
  REPORTS_AS(settle_deep_color);
  constexpr i32 of_platform = 0;
  constexpr i32 as_sink = 2;
  if (deep_color->used == of_platform || deep_color->used == as_sink) return;
  LOG_WARNING("hdmi2.deep_color has an unrecognized value:%d. Valid values: 0,2. Using:%d", deep_color->used,
              of_platform);
  replace(deep_color, of_platform);
}

}  // namespace edid_composer
