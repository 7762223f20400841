#include "edid_composer/explain/video_explanation.h"

#include "edid_composer/new_edid/video_descriptors.h"
#include "linked_list/typed_list.h"
#include "utility/timing.h"

namespace edid_composer {
namespace {

constexpr u32 sink_origins =
    COMPOSE_ORIGIN_DETAILED_TIMING | COMPOSE_ORIGIN_STANDARD_TIMING | COMPOSE_ORIGIN_SHORT_VIDEO;

reason_values_t numbers_of(const detailed_timing_t &timing) {
  return reason_values(timing.h_active, frame_height(timing), refresh_rate(timing), timing.progressive == 0);
}

reason_values_t numbers_of(const std_timing_t &timing) {
  return reason_values(timing.h_active, 0, timing.refresh_rate, 0);
}

/// The sink's timings of one kind, which the journal holds in their order.
template <typename timing_t>
void nominate_timings(const ll_list_t &timings, compose_origin origin, const journal_t &journal,
                      decisions_t *decisions) {
  const ll_entry_t *timing = timings.head;
  for (const journal_entry_t &entry : journal.entries()) {
    if (entry.subject != COMPOSE_SUBJECT_VIDEO_MODE || entry.origin != origin) continue;
    if (entry.code != 0) {
      decisions->nominate(COMPOSE_SUBJECT_VIDEO_MODE, entry.code, origin, entry.index);
    } else {
      compose_decision_t *const decision = decisions->add(COMPOSE_SUBJECT_SINK_TIMING, 0);
      decision->origins = origin;
      decision->sink_index = entry.index;
      decide(decision, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_TIMING_WITHOUT_VIC,
             numbers_of(*static_cast<const timing_t *>(timing->data)));
    }
    timing = timing->next;
  }
}

void nominate_platform_modes(i32 rate, const platform_values_t &platform, decisions_t *decisions) {
  const bool is_60 = rate == 60;
  decisions->nominate_modes(is_60 ? platform.video_60_priority : platform.video_50_priority,
                            COMPOSE_ORIGIN_PRIORITY_LIST);
  decisions->nominate_modes(is_60 ? platform.video_60_additional : platform.video_50_additional,
                            COMPOSE_ORIGIN_ADDITION_LIST);
  decisions->nominate_modes(is_60 ? platform.video_50_priority : platform.video_60_priority,
                            COMPOSE_ORIGIN_OTHER_PRIORITY_LIST);
  decisions->nominate_modes(is_60 ? platform.video_50_additional : platform.video_60_additional,
                            COMPOSE_ORIGIN_OTHER_ADDITION_LIST);
}

void explain_native_rate(const native_rate_t &rate, decisions_t *decisions) {
  decisions->note(COMPOSE_SUBJECT_NATIVE_RATE, static_cast<u32>(rate.hz),
                  rate.reason == COMPOSE_REASON_RATE_FORCED ? COMPOSE_VERDICT_CHANGED : COMPOSE_VERDICT_OFFERED,
                  rate.reason, rate.values);
}

void explain_geometry_limit(const geometry_limit_t &limit, decisions_t *decisions) {
  if (limit.in_force) {
    decisions->note(COMPOSE_SUBJECT_GEOMETRY_LIMIT, limit.lines, COMPOSE_VERDICT_OFFERED,
                    COMPOSE_REASON_GEOMETRY_OF_SINK);
  } else {
    decisions->note(COMPOSE_SUBJECT_GEOMETRY_LIMIT, 0, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_GEOMETRY_UNLIMITED);
  }
}

/// The verdicts that the selection has noted.
void judge_noted_modes(const journal_t &journal, decisions_t *decisions) {
  for (const journal_entry_t &entry : journal.entries()) {
    if (entry.subject != COMPOSE_SUBJECT_VIDEO_MODE || entry.reason == 0) continue;
    const bool left_out = entry.reason == COMPOSE_REASON_TALLER_THAN_SINK;
    decide(decisions->candidate(COMPOSE_SUBJECT_VIDEO_MODE, entry.code),
           left_out ? COMPOSE_VERDICT_LEFT_OUT : COMPOSE_VERDICT_OFFERED, entry.reason, entry.values);
  }
}

/// Why a mode that was not selected is left out.
void leave_out(i32 rate, compose_decision_t *decision) {
  const u32 origins = decision->origins;
  if ((origins & (sink_origins | COMPOSE_ORIGIN_ADDITION_LIST)) != 0) {
    decide(decision, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_NOT_IN_PRIORITY_LIST);
  } else if ((origins & COMPOSE_ORIGIN_PRIORITY_LIST) != 0) {
    decide(decision, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_NOT_AVAILABLE);
  } else {
    decide(decision, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_OTHER_REFRESH_FAMILY, reason_values(rate));
  }
}

/// A mode that is offered whoever else names it.
void offer(u32 vic, compose_origin origin, compose_reason reason, decisions_t *decisions) {
  compose_decision_t *const decision = decisions->nominate(COMPOSE_SUBJECT_VIDEO_MODE, vic, origin, 0);
  if (!is_chosen(*decision)) decide(decision, COMPOSE_VERDICT_OFFERED, reason);
}

void explain_current_mode(const video_mode_t &mode, const current_mode_t &current, decisions_t *decisions) {
  const bool first = current.reason == COMPOSE_REASON_CURRENT_MODE_FIRST;
  decisions->note(COMPOSE_SUBJECT_CURRENT_MODE, current.vic, first ? COMPOSE_VERDICT_OFFERED : COMPOSE_VERDICT_LEFT_OUT,
                  current.reason, reason_values(mode.width, mode.height, mode.refresh, mode.interlaced));
  if (first) offer(current.vic, COMPOSE_ORIGIN_CURRENT_MODE, COMPOSE_REASON_IS_CURRENT_MODE, decisions);
}

void nominate_4k_modes(const hdmi_vics_t &vics, compose_origin origin, decisions_t *decisions) {
  i32 index = 0;
  for (const u32 vic : vics)
    decisions->nominate(COMPOSE_SUBJECT_4K_MODE, vic, origin, index++);
}

}  // namespace

void explain_video_modes(const inputs_t &inputs, const video_selection_t &selection, const journal_t &journal,
                         u32 largest_vic, decisions_t *decisions) {
  const auto &[sink, platform, settings, arena] = inputs;
  const i32 rate = selection.native_rate.hz;
  nominate_timings<detailed_timing_t>(sink.dtd_list, COMPOSE_ORIGIN_DETAILED_TIMING, journal, decisions);
  nominate_timings<std_timing_t>(sink.std_timings, COMPOSE_ORIGIN_STANDARD_TIMING, journal, decisions);
  decisions->nominate_modes(sink.video_list, COMPOSE_ORIGIN_SHORT_VIDEO, largest_vic);
  explain_native_rate(selection.native_rate, decisions);
  nominate_platform_modes(rate, platform, decisions);
  explain_geometry_limit(selection.geometry_limit, decisions);
  judge_noted_modes(journal, decisions);
  for (compose_decision_t &decision : decisions->all()) {
    if (decision.subject == COMPOSE_SUBJECT_VIDEO_MODE && decision.verdict == 0) leave_out(rate, &decision);
  }
  explain_current_mode(settings.hdmi_current_mode, selection.current_mode, decisions);
}

void explain_padding(i32 selected, decisions_t *decisions) {
  const bool enough = selected >= fewest_modes;
  decisions->note(COMPOSE_SUBJECT_PADDING, enough ? 0 : static_cast<u32>(fewest_modes - selected),
                  enough ? COMPOSE_VERDICT_LEFT_OUT : COMPOSE_VERDICT_OFFERED,
                  enough ? COMPOSE_REASON_ENOUGH_MODES : COMPOSE_REASON_TOO_FEW_MODES,
                  reason_values(selected, fewest_modes));
  if (!enough) offer(padding_vic, COMPOSE_ORIGIN_LIBRARY, COMPOSE_REASON_PADS_THE_LIST, decisions);
}

void explain_4k_modes(const selection_4k_t &modes, decisions_t *decisions) {
  nominate_4k_modes(modes.of_sink, COMPOSE_ORIGIN_SINK_4K, decisions);
  nominate_4k_modes(modes.priority, COMPOSE_ORIGIN_PRIORITY_LIST, decisions);
  nominate_4k_modes(modes.addition, COMPOSE_ORIGIN_ADDITION_LIST, decisions);
  for (compose_decision_t &decision : decisions->all()) {
    if (decision.subject != COMPOSE_SUBJECT_4K_MODE) continue;
    const u32 vic = decision.code;
    if (modes.selected.has(vic)) {
      decide(&decision, COMPOSE_VERDICT_OFFERED,
             modes.of_sink.has(vic) ? COMPOSE_REASON_SINK_HAS_IT : COMPOSE_REASON_PLATFORM_ADDS_IT);
    } else {
      decide(&decision, COMPOSE_VERDICT_LEFT_OUT,
             modes.priority.has(vic) ? COMPOSE_REASON_NOT_AVAILABLE : COMPOSE_REASON_NOT_IN_PRIORITY_LIST);
    }
  }
}

}  // namespace edid_composer
