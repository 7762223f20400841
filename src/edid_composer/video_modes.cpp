#include "edid_composer/video_modes.h"

#include "diagnostics.h"
#include "edid_composer/video_verdicts.h"
#include "linked_list/new_entry.h"
#include "linked_list/walk.h"
#include "output.h"

namespace edid_composer {
namespace {

/// One mode of a list, as trace; @p otherwise stands where native modes say so.
void print_mode(const short_video_desc_t &video, const char *otherwise) {
  print("\t\tVIC:%d %s ", video.vic, short_video_timing_string(video.vic));
  print_stereo_type(video.stereo);
  print(" %s\n", video.native != 0 ? "Native" : otherwise);
}

constexpr const char *not_native_column = "      ";

// 1. What the sink has, what the platform adds.

/// Appends the VIC of each timing of the sink that has one.
template <typename timing_t>
bool add_timings(const site_t &site, const edid_t *edid, const named_list_t &timings,
                 u8 (*convert_to_vic)(const edid_t *, const timing_t *, u32 *), ll_list_t *candidates,
                 compose_origin origin, decisions_t *decisions) {
  i32 next = 0;
  for (const auto &timing : walk<const timing_t>(timings)) {
    const i32 index = next++;
    u32 vic = 0;
    if (convert_to_vic(edid, &timing, &vic) != 1) {
      if (decisions != nullptr) note_timing_without_vic(decisions, timing, index);
      continue;
    }
    if (decisions != nullptr) decisions->nominate(COMPOSE_SUBJECT_VIDEO_MODE, vic, origin, index);
    const short_video_desc_t video{.native = 0, .vic = vic, .stereo = 0};
    if (!append(candidates, video, HERE_AS(site))) return false;
  }
  return true;
}

bool add_sink_modes(const site_t &site, const edid_t *edid, ll_list_t *candidates, decisions_t *decisions) {
  if (!add_timings(site, edid, LIST_AS(site, &edid->dtd_list), convert_dtd_to_vic, candidates,
                   COMPOSE_ORIGIN_DETAILED_TIMING, decisions) ||
      !add_timings(site, edid, LIST_AS(site, &edid->std_timings), convert_std_to_vic, candidates,
                   COMPOSE_ORIGIN_STANDARD_TIMING, decisions)) {
    return false;
  }
  if (decisions != nullptr) decisions->nominate_modes(edid->video_list, COMPOSE_ORIGIN_SHORT_VIDEO);
  if (_combine_lists(candidates, &edid->video_list) != 1) {
    LOG_ERROR_AS(site, "Failed combining short video lists.");
    return false;
  }
  return true;
}

bool add_platform_modes(const site_t &site, i32 rate, const platform_values_t &values, ll_list_t *candidates) {
  if (rate == 60) {
    LOG_TRACE_AS(site, "Combining 60Hz lists:");
    if (_combine_lists(candidates, &values.video_60_additional) == 1) return true;
    LOG_ERROR_AS(site, "Failed combining 60Hz lists.");
    return false;
  }
  LOG_TRACE_AS(site, "Combining 50Hz lists:");
  if (_combine_lists(candidates, &values.video_50_additional) == 1) return true;
  LOG_ERROR_AS(site, "Failed combining 50Hz lists.");
  return false;
}

// 2. What of it the platform offers.

/// Appends the mode of one priority entry, with the 3D structures that a candidate shares with it, if any candidate has
/// it.
bool add_if_candidate(const site_t &site, const short_video_desc_t &wanted, const ll_list_t *candidates,
                      ll_list_t *ret_modes) {
  new_entry_t<short_video_desc_t> selected(site);
  if (!selected) return false;
  bool matched = false;
  for (const auto &candidate : walk<const short_video_desc_t>(LIST_AS(site, candidates))) {
    if (candidate.vic != wanted.vic) continue;
    selected->vic = wanted.vic;
    selected->stereo |= wanted.stereo & candidate.stereo;
    matched = true;
  }
  return matched ? selected.add_to_back(ret_modes) : selected.discard();
}

bool prioritize(const site_t &site, i32 rate, const ll_list_t *list, const ll_list_t *candidates,
                ll_list_t *ret_modes) {
  if (list == nullptr) {
    LOG_BUG_AS(site, "Unable to obtain a %dHz Platform list.", rate);
    return false;
  }
  if (debug_enabled()) {
    log_trace(HERE_AS(site), "\tPrioritization List:");
    for (const auto &video : walk<const short_video_desc_t>(LIST_AS(site, list)))
      print_mode(video, not_native_column);
    log_trace(HERE_AS(site), "Prioritize the list of valid modes and remove duplicates. Modes:%d MasterList:%d",
              ll_size(candidates), ll_size(list));
  }
  for (const auto &wanted : walk<const short_video_desc_t>(LIST_AS(site, list))) {
    if (!add_if_candidate(HERE_AS(site), wanted, candidates, ret_modes)) return false;
  }
  return true;
}

// 3. The mode that the platform puts out now.

bool delete_first(const site_t &site, u32 vic, ll_list_t *ret_modes) {
  u32 position = 0;
  for (const auto &video : walk<const short_video_desc_t>(LIST_AS(site, ret_modes))) {
    if (video.vic == vic) {
      if (ll_delete_entry_at(ret_modes, position)) return true;
      LOG_ERROR_AS(site, "Failed deleting entry index:%d.", position);
      return false;
    }
    ++position;
  }
  return true;
}

bool put_current_mode_first(const site_t &site, const video_mode_t &mode, ll_list_t *ret_modes,
                            decisions_t *decisions) {
  static constexpr new_entry_texts_t texts{"Failed creating entry.", "Failed adding entry to the back of the list.",
                                           "Failed deleting unused entry."};
  u32 vic = 0;
  if (mode_to_vic(&mode, &vic) != 1) {
    LOG_ERROR_AS(site, "Could not obtain a valid hdmi mode. Continuing.");
    if (decisions != nullptr) note_current_mode(decisions, mode, 0, COMPOSE_REASON_CURRENT_MODE_WITHOUT_VIC);
    return true;
  }
  if (!delete_first(site, vic, ret_modes)) return false;
  new_entry_t<short_video_desc_t> current(HERE_AS(site), texts);
  if (!current) return false;
  current->vic = vic;
  LOG_TRACE_AS(site, "\tAdding hdmi output mode as the priority mode:%s", short_video_timing_string(vic));
  if (decisions != nullptr) note_current_mode(decisions, mode, vic, COMPOSE_REASON_CURRENT_MODE_FIRST);
  return current.add_to_front(ret_modes);
}

/// Takes out the candidates that are taller than the sink shows, if the platform wants so.
void limit_geometry(const platform_values_t &values, const ll_list_t &sink_modes, ll_list_t *candidates,
                    decisions_t *decisions) {
  if (values.geometry_limit == 0) {
    if (decisions != nullptr) {
      decisions->note(COMPOSE_SUBJECT_GEOMETRY_LIMIT, 0, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_GEOMETRY_UNLIMITED);
    }
    return;
  }
  const u32 limit = _find_largest_height(&sink_modes);
  if (decisions != nullptr) {
    decisions->note(COMPOSE_SUBJECT_GEOMETRY_LIMIT, limit, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_GEOMETRY_OF_SINK);
  }
  _remove_larger_height_modes(limit, candidates, decisions);
}

/// The steps between making and deleting the candidate list.
bool select_modes(const site_t &site, const edid_t *edid, const compose_cfg_t *cfg, const platform_values_t &values,
                  ll_list_t *candidates, ll_list_t *ret_modes, decisions_t *decisions) {
  if (!add_sink_modes(site, edid, candidates, decisions)) return false;
  const i32 rate = _determine_tv_native_refresh_rate(edid, &values, decisions);
  if (!add_platform_modes(site, rate, values, candidates)) return false;
  if (decisions != nullptr) nominate_platform_modes(decisions, rate, values);
  limit_geometry(values, edid->video_list, candidates, decisions);
  const ll_list_t *const list = rate == 60 ? &values.video_60_priority : &values.video_50_priority;
  if (!prioritize(site, rate, list, candidates, ret_modes)) return false;
  if (decisions != nullptr) judge_video_modes(decisions, rate, *ret_modes);

  const bool wanted_first = values.current_mode_set_to_priority != 0;
  if (wanted_first && _valid_current_mode(&cfg->hdmi_current_mode) == 1) {
    if (!put_current_mode_first(site, cfg->hdmi_current_mode, ret_modes, decisions)) return false;
  } else {
    LOG_TRACE_AS(site, "\tIgnoring hdmi_current_mode.");
    if (decisions != nullptr) {
      note_current_mode(decisions, cfg->hdmi_current_mode, 0,
                        wanted_first ? COMPOSE_REASON_CURRENT_MODE_IMPLAUSIBLE : COMPOSE_REASON_CURRENT_MODE_IGNORED);
    }
  }
  if (debug_enabled()) {
    log_trace(HERE_AS(site), "\tNew EDID List of VICs:");
    for (const auto &video : walk<const short_video_desc_t>(LIST_AS(site, ret_modes))) {
      print_mode(video, not_native_column);
    }
  }
  return true;
}

/// The frame height of a VIC, in lines; false when it has no timing.
bool frame_height(const site_t &site, u32 vic, u32 *height) {
  detailed_timing_t timing{};
  if (convert_vic_to_dtd(vic, &timing) != 1) {
    LOG_BUG_AS(site, "\tFailed converting VIC:%d to a DTD.", vic);
    return false;
  }
  *height = timing.progressive != 0 ? timing.v_active : timing.v_active * 2;
  return true;
}

}  // namespace

u32 _filter_video_modes(const edid_t *edid, const compose_cfg_t *cfg, ll_list_t *ret_modes,
                        const platform_values_t *platform_values, decisions_t *decisions) {
  ll_list_t candidates{};
  bool selected = init_list<short_video_desc_t>(&candidates);
  if (selected) {
    selected = select_modes(HERE, edid, cfg, *platform_values, &candidates, ret_modes, decisions);
  } else {
    LOG_ERROR("Failed initializing the linked list.");
  }
  if (!ll_delete_list(&candidates)) {
    LOG_ERROR("Failed deleting list.");
    return 0;
  }
  return selected ? 1 : 0;
}

u32 _combine_lists(ll_list_t *vic_list, const ll_list_t *extra_list) {
  // kept: all four messages tell the address of vic_list.
  if (vic_list == nullptr) {
    LOG_ERROR("vic_list is NULL. ptr=%p", address(vic_list));
    return 0;
  }
  if (!ll_is_initialized(vic_list)) {
    LOG_ERROR("vic_list has not been initialized. ptr=%p", address(vic_list));
    return 0;
  }
  if (extra_list == nullptr) {
    LOG_WARNING("extra_list is NULL. ptr=%p", address(vic_list));
    return 0;
  }
  if (!ll_is_initialized(extra_list)) {
    LOG_ERROR("extra_list has not been initialized. ptr=%p", address(vic_list));
    return 0;
  }
  LOG_TRACE("Combine Lists:");
  for (const auto &extra : walk<const short_video_desc_t>(LIST(extra_list))) {
    const short_video_desc_t video{.native = 0, .vic = extra.vic, .stereo = extra.stereo};
    if (!append(vic_list, video, HERE)) return 0;
    LOG_TRACE("\tAdding video format:%d %s stereo:0x%03X", video.vic, short_video_timing_string(video.vic),
              video.stereo);
  }
  if (debug_enabled()) {
    log_trace(HERE, "\tList after combining:");
    for (const auto &video : walk<const short_video_desc_t>(LIST(vic_list)))
      print_mode(video, "");
  }
  return 1;
}

u32 _find_largest_height(const ll_list_t *video_list) {
  u32 largest = 0;
  for (const auto &video : walk<const short_video_desc_t>(LIST(video_list))) {
    u32 height = 0;
    if (frame_height(HERE, video.vic, &height) && height > largest) largest = height;
  }
  LOG_TRACE("Largest Height:%d\n", largest);
  return largest;
}

void _remove_larger_height_modes(u32 limit, ll_list_t *list, decisions_t *decisions) {
  // From the back, so that the positions in front of a deleted entry stay what they are.
  for (i32 position = ll_size(list) - 1; position >= 0; --position) {
    void *payload = nullptr;
    if (!ll_entry_at(list, position, &payload)) continue;
    const u32 vic = static_cast<const short_video_desc_t *>(payload)->vic;
    u32 height = 0;
    if (!frame_height(HERE, vic, &height) || height <= limit) continue;
    ll_delete_entry_at(list, static_cast<u32>(position));
    if (decisions != nullptr) {
      decide(decisions->candidate(COMPOSE_SUBJECT_VIDEO_MODE, vic), COMPOSE_VERDICT_LEFT_OUT,
             COMPOSE_REASON_TALLER_THAN_SINK, reason_values(height, limit));
    }
  }
}

u32 _valid_current_mode(const video_mode_t *mode) {
  constexpr auto within = [](u32 value, u32 min, u32 max) { return value >= min && value <= max; };
  if (mode == nullptr) return 0;
  return within(mode->height, 100, 8000) && within(mode->width, 400, 16000) && within(mode->refresh, 20, 1000) &&
                 mode->interlaced <= 1
             ? 1
             : 0;
}

}  // namespace edid_composer
