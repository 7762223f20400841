// The refresh family of a sink: 50 Hz or 60 Hz, as its first mode that tells has it.
#include "diagnostics.h"
#include "edid_composer/decisions.h"
#include "edid_composer/video_modes.h"
#include "linked_list/walk.h"

namespace edid_composer {
namespace {

constexpr i32 undecided = 0;

i32 note_family(decisions_t *decisions, i32 family, compose_reason reason, reason_values_t values) {
  if (decisions != nullptr) {
    decisions->note(COMPOSE_SUBJECT_NATIVE_RATE, static_cast<u32>(family),
                    reason == COMPOSE_REASON_RATE_FORCED ? COMPOSE_VERDICT_CHANGED : COMPOSE_VERDICT_OFFERED, reason,
                    values);
  }
  return family;
}

/// The family that a detailed timing tells, or undecided.
i32 family_of_timing(const site_t &site, i32 index, const detailed_timing_t &timing, compose_reason reason,
                     decisions_t *decisions) {
  const u32 rate = calculate_refresh_rate(timing.pixel_clock, timing.h_active, timing.h_blanking, timing.v_active,
                                          timing.v_blanking);
  if (rate == 60 || rate == 59 || rate == 30 || rate == 29) {
    LOG_TRACE_AS(site, "Found DTD number: index #%d had a %d Hz refresh rate. Using %dHz as native rate.", index, rate,
                 60);
    return note_family(decisions, 60, reason, reason_values(index, rate));
  }
  if (rate == 50 || rate == 25) {
    LOG_TRACE_AS(site, "Found DTD number: index #%d had a %d Hz refresh rate. Using %d as native rate.", index, rate,
                 50);
    return note_family(decisions, 50, reason, reason_values(index, rate));
  }
  return undecided;
}

i32 family_of_detailed_timings(const site_t &site, const edid_t *edid, decisions_t *decisions) {
  i32 index = 0;
  for (const auto &timing : walk<const detailed_timing_t>(LIST_AS(site, &edid->dtd_list))) {
    const i32 family = family_of_timing(site, index, timing, COMPOSE_REASON_RATE_OF_DETAILED_TIMING, decisions);
    if (family != undecided) return family;
    ++index;
  }
  return undecided;
}

i32 family_of_standard_timings(const site_t &site, const edid_t *edid, decisions_t *decisions) {
  i32 index = 0;
  for (const auto &timing : walk<const std_timing_t>(LIST_AS(site, &edid->std_timings))) {
    const u32 rate = timing.refresh_rate;
    if (rate == 60 || rate == 59) {
      LOG_TRACE_AS(site, "Found a standard timing number: index #%d had a %dHz refresh rate. Using %d as native rate.",
                   index, rate, 60);
      return note_family(decisions, 60, COMPOSE_REASON_RATE_OF_STANDARD_TIMING, reason_values(index, rate));
    }
    ++index;
  }
  return undecided;
}

i32 family_of_short_video_descriptors(const site_t &site, const edid_t *edid, decisions_t *decisions) {
  i32 index = 0;
  for (const auto &video : walk<const short_video_desc_t>(LIST_AS(site, &edid->video_list))) {
    detailed_timing_t timing{};
    if (convert_vic_to_dtd(video.vic, &timing) == 1) {
      const i32 family = family_of_timing(site, index, timing, COMPOSE_REASON_RATE_OF_SHORT_VIDEO, decisions);
      if (family != undecided) return family;
    }
    ++index;
  }
  return undecided;
}

i32 family_of_sink(const site_t &site, const edid_t *edid, decisions_t *decisions) {
  i32 family = family_of_detailed_timings(site, edid, decisions);
  if (family == undecided) family = family_of_standard_timings(site, edid, decisions);
  if (family == undecided) family = family_of_short_video_descriptors(site, edid, decisions);
  return family;
}

}  // namespace

i32 _determine_tv_native_refresh_rate(const edid_t *edid, const platform_values_t *platform_values,
                                      decisions_t *decisions) {
  i32 rate = undecided;
  if (edid == nullptr) {
    LOG_ERROR("edid pointer is NULL. ptr=%p", address(edid));
  } else {
    rate = family_of_sink(HERE, edid, decisions);
  }
  if (rate != undecided) return rate;

  LOG_TRACE(
      "Unable to find a video mode that indicates the native refresh rate of the television. Reading the platform "
      "config file for native refresh rate.");
  rate = platform_values->native_refresh_rate;
  LOG_TRACE("Using %dHz as native rate.", rate);
  if (rate != 50 && rate != 60) {
    LOG_BUG("Expected to return only 50 or 60 here. Forcing value to 60. Val:%d", rate);
    return note_family(decisions, 60, COMPOSE_REASON_RATE_FORCED, reason_values(rate));
  }
  return note_family(decisions, rate, COMPOSE_REASON_RATE_OF_PLATFORM, reason_values());
}

}  // namespace edid_composer
