// One change of the platform or of the command line.
#pragma once

#include <string>
#include <vector>

#include "composition/composition_options.h"
#include "explain/platform_draft.h"

namespace edid_cli {

enum class step_action_t {
  add_to_list,
  take_out_of_list,
  replace_in_list,
  set_key,
  take_out_key,
  give_option,
  drop_option
};

struct step_t {
  step_action_t action{};
  std::string key;          ///< Of the platform, or the option.
  std::string value{};      ///< As it is written in the file or on the command line.
  std::string old_value{};  ///< What is replaced.
  std::string remark{};     ///< What is to be known of it.
  unsigned line = 0;        ///< Of the platform's file; 0: it is not there, or an option.
  std::string text{};       ///< All of it in words, made by described().
};

/// What has to be done, all of it.
using steps_t = std::vector<step_t>;

/// The options that steps are about.
inline constexpr const char *option_3d = "--3d";
inline constexpr const char *option_audio_mask = "--audio-mask";
inline constexpr const char *option_sink_filter = "--audio-sink-filter";

/// "set", for programs.
const char *step_action_id(step_action_t action);

/// The steps with their lines and their words, for the platform as it is in its file.
steps_t described(steps_t steps, const platform_draft_t &original, const std::string &platform_name);

/// Does what the steps say.
void apply(const steps_t &steps, platform_draft_t &platform, composition_options_t &options);

}  // namespace edid_cli
