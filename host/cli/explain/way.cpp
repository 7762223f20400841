#include "explain/way.h"

#include <algorithm>

namespace edid_cli {
namespace {

/// More than the modes and formats that have to make room for one.
constexpr std::size_t most_steps = 96;

std::optional<step_t> announcing_step(const trial_t &trial) {
  if (trial.is_extension_announced()) {
    return std::nullopt;
  }
  return step_t{.action = step_action_t::set_key,
                .key = "monitor_name",
                .value = "\"Box\"",
                .remark = "or another name of 2 to 13 characters; without one sources do not read the extension"};
}

std::optional<step_t> next_step(const wanted_t &wanted, const trial_t &trial, const explained_t &explained,
                                opening_t opening) {
  if (!trial.composition.is_composed) {
    return step_that_drops_what_breaks(trial);
  }
  if (auto step = announcing_step(trial)) {
    return step;
  }
  switch (wanted.subject) {
    case COMPOSE_SUBJECT_AUDIO_FORMAT:
      return next_audio_step(wanted, trial, explained, opening);
    case COMPOSE_SUBJECT_DEEP_COLOR:
    case COMPOSE_SUBJECT_3D:
      return next_setting_step(wanted, trial, explained);
    case COMPOSE_SUBJECT_HDR:
    case COMPOSE_SUBJECT_COLORIMETRY:
    case COMPOSE_SUBJECT_YCBCR_420:
    case COMPOSE_SUBJECT_ALLM:
    case COMPOSE_SUBJECT_VRR:
    case COMPOSE_SUBJECT_PASSED_BLOCK:
      return next_feature_step(wanted, trial);
    default:
      return next_mode_step(wanted, trial);
  }
}

bool is_same(const step_t &left, const step_t &right) {
  return left.action == right.action && left.key == right.key && left.value == right.value;
}

/// Without the steps that the others do without.
steps_t shortened(const wanted_t &wanted, const trials_t &trials, steps_t steps) {
  for (std::size_t index = 0; index < steps.size();) {
    steps_t fewer = steps;
    fewer.erase(fewer.begin() + static_cast<std::ptrdiff_t>(index));
    if (trials.run(wanted, fewer).is_reached) {
      steps = std::move(fewer);
    } else {
      ++index;
    }
  }
  return steps;
}

}  // namespace

std::optional<steps_t> find_way(const wanted_t &wanted, const trials_t &trials, opening_t opening) {
  steps_t steps;
  while (steps.size() < most_steps) {
    const trial_t trial = trials.run(wanted, steps);
    if (trial.is_reached) {
      return shortened(wanted, trials, std::move(steps));
    }
    auto step = next_step(wanted, trial, trials.explained(), opening);
    const bool is_known =
        step && std::any_of(steps.begin(), steps.end(), [&step](const step_t &other) { return is_same(other, *step); });
    if (!step || is_known) {
      return std::nullopt;
    }
    steps.push_back(std::move(*step));
  }
  return std::nullopt;
}

}  // namespace edid_cli
