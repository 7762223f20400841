#include "edid_composer/video_verdicts.h"

#include "linked_list/walk.h"

namespace edid_composer {
namespace {

constexpr u32 sink_origins =
    COMPOSE_ORIGIN_DETAILED_TIMING | COMPOSE_ORIGIN_STANDARD_TIMING | COMPOSE_ORIGIN_SHORT_VIDEO;

u32 refresh_rate(const detailed_timing_t &timing) {
  return calculate_refresh_rate(timing.pixel_clock, timing.h_active, timing.h_blanking, timing.v_active,
                                timing.v_blanking);
}

void note_sink_timing(decisions_t *decisions, compose_origin origin, i32 index, reason_values_t values) {
  compose_decision_t *const decision = decisions->add(COMPOSE_SUBJECT_SINK_TIMING, 0);
  decision->origins = origin;
  decision->sink_index = index;
  decide(decision, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_TIMING_WITHOUT_VIC, values);
}

/// Why a mode that was not chosen is left out.
void leave_out(compose_decision_t *decision, i32 rate) {
  const u32 origins = decision->origins;
  if ((origins & (sink_origins | COMPOSE_ORIGIN_ADDITION_LIST)) != 0) {
    decide(decision, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_NOT_IN_PRIORITY_LIST);
  } else if ((origins & COMPOSE_ORIGIN_PRIORITY_LIST) != 0) {
    decide(decision, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_NOT_AVAILABLE);
  } else {
    decide(decision, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_OTHER_REFRESH_FAMILY, reason_values(rate));
  }
}

}  // namespace

void note_timing_without_vic(decisions_t *decisions, const detailed_timing_t &timing, i32 index) {
  const bool interlaced = timing.progressive == 0;
  note_sink_timing(decisions, COMPOSE_ORIGIN_DETAILED_TIMING, index,
                   reason_values(timing.h_active, interlaced ? timing.v_active * 2 : timing.v_active,
                                 refresh_rate(timing), interlaced));
}

void note_timing_without_vic(decisions_t *decisions, const std_timing_t &timing, i32 index) {
  note_sink_timing(decisions, COMPOSE_ORIGIN_STANDARD_TIMING, index,
                   reason_values(timing.h_active, 0, timing.refresh_rate, 0));
}

void nominate_platform_modes(decisions_t *decisions, i32 rate, const platform_values_t &values) {
  const bool is_60 = rate == 60;
  decisions->nominate_modes(is_60 ? values.video_60_priority : values.video_50_priority, COMPOSE_ORIGIN_PRIORITY_LIST);
  decisions->nominate_modes(is_60 ? values.video_60_additional : values.video_50_additional,
                            COMPOSE_ORIGIN_ADDITION_LIST);
  decisions->nominate_modes(is_60 ? values.video_50_priority : values.video_60_priority,
                            COMPOSE_ORIGIN_OTHER_PRIORITY_LIST);
  decisions->nominate_modes(is_60 ? values.video_50_additional : values.video_60_additional,
                            COMPOSE_ORIGIN_OTHER_ADDITION_LIST);
}

void judge_video_modes(decisions_t *decisions, i32 rate, const ll_list_t &ret_modes) {
  for (const auto &mode : walk<const short_video_desc_t>(LIST_AS(decisions->site(), &ret_modes))) {
    compose_decision_t *const decision = decisions->candidate(COMPOSE_SUBJECT_VIDEO_MODE, mode.vic);
    const bool sink_has_it = (decision->origins & sink_origins) != 0;
    decide(decision, COMPOSE_VERDICT_OFFERED,
           sink_has_it ? COMPOSE_REASON_SINK_HAS_IT : COMPOSE_REASON_PLATFORM_ADDS_IT);
  }
  for (auto &decision : walk<compose_decision_t>(LIST_AS(decisions->site(), decisions->list()))) {
    if (decision.subject == COMPOSE_SUBJECT_VIDEO_MODE && decision.verdict == 0) leave_out(&decision, rate);
  }
}

void note_current_mode(decisions_t *decisions, const video_mode_t &mode, u32 vic, compose_reason reason) {
  const bool first = reason == COMPOSE_REASON_CURRENT_MODE_FIRST;
  decisions->note(COMPOSE_SUBJECT_CURRENT_MODE, vic, first ? COMPOSE_VERDICT_OFFERED : COMPOSE_VERDICT_LEFT_OUT, reason,
                  reason_values(mode.width, mode.height, mode.refresh, mode.interlaced));
  if (first) offer_mode(decisions, vic, COMPOSE_ORIGIN_CURRENT_MODE, COMPOSE_REASON_IS_CURRENT_MODE);
}

void offer_mode(decisions_t *decisions, u32 vic, compose_origin origin, compose_reason reason) {
  compose_decision_t *const decision = decisions->nominate(COMPOSE_SUBJECT_VIDEO_MODE, vic, origin, 0);
  if (!is_chosen(*decision)) decide(decision, COMPOSE_VERDICT_OFFERED, reason);
}

}  // namespace edid_composer
