#include "edid_composer/explain/decisions.h"

#include <iterator>

#include "linked_list/typed_list.h"

namespace edid_composer {
namespace {

REPORTS_AS(compose_edid_internal);

constexpr i32 nowhere = -1;

constexpr compose_decision_t undecided(compose_subject subject, u32 code) {
  return {.size = sizeof(compose_decision_t),
          .subject = subject,
          .code = code,
          .verdict = 0,
          .reason = 0,
          .origins = 0,
          .sink_index = nowhere,
          .priority_index = nowhere,
          .addition_index = nowhere,
          .position = nowhere,
          .value = {}};
}

/// Where the place in a list that names a candidate is kept.
i32 compose_decision_t::*place_of(compose_origin origin) {
  switch (origin) {
    case COMPOSE_ORIGIN_DETAILED_TIMING:
    case COMPOSE_ORIGIN_STANDARD_TIMING:
    case COMPOSE_ORIGIN_SHORT_VIDEO:
    case COMPOSE_ORIGIN_SINK_4K:
    case COMPOSE_ORIGIN_SINK_AUDIO:
    case COMPOSE_ORIGIN_SINK_420:
      return &compose_decision_t::sink_index;
    case COMPOSE_ORIGIN_PRIORITY_LIST:
    case COMPOSE_ORIGIN_OTHER_PRIORITY_LIST:
    case COMPOSE_ORIGIN_PLATFORM_AUDIO:
      return &compose_decision_t::priority_index;
    case COMPOSE_ORIGIN_ADDITION_LIST:
    case COMPOSE_ORIGIN_OTHER_ADDITION_LIST:
      return &compose_decision_t::addition_index;
    case COMPOSE_ORIGIN_CURRENT_MODE:
    case COMPOSE_ORIGIN_LIBRARY:
      break;
  }
  return nullptr;
}

}  // namespace

void decide(compose_decision_t *decision, compose_verdict verdict, compose_reason reason, reason_values_t values) {
  decision->verdict = verdict;
  decision->reason = reason;
  decision->value[0] = values.first;
  decision->value[1] = values.second;
  decision->value[2] = values.third;
  decision->value[3] = values.fourth;
}

compose_decision_t *decisions_t::add(compose_subject subject, u32 code) {
  compose_decision_t *const added = decisions_.add(undecided(subject, code), site);
  if (added != nullptr) return added;
  complete_ = false;
  unheard_ = undecided(subject, code);
  return &unheard_;
}

compose_decision_t **decisions_t::place_of_mode(compose_subject subject, u32 code) {
  return subject == COMPOSE_SUBJECT_VIDEO_MODE && code < std::size(modes_) ? &modes_[code] : nullptr;
}

compose_decision_t *decisions_t::candidate(compose_subject subject, u32 code) {
  compose_decision_t **const place = place_of_mode(subject, code);
  if (place != nullptr) {
    if (*place == nullptr) *place = add(subject, code);
    return *place;
  }
  for (compose_decision_t &decision : decisions_) {
    if (decision.subject == subject && decision.code == code) return &decision;
  }
  return add(subject, code);
}

compose_decision_t *decisions_t::nominate(compose_subject subject, u32 code, compose_origin origin, i32 index) {
  compose_decision_t *const decision = candidate(subject, code);
  decision->origins |= origin;
  if (i32 compose_decision_t::*const place = place_of(origin); place != nullptr && decision->*place == nowhere) {
    decision->*place = index;
  }
  return decision;
}

void decisions_t::nominate_modes(const ll_list_t &modes, compose_origin origin, u32 largest_vic) {
  if (!is_walkable<short_video_desc_t>(modes)) return;
  i32 index = 0;
  for (const auto &mode : walk<const short_video_desc_t>(LIST(&modes, "&modes"))) {
    if (mode.vic <= largest_vic) nominate(COMPOSE_SUBJECT_VIDEO_MODE, mode.vic, origin, index);
    ++index;
  }
}

void decisions_t::note(compose_subject subject, u32 code, compose_verdict verdict, compose_reason reason,
                       reason_values_t values) {
  decide(add(subject, code), verdict, reason, values);
}

void decisions_t::pass_on(compose_observer_t observer, void *context) const {
  if (!complete_) return;
  for (const compose_decision_t &decision : decisions_)
    observer(&decision, context);
}

}  // namespace edid_composer
