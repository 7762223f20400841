#include "edid_composer/selection/video_modes.h"

#include "edid_composer/selection/mode_lines.h"
#include "linked_list/typed_list.h"

namespace edid_composer {
namespace {

REPORTS_AS(_filter_video_modes);

// 1. What the sink has, what the platform adds.

/// Adds the VIC of each timing of the sink that has one.
template <typename timing_t>
bool add_timings(const edid_t &sink, const named_list_t &timings, compose_origin origin,
                 u8 (*convert_to_vic)(const edid_t *, const timing_t *, u32 *), candidates_t *candidates,
                 journal_t *journal) {
  i32 index = 0;
  for (const auto &timing : walk<const timing_t>(timings)) {
    u32 vic = 0;
    const bool known = convert_to_vic(&sink, &timing, &vic) == 1;
    journal->note({.subject = COMPOSE_SUBJECT_VIDEO_MODE, .origin = origin, .index = index++, .code = vic});
    if (known && !candidates->add({.vic = vic, .stereo = 0, .of_sink = true}, site)) return false;
  }
  return true;
}

bool add_sink_modes(const edid_t *edid, candidates_t *candidates, journal_t *journal) {
  if (!add_timings(*edid, LIST(&edid->dtd_list, "&edid->dtd_list"), COMPOSE_ORIGIN_DETAILED_TIMING, convert_dtd_to_vic,
                   candidates, journal) ||
      !add_timings(*edid, LIST(&edid->std_timings, "&edid->std_timings"), COMPOSE_ORIGIN_STANDARD_TIMING,
                   convert_std_to_vic, candidates, journal)) {
    return false;
  }
  if (_combine_lists(candidates, &edid->video_list, true)) return true;
  LOG_ERROR("Failed combining short video lists.");
  return false;
}

bool add_platform_modes(i32 rate, const platform_values_t &platform, candidates_t *candidates) {
  if (rate == 60) {
    LOG_TRACE("Combining 60Hz lists:");
    if (_combine_lists(candidates, &platform.video_60_additional, false)) return true;
    LOG_ERROR("Failed combining 60Hz lists.");
    return false;
  }
  LOG_TRACE("Combining 50Hz lists:");
  if (_combine_lists(candidates, &platform.video_50_additional, false)) return true;
  LOG_ERROR("Failed combining 50Hz lists.");
  return false;
}

// 2. What of it the platform offers.

bool prioritize(const ll_list_t *list, const candidates_t &candidates, appender_t<short_video_desc_t> selected,
                journal_t *journal) {
  if (is_tracing()) {
    log_trace(site, __LINE__, "\tPrioritization List:");
    for (const auto &video : walk<const short_video_desc_t>(LIST(list, "list")))
      print_mode(video);
    log_trace(site, __LINE__, "Prioritize the list of valid modes and remove duplicates. Modes:%d MasterList:%d",
              candidates.size(), ll_size(list));
  }
  for (const auto &wanted : walk<const short_video_desc_t>(LIST(list, "list"))) {
    const match_t match = candidates.match(wanted);
    if (!match.found) continue;
    if (!selected.append({.native = 0, .vic = wanted.vic, .stereo = match.stereo})) return false;
    journal->note({.subject = COMPOSE_SUBJECT_VIDEO_MODE,
                   .code = wanted.vic,
                   .reason = match.of_sink ? COMPOSE_REASON_SINK_HAS_IT : COMPOSE_REASON_PLATFORM_ADDS_IT});
  }
  return true;
}

}  // namespace

video_selection_t _filter_video_modes(const inputs_t &inputs, ll_list_t *modes, journal_t *journal) {
  const platform_values_t &platform = inputs.platform;
  video_selection_t selection;
  candidates_t candidates(is_tracing() || platform.geometry_limit != 0, inputs.arena);
  if (!add_sink_modes(&inputs.sink, &candidates, journal)) return selection;
  selection.native_rate = _determine_tv_native_refresh_rate(inputs);
  const i32 rate = selection.native_rate.hz;
  if (!add_platform_modes(rate, platform, &candidates)) return selection;
  selection.geometry_limit = limit_geometry(inputs, &candidates, journal);
  const ll_list_t *const list = rate == 60 ? &platform.video_60_priority : &platform.video_50_priority;
  if (!prioritize(list, candidates, appender_t<short_video_desc_t>(modes, inputs.arena, site), journal))
    return selection;
  selection.current_mode = put_current_mode_first(inputs, modes);
  selection.complete = selection.current_mode.complete;
  if (selection.complete && is_tracing()) {
    log_trace(site, __LINE__, "\tNew EDID List of VICs:");
    for (const auto &video : walk<const short_video_desc_t>(LIST(modes, "modes")))
      print_mode(video);
  }
  return selection;
}

bool _combine_lists(candidates_t *candidates, const ll_list_t *extra_list, bool of_sink) {
  REPORTS_AS(_combine_lists);
  if (!ll_is_initialized(extra_list)) {
    // kept: the address is that of the list that is added to.
    LOG_ERROR("extra_list has not been initialized. ptr=%s", address(candidates).text);
    return false;
  }
  LOG_TRACE("Combine Lists:");
  for (const auto &extra : walk<const short_video_desc_t>(LIST(extra_list, "extra_list"))) {
    if (!candidates->add({.vic = extra.vic, .stereo = extra.stereo, .of_sink = of_sink}, site)) return false;
    LOG_TRACE("\tAdding video format:%d %s stereo:0x%03X", extra.vic, short_video_timing_string(extra.vic),
              extra.stereo);
  }
  if (is_tracing()) {
    log_trace(site, __LINE__, "\tList after combining:");
    candidates->for_each([](const candidate_t &candidate) { print_mode(candidate.vic, candidate.stereo, ""); });
  }
  return true;
}

}  // namespace edid_composer
