// The steps that bring an audio format into the new EDID.
#include <algorithm>

#include "explain/audio_entry.h"
#include "explain/way.h"
#include "platform/platform_keys.h"
#include "text/hexadecimal.h"

namespace edid_cli {
namespace {

constexpr const char *pass_through_key = "audio.pass_through";
constexpr i32 platform_only = 0;
constexpr i32 sink_only = 2;

/// The bit of a type in the audio masks.
u32 mask_bit(u32 type) {
  constexpr u32 first_extension = 16;
  return 1U << (type >= first_extension ? type - 2 : type - 1);
}

bool is_wanted(const wanted_t &wanted, const short_audio_desc_t &format) {
  return format.type == wanted.code && format.channels >= wanted.channels;
}

/// The key of a platform's own format of a type; empty when it has none.
std::string own_key(const platform_draft_t &platform, u32 type, u32 least_channels) {
  for (const std::string &key : audio_entry_keys()) {
    const auto format = decoded_audio_entry(static_cast<u32>(platform.number(key, 0)));
    if (format && format->type == type && format->channels >= least_channels) {
      return key;
    }
  }
  return "";
}

/// The first after those that are used.
std::string free_key(const platform_draft_t &platform) {
  std::string free;
  for (const std::string &key : audio_entry_keys()) {
    if (platform.find(key) != nullptr) {
      free.clear();
    } else if (free.empty()) {
      free = key;
    }
  }
  return free.empty() ? audio_entry_keys().back() : free;
}

/// The sink's own entry, else the default platform's, else a usual one.
step_t entry_step(const wanted_t &wanted, const trial_t &trial, const explained_t &explained) {
  const audio_entry_t entry = proposed_audio_entry(wanted, explained);
  // Of a type other than PCM only the first entry counts.
  const std::string key = wanted.code == pcm_type ? "" : own_key(trial.platform, wanted.code, 0);
  return {.action = step_action_t::set_key,
          .key = key.empty() ? free_key(trial.platform) : key,
          .value = hex_number(entry.value, 6),
          .remark = entry.remark};
}

step_t pass_through_step() {
  return {.action = step_action_t::set_key,
          .key = pass_through_key,
          .value = "1",
          .remark = "formats of the platform, and all of the sink's"};
}

/// One format of the platform less, the last of another type.
std::optional<step_t> step_that_drops_a_format(const wanted_t &wanted, const trial_t &trial) {
  auto keys = audio_entry_keys();
  std::reverse(keys.begin(), keys.end());
  for (const std::string &key : keys) {
    const auto format = decoded_audio_entry(static_cast<u32>(trial.platform.number(key, 0)));
    if (format && !is_wanted(wanted, *format)) {
      return step_t{.action = step_action_t::take_out_key, .key = key, .remark = "there is room for fewer"};
    }
  }
  return std::nullopt;
}

bool has_no_room(const wanted_t &wanted, const trial_t &trial) {
  return std::any_of(trial.composition.decisions.begin(), trial.composition.decisions.end(), [&](const auto &decision) {
    return decision.subject == COMPOSE_SUBJECT_AUDIO_FORMAT && decision.code == wanted.code &&
           decision.reason == COMPOSE_REASON_NO_ROOM;
  });
}

}  // namespace

std::optional<step_t> step_that_drops_what_breaks(const trial_t &trial) {
  constexpr u32 unknown_type = 0;
  for (const std::string &key : audio_entry_keys()) {
    const auto format = decoded_audio_entry(static_cast<u32>(trial.platform.number(key, 0)));
    if (format && format->type == unknown_type) {
      return step_t{.action = step_action_t::take_out_key,
                    .key = key,
                    .remark = "no EDID can be composed with a format that has no type"};
    }
  }
  return std::nullopt;
}

std::optional<step_t> next_audio_step(const wanted_t &wanted, const trial_t &trial, const explained_t &explained,
                                      opening_t opening) {
  const compose_cfg_t &settings = trial.options.settings;
  const i32 pass_through = std::clamp(trial.platform.number(pass_through_key, platform_only), platform_only, sink_only);
  const bool is_of_platform = !own_key(trial.platform, wanted.code, wanted.channels).empty();
  const bool is_of_sink = sink_audio_entry(wanted, explained).has_value();
  // Chosen, but one format too many: the platform's come before the sink's.
  const bool is_crowded_out = trial.has_room() && has_no_room(wanted, trial);
  const bool is_taken_of_platform = is_of_platform && pass_through != sink_only;
  const bool is_taken_of_sink = is_of_sink && pass_through != platform_only && !is_crowded_out;
  if (!is_taken_of_platform && !is_taken_of_sink) {
    const bool is_opened = is_of_sink && opening == opening_t::wide && pass_through == platform_only;
    return is_of_platform || is_opened ? pass_through_step() : entry_step(wanted, trial, explained);
  }
  if ((settings.audio_mask & mask_bit(wanted.code)) == 0) {
    return step_t{.action = step_action_t::give_option,
                  .key = option_audio_mask,
                  .value = hex_number(settings.audio_mask | mask_bit(wanted.code))};
  }
  if (settings.audio_sink_filter == 1 && !has_no_room(wanted, trial) && trial.has_room()) {
    return step_t{.action = step_action_t::drop_option,
                  .key = option_sink_filter,
                  .remark = "the sink does not have the format, or has less of it"};
  }
  const auto fewer_modes = trial.has_room() ? std::nullopt : step_that_makes_room(wanted, trial);
  return fewer_modes ? fewer_modes : step_that_drops_a_format(wanted, trial);
}

}  // namespace edid_cli
