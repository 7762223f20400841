// The steps that bring a video mode or a 4Kx2K mode into the new EDID, or one of the settings.
#include <algorithm>

#include "edid_text/mode_names.h"
#include "explain/way.h"
#include "platform/platform_places.h"

namespace edid_cli {
namespace {

constexpr std::size_t most_4k_entries = 7;
constexpr std::size_t most_extended_entries = HDMI2_MOST_LISTED_VICS;

/// The lists of one kind of mode, and how an entry of them is written.
struct mode_lists_t {
  std::string priority;
  std::string addition;
  std::string value;
  std::size_t most_entries;  ///< 0: any number.
};

mode_lists_t lists_of(const wanted_t &wanted, const trial_t &trial) {
  const std::string number = std::to_string(wanted.code);
  if (wanted.subject == COMPOSE_SUBJECT_4K_MODE) {
    return {platform_list::priority_4k, platform_list::addition_4k, number, most_4k_entries};
  }
  if (wanted.subject == COMPOSE_SUBJECT_EXTENDED_MODE) {
    return {platform_list::priority_extended, platform_list::addition_extended, number, most_extended_entries};
  }
  return {platform_list::priority(trial.family()), platform_list::addition(trial.family()), quoted(number), 0};
}

/// The last entry gives way where the list takes no more.
step_t adding_step(const std::string &list, const mode_lists_t &lists, const trial_t &trial,
                   const std::string &remark) {
  const draft_entry_t *const entry = trial.platform.find(list);
  const std::size_t entries = entry != nullptr && entry->is_list ? entry->values.size() : 0;
  if (lists.most_entries != 0 && entries >= lists.most_entries) {
    const std::string limit = "the list takes " + std::to_string(lists.most_entries) + " entries";
    return {.action = step_action_t::replace_in_list,
            .key = list,
            .value = lists.value,
            .old_value = entry->values[lists.most_entries - 1].text,
            .remark = remark.empty() ? limit : limit + "; " + remark};
  }
  return {.action = step_action_t::add_to_list, .key = list, .value = lists.value, .remark = remark};
}

bool was_chosen(const compose_decision_t &decision) {
  return decision.verdict != COMPOSE_VERDICT_LEFT_OUT || decision.reason == COMPOSE_REASON_NO_ROOM;
}

bool is_block_too_long(const trial_t &trial) {
  const compose_decision_t *const room = find_decision(trial.composition, COMPOSE_SUBJECT_EXTENSION_ROOM);
  return room != nullptr && room->reason == COMPOSE_REASON_BLOCK_TOO_LONG;
}

step_t option_3d_step(const std::string &value, const std::string &remark) {
  return {.action = step_action_t::give_option, .key = option_3d, .value = value, .remark = remark};
}

}  // namespace

std::optional<step_t> step_that_makes_room(const wanted_t &wanted, const trial_t &trial) {
  const bool has_3d = trial.options.settings.hdmi_3d_mode != no_3d_mode && wanted.subject != COMPOSE_SUBJECT_3D;
  if (has_3d && is_block_too_long(trial)) {
    return option_3d_step("off", "the 3D formats fill the HDMI data block");
  }
  const std::string list = platform_list::priority(trial.family());
  const draft_entry_t *const entry = trial.platform.find(list);
  if (entry == nullptr) {
    return std::nullopt;
  }
  for (auto value = entry->values.rbegin(); value != entry->values.rend(); ++value) {
    const u32 vic = leading_number(value->text);
    const compose_decision_t *const decision = trial.find(COMPOSE_SUBJECT_VIDEO_MODE, vic);
    const bool is_wanted = wanted.subject == COMPOSE_SUBJECT_VIDEO_MODE && wanted.code == vic;
    if (!is_wanted && decision != nullptr && was_chosen(*decision)) {
      return step_t{.action = step_action_t::take_out_of_list,
                    .key = list,
                    .value = value->text,
                    .remark = "there is room for fewer"};
    }
  }
  return std::nullopt;
}

std::optional<step_t> next_mode_step(const wanted_t &wanted, const trial_t &trial) {
  if (wanted.subject == COMPOSE_SUBJECT_EXTENDED_MODE && !has_hdmi2(trial.composition)) {
    return step_that_enables_hdmi2();
  }
  const mode_lists_t lists = lists_of(wanted, trial);
  const compose_decision_t *const decision = trial.find(wanted.subject, wanted.code);
  if (decision == nullptr) {
    return adding_step(lists.priority, lists, trial, "");
  }
  switch (decision->reason) {
    case COMPOSE_REASON_NOT_IN_PRIORITY_LIST:
    case COMPOSE_REASON_OTHER_REFRESH_FAMILY:
      return adding_step(lists.priority, lists, trial, "");
    case COMPOSE_REASON_ABOVE_RATE:
    case COMPOSE_REASON_SINK_HAS_IT_IN_420:
      return next_rate_step(wanted, trial);
    case COMPOSE_REASON_NOT_AVAILABLE:
      return adding_step(lists.addition, lists, trial, "the platform must be able to take it without the sink");
    case COMPOSE_REASON_TALLER_THAN_SINK:
      return step_t{.action = step_action_t::set_key,
                    .key = "geometry_limit",
                    .value = "0",
                    .remark = "modes may then be taller than the sink's tallest"};
    default:
      break;
  }
  if (!was_chosen(*decision)) {
    return std::nullopt;
  }
  return step_that_makes_room(wanted, trial);
}

std::optional<step_t> next_setting_step(const wanted_t &wanted, const trial_t &trial, const explained_t &explained) {
  const edid_t &sink = explained.sink;
  if (wanted.subject == COMPOSE_SUBJECT_3D) {
    const compose_decision_t *const decision = find_decision(trial.composition, COMPOSE_SUBJECT_3D);
    const bool is_off = decision != nullptr && decision->reason == COMPOSE_REASON_3D_OFF;
    if (decision != nullptr && decision->verdict != COMPOSE_VERDICT_LEFT_OUT) {
      return step_that_makes_room(wanted, trial);
    }
    return is_off && sink.hdmi_3d_present != 0
               ? option_3d_step("sink", "the sink has it")
               : option_3d_step("on",
                                "the sink does not have it: the platform must be able to take it without the sink");
  }
  constexpr u32 never_offered = 48;
  if (wanted.code == never_offered) {
    return std::nullopt;
  }
  const bool is_of_sink = wanted.code == 30 ? sink.dc_30bit != 0 : sink.dc_36bit != 0;
  const std::string key = wanted.code == 30 ? "dc_30bit" : "dc_36bit";
  if (trial.platform.number(key, 0) != 0) {
    return step_that_makes_room(wanted, trial);
  }
  return step_t{
      .action = step_action_t::set_key,
      .key = key,
      .value = "1",
      .remark = is_of_sink ? "the sink has it" : "the sink does not have it, which the library does not look at"};
}

}  // namespace edid_cli
