#include "explain/answer.h"

#include <algorithm>

#include "explain/audio_answer.h"
#include "explain/mode_names.h"
#include "explain/reason_texts.h"
#include "explain/steps.h"

namespace edid_cli {
namespace {

constexpr u32 sink_origins = COMPOSE_ORIGIN_DETAILED_TIMING | COMPOSE_ORIGIN_STANDARD_TIMING |
                             COMPOSE_ORIGIN_SHORT_VIDEO | COMPOSE_ORIGIN_SINK_4K;
/// As many short video descriptors as a data block's length field can hold (CEA-861, section 7.5).
constexpr i32 most_video_modes = 31;
constexpr std::size_t most_4k_entries = 7;
constexpr const char *geometry_key = "geometry_limit";

/// What the two kinds of modes have of their own.
struct mode_kind_t {
  std::string priority;
  std::string addition;
  std::string entry;  ///< As a list's entry is written.
  std::size_t most_entries;
};

mode_kind_t kind_of(const wanted_t &wanted, const explained_t &explained) {
  const std::string number = std::to_string(wanted.code);
  if (wanted.subject == COMPOSE_SUBJECT_4K_MODE) {
    return {platform_list::priority_4k, platform_list::addition_4k, number, most_4k_entries};
  }
  const u32 family = explained.family();
  return {platform_list::priority(family), platform_list::addition(family), "\"" + number + "\"", 0};
}

const compose_decision_t *find(const wanted_t &wanted, const explained_t &explained) {
  const auto &decisions = explained.composition.decisions;
  const auto found = std::find_if(decisions.begin(), decisions.end(), [&wanted](const auto &decision) {
    return decision.subject == static_cast<u32>(wanted.subject) && decision.code == wanted.code;
  });
  return found != decisions.end() ? &*found : nullptr;
}

bool names(const compose_decision_t *decision, u32 origins) {
  return decision != nullptr && (decision->origins & origins) != 0;
}

bool is_too_tall(u32 vic, const explained_t &explained) {
  const compose_decision_t *const limit = find_decision(explained.composition, COMPOSE_SUBJECT_GEOMETRY_LIMIT);
  detailed_timing_t timing{};
  if (limit == nullptr || limit->reason == COMPOSE_REASON_GEOMETRY_UNLIMITED || convert_vic_to_dtd(vic, &timing) != 1) {
    return false;
  }
  return (timing.progressive != 0 ? timing.v_active : 2 * timing.v_active) > limit->code;
}

/// Whether a mode was chosen, with room for it or without.
bool was_chosen(const compose_decision_t &decision) {
  return decision.verdict != COMPOSE_VERDICT_LEFT_OUT || decision.reason == COMPOSE_REASON_NO_ROOM;
}

/// Only the HDMI data block's 3D formats can make it too long.
bool is_block_too_long(const explained_t &explained) {
  const compose_decision_t *const room = find_decision(explained.composition, COMPOSE_SUBJECT_EXTENSION_ROOM);
  return room != nullptr && room->reason == COMPOSE_REASON_BLOCK_TOO_LONG;
}

/// Takes modes out of the priority list, those chosen last first, until there is room for what is wanted.
void make_room(const wanted_t &wanted, bool is_chosen, const explained_t &explained, steps_t &steps) {
  const compose_decision_t *const padding = find_decision(explained.composition, COMPOSE_SUBJECT_PADDING);
  const i32 chosen = (padding != nullptr ? padding->value[0] : 0) + (is_chosen ? 0 : 1);
  std::vector<compose_decision_t> others;
  for (const compose_decision_t &decision : explained.composition.decisions) {
    const bool is_mode = decision.subject == COMPOSE_SUBJECT_VIDEO_MODE && decision.code != wanted.code;
    if (is_mode && was_chosen(decision) && names(&decision, COMPOSE_ORIGIN_PRIORITY_LIST)) {
      others.push_back(decision);
    }
  }
  std::sort(others.begin(), others.end(),
            [](const auto &left, const auto &right) { return left.priority_index > right.priority_index; });
  const std::string list = platform_list::priority(explained.family());
  for (i32 excess = chosen - most_video_modes; excess > 0 && !others.empty(); --excess) {
    if (const list_entry_t *const entry = explained.places.entry(list, others.front().priority_index)) {
      steps.take_entry_out(list, *entry);
    }
    others.erase(others.begin());
  }
}

std::vector<step_t> mode_steps(const wanted_t &wanted, const compose_decision_t *decision,
                               const explained_t &explained) {
  const mode_kind_t kind = kind_of(wanted, explained);
  const bool is_chosen = decision != nullptr && was_chosen(*decision);
  const bool is_4k = wanted.subject == COMPOSE_SUBJECT_4K_MODE;
  steps_t steps(explained);
  steps.announce_extension();
  if (!is_chosen && !names(decision, COMPOSE_ORIGIN_PRIORITY_LIST)) {
    steps.add_entry(kind.priority, kind.entry, "", kind.most_entries);
  }
  if (!is_chosen && !names(decision, sink_origins | COMPOSE_ORIGIN_ADDITION_LIST)) {
    steps.add_entry(kind.addition, kind.entry, "the platform must be able to take it without the sink",
                    kind.most_entries);
  }
  if (is_4k && is_block_too_long(explained)) {
    steps.give_option("--3d", "off: the 3D formats fill the HDMI data block");
  }
  if (!is_4k && !is_chosen && is_too_tall(wanted.code, explained)) {
    steps.set(geometry_key, "0", "modes may then be taller than the sink's tallest");
  }
  if (!is_4k) {
    make_room(wanted, is_chosen, explained, steps);
  }
  return std::move(steps).take();
}

}  // namespace

void add_general_reasons(const explained_t &explained, answer_t &answer) {
  if (!explained.is_extension_announced()) {
    answer.reasons.push_back(
        reason_sentence(*find_decision(explained.composition, COMPOSE_SUBJECT_EXTENSION_ROOM), explained));
  }
}

namespace {

answer_t mode_answer(const wanted_t &wanted, const explained_t &explained) {
  const bool is_4k = wanted.subject == COMPOSE_SUBJECT_4K_MODE;
  const compose_decision_t *const decision = find(wanted, explained);
  answer_t answer;
  answer.name = is_4k ? mode_4k_name(wanted.code) : video_mode_name(wanted.code);
  answer.is_offered = decision != nullptr && is_found_by_sources(*decision, explained);
  answer.reasons.push_back(decision != nullptr ? reason_sentence(*decision, explained)
                                               : "Neither the sink nor any list of the platform names it.");
  if (!answer.is_offered) {
    add_general_reasons(explained, answer);
    answer.steps = mode_steps(wanted, decision, explained);
  }
  return answer;
}

}  // namespace

bool is_found_by_sources(const compose_decision_t &decision, const explained_t &explained) {
  constexpr i32 detailed_timings = 2;
  const bool is_timing = decision.subject == COMPOSE_SUBJECT_VIDEO_MODE && decision.position < detailed_timings;
  return decision.verdict != COMPOSE_VERDICT_LEFT_OUT && (explained.is_extension_announced() || is_timing);
}

answer_t answer(const wanted_t &wanted, const explained_t &explained) {
  return wanted.subject == COMPOSE_SUBJECT_AUDIO_FORMAT ? audio_answer(wanted.code, explained)
                                                        : mode_answer(wanted, explained);
}

}  // namespace edid_cli
