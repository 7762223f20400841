#include "edid_composer/selection/native_rate.h"

#include <optional>

#include "linked_list/typed_list.h"
#include "utility/timing.h"

namespace edid_composer {
namespace {

REPORTS_AS(_determine_tv_native_refresh_rate);

using found_rate_t = std::optional<native_rate_t>;

found_rate_t rate_of_timing(i32 index, const detailed_timing_t &timing, compose_reason reason) {
  const u32 rate = refresh_rate(timing);
  if (rate == 60 || rate == 59 || rate == 30 || rate == 29) {
    LOG_TRACE("Found DTD number: index #%d had a %d Hz refresh rate. Using %dHz as native rate.", index, rate, 60);
    return native_rate_t{60, reason, reason_values(index, rate)};
  }
  if (rate == 50 || rate == 25) {
    LOG_TRACE("Found DTD number: index #%d had a %d Hz refresh rate. Using %d as native rate.", index, rate, 50);
    return native_rate_t{50, reason, reason_values(index, rate)};
  }
  return std::nullopt;
}

found_rate_t rate_of_detailed_timings(const edid_t *edid) {
  i32 index = 0;
  for (const auto &timing : walk<const detailed_timing_t>(LIST(&edid->dtd_list, "&edid->dtd_list"))) {
    const found_rate_t found = rate_of_timing(index++, timing, COMPOSE_REASON_RATE_OF_DETAILED_TIMING);
    if (found) return found;
  }
  return std::nullopt;
}

found_rate_t rate_of_standard_timings(const edid_t *edid) {
  i32 index = 0;
  for (const auto &timing : walk<const std_timing_t>(LIST(&edid->std_timings, "&edid->std_timings"))) {
    const u32 rate = timing.refresh_rate;
    if (rate == 60 || rate == 59) {
      LOG_TRACE("Found a standard timing number: index #%d had a %dHz refresh rate. Using %d as native rate.", index,
                rate, 60);
      return native_rate_t{60, COMPOSE_REASON_RATE_OF_STANDARD_TIMING, reason_values(index, rate)};
    }
    ++index;
  }
  return std::nullopt;
}

found_rate_t rate_of_short_video_descriptors(const edid_t *edid) {
  i32 index = 0;
  for (const auto &video : walk<const short_video_desc_t>(LIST(&edid->video_list, "&edid->video_list"))) {
    detailed_timing_t timing{};
    if (convert_vic_to_dtd(video.vic, &timing) == 1) {
      const found_rate_t found = rate_of_timing(index, timing, COMPOSE_REASON_RATE_OF_SHORT_VIDEO);
      if (found) return found;
    }
    ++index;
  }
  return std::nullopt;
}

native_rate_t rate_of_platform(i32 rate) {
  LOG_TRACE(
      "Unable to find a video mode that indicates the native refresh rate of the television. Reading the platform "
      "config file for native refresh rate.");
  LOG_TRACE("Using %dHz as native rate.", rate);
  if (rate == 50 || rate == 60) return {rate, COMPOSE_REASON_RATE_OF_PLATFORM, {}};
  LOG_BUG("Expected to return only 50 or 60 here. Forcing value to 60. Val:%d", rate);
  return {60, COMPOSE_REASON_RATE_FORCED, reason_values(rate)};
}

}  // namespace

native_rate_t _determine_tv_native_refresh_rate(const inputs_t &inputs) {
  found_rate_t found = rate_of_detailed_timings(&inputs.sink);
  if (!found) found = rate_of_standard_timings(&inputs.sink);
  if (!found) found = rate_of_short_video_descriptors(&inputs.sink);
  return found ? *found : rate_of_platform(inputs.platform.native_refresh_rate);
}

}  // namespace edid_composer
