// The steps that bring what HDMI 2 added into the new EDID.
#include <algorithm>

#include "edid_text/mode_names.h"
#include "explain/hdmi2_features.h"
#include "explain/way.h"
#include "platform/platform_places.h"

namespace edid_cli {
namespace {

constexpr const char *limit_key = "hdmi2.tmds_limit";
constexpr const char *y420_key = "hdmi2.y420";
constexpr u32 highest_limit = 600;
constexpr u32 least_420_khz = 590'000;

step_t setting(const std::string &key, u32 value, const std::string &remark) {
  return {.action = step_action_t::set_key, .key = key, .value = std::to_string(value), .remark = remark};
}

/// A clock as a rate that blocks can declare, in MHz.
u32 rate_of(u32 khz) {
  return (khz + 4999) / 5000 * 5;
}

struct rates_t {
  u32 box;
  u32 sink;
};

rates_t rates_of(const trial_t &trial) {
  const compose_decision_t *const rate = find_decision(trial.composition, COMPOSE_SUBJECT_LINK_RATE);
  return rate == nullptr ? rates_t{0, 0} : rates_t{static_cast<u32>(rate->value[0]), static_cast<u32>(rate->value[1])};
}

/// What the box's receiver has to take; none where it takes it already, or none can.
std::optional<step_t> step_to_rate(u32 rate, const trial_t &trial) {
  if (rate > highest_limit || rate <= rates_of(trial).box) {
    return std::nullopt;
  }
  return setting(limit_key, rate, "the box's receiver must take it");
}

/// The decision about a feature, whatever number it has.
const compose_decision_t *decision_on(const wanted_t &wanted, const trial_t &trial) {
  const hdmi2_feature_t *const feature = find_hdmi2_feature(wanted.subject, wanted.code);
  return feature != nullptr && feature->code != any_code ? trial.find(wanted.subject, wanted.code)
                                                         : find_decision(trial.composition, wanted.subject);
}

std::optional<step_t> step_for_tri_state(const wanted_t &wanted, const hdmi2_feature_t &feature,
                                         const compose_decision_t &decision) {
  const bool sink_has_it = decision.value[1] != 0;
  if (wanted.subject == COMPOSE_SUBJECT_PASSED_BLOCK) {
    return sink_has_it ? std::optional(setting(feature.key, 1, "")) : std::nullopt;
  }
  return sink_has_it ? setting(feature.key, 2, "the sink has it")
                     : setting(feature.key, 1, "the sink does not have it: the box must do it itself");
}

/// Wider limits of the box; where the sink's alone are no range, there is nothing to set.
std::optional<step_t> step_for_vrr_range(const trial_t &trial) {
  constexpr i32 lowest = 1;
  constexpr i32 lowest_by_default = 48;
  if (trial.platform.number("hdmi2.vrr_max", 0) != 0) {
    return setting("hdmi2.vrr_max", 0, "without a limit of the box's own");
  }
  if (trial.platform.number("hdmi2.vrr_min", lowest_by_default) > lowest) {
    return setting("hdmi2.vrr_min", lowest, "the box must take refresh rates that low");
  }
  return std::nullopt;
}

/// 4:2:0 is only seen in modes that are fast enough for it: the first of those that are usual.
std::optional<step_t> step_for_mode_in_420(const trial_t &trial) {
  constexpr u32 vic_2160p60 = 97;
  return next_mode_step({COMPOSE_SUBJECT_EXTENDED_MODE, vic_2160p60}, trial);
}

}  // namespace

step_t step_that_enables_hdmi2() {
  return setting("hdmi2.enable", 1, "");
}

std::optional<step_t> next_rate_step(const wanted_t &wanted, const trial_t &trial) {
  const u32 clock = pixel_clock_of_vic(wanted.code);
  const auto [box, sink] = rates_of(trial);
  if (const auto step = rate_of(clock) <= sink ? step_to_rate(rate_of(clock), trial) : std::nullopt) {
    return step;
  }
  const bool can_be_420 = clock >= least_420_khz;
  if (can_be_420 && rate_of(clock / 2) <= sink) {
    constexpr i32 as_the_sink = 2;
    if (trial.platform.number(y420_key, 0) != as_the_sink) {
      return setting(y420_key, as_the_sink,
                     "it needs half of the rate in YCbCr 4:2:0, where the sink takes it in that");
    }
    if (const auto step = step_to_rate(rate_of(clock / 2), trial)) {
      return step;
    }
  }
  const draft_entry_t *const addition = trial.platform.find(platform_list::addition_extended);
  const std::string number = std::to_string(wanted.code);
  const bool is_added = addition != nullptr && std::any_of(addition->values.begin(), addition->values.end(),
                                                           [&](const auto &value) { return value.text == number; });
  if (!is_added) {
    return step_t{.action = step_action_t::add_to_list,
                  .key = platform_list::addition_extended,
                  .value = number,
                  .remark = "the sink takes " + std::to_string(sink) + " MHz, so the box must make it itself"};
  }
  return step_to_rate(rate_of(clock), trial);
}

std::optional<step_t> next_feature_step(const wanted_t &wanted, const trial_t &trial) {
  if (!has_hdmi2(trial.composition)) {
    return step_that_enables_hdmi2();
  }
  const compose_decision_t *const decision = decision_on(wanted, trial);
  const hdmi2_feature_t *const feature = find_hdmi2_feature(wanted.subject, wanted.code);
  if (decision == nullptr || feature == nullptr) {
    return std::nullopt;
  }
  switch (decision->reason) {
    case COMPOSE_REASON_OFF:
    case COMPOSE_REASON_SINK_WITHOUT:
      return step_for_tri_state(wanted, *feature, *decision);
    case COMPOSE_REASON_VRR_RANGE_INVALID:
      return step_for_vrr_range(trial);
    case COMPOSE_REASON_VRR_CHANGED:
      return trial.platform.number("hdmi2.vrr", 0) != 2
                 ? std::optional(setting("hdmi2.vrr", 2, "the block has the sink's range"))
                 : step_for_vrr_range(trial);
    case COMPOSE_REASON_RATE_BELOW_BLOCK:
      return static_cast<u32>(decision->value[0]) <= rates_of(trial).sink
                 ? step_to_rate(rate_of(static_cast<u32>(decision->value[0]) * 1000), trial)
                 : std::nullopt;
    case COMPOSE_REASON_NO_MODE_IN_420:
      return step_for_mode_in_420(trial);
    case COMPOSE_REASON_NO_ROOM:
      return step_that_makes_room(wanted, trial);
    default:
      return std::nullopt;
  }
}

}  // namespace edid_cli
