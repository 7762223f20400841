#include "explain/step.h"

#include <algorithm>

#include "platform/platform_keys.h"
#include "text/whole_number.h"

namespace edid_cli {
namespace {

constexpr const char *action_ids[] = {"add to list", "take out of list", "replace in list", "set",
                                      "take out",    "give option",      "drop option"};

/// Where a step's value, or its key, stands in the platform's file.
unsigned line_of(const step_t &step, const platform_draft_t &original) {
  const draft_entry_t *const entry = original.find(step.key);
  if (entry == nullptr) {
    return 0;
  }
  const bool is_of_value =
      step.action == step_action_t::take_out_of_list || step.action == step_action_t::replace_in_list;
  const std::string &value = step.action == step_action_t::replace_in_list ? step.old_value : step.value;
  const auto found = std::find_if(entry->values.rbegin(), entry->values.rend(),
                                  [&value](const draft_value_t &one) { return one.text == value; });
  return is_of_value && found != entry->values.rend() ? found->line : entry->line;
}

/// The line that a new key of an inner table follows.
unsigned last_line_of(const std::string &table, const platform_draft_t &original) {
  unsigned line = 0;
  for (const draft_entry_t &entry : original.entries()) {
    for (const draft_value_t &value : entry.values) {
      line = inner_table_of(entry.key) == table ? std::max({line, entry.line, value.line}) : line;
    }
  }
  return line;
}

std::string place(unsigned line, const std::string &platform_name) {
  return line == 0 ? platform_name : platform_name + ":" + std::to_string(line);
}

std::string table_of(const std::string &key) {
  const std::string table = inner_table_of(key);
  return table.empty() ? std::string(platform_domain) : platform_path(table);
}

std::string key_in_table(const std::string &key) {
  return table_of(key) == platform_domain ? key : key.substr(key.find('.') + 1);
}

/// With a key that is not there yet.
std::string adding_text(const std::string &key, const std::string &value, const platform_draft_t &original,
                        const std::string &where) {
  const std::string table = inner_table_of(key);
  const unsigned neighbour = table.empty() ? 0 : last_line_of(table, original);
  return "add " + key_in_table(key) + " = " + value + " to the table " + table_of(key) + " of " + where +
         (neighbour != 0 ? ", after line " + std::to_string(neighbour) : "");
}

std::string set_text(const step_t &step, const platform_draft_t &original, const std::string &where) {
  if (step.line != 0) {
    return "set " + step.key + " = " + step.value + " (" + where + ")";
  }
  return adding_text(step.key, step.value, original, where);
}

std::string text_of(const step_t &step, const platform_draft_t &original, const std::string &platform_name) {
  const std::string where = place(step.line, platform_name);
  switch (step.action) {
    case step_action_t::add_to_list:
      return step.line != 0 ? "add " + step.value + " to " + step.key + " (" + where + ")"
                            : adding_text(step.key, "[" + step.value + "]", original, where);
    case step_action_t::take_out_of_list:
      return "take " + step.value + " out of " + step.key + " (" + where + ")";
    case step_action_t::replace_in_list:
      return "write " + step.value + " in place of " + step.old_value + " in " + step.key + " (" + where + ")";
    case step_action_t::set_key:
      return set_text(step, original, where);
    case step_action_t::take_out_key:
      return "take " + step.key + " out (" + where + ")";
    case step_action_t::give_option:
      return "give " + step.key + " " + step.value;
    case step_action_t::drop_option:
      return "leave " + step.key + " away";
  }
  return "";
}

i32 mode_3d(const std::string &value) {
  return value == "on" ? always_3d_mode : value == "off" ? no_3d_mode : follow_sink_3d_mode;
}

void apply_option(const step_t &step, composition_options_t &options) {
  if (step.key == option_3d) {
    options.settings.hdmi_3d_mode = mode_3d(step.value);
  } else if (step.key == option_audio_mask) {
    options.settings.audio_mask = parse_whole_number(step.value.substr(2), 16).value_or(all_audio_formats);
  } else if (step.key == option_sink_filter) {
    options.settings.audio_sink_filter = step.action == step_action_t::give_option ? 1 : 0;
  }
}

}  // namespace

const char *step_action_id(step_action_t action) {
  return action_ids[static_cast<std::size_t>(action)];
}

steps_t described(steps_t steps, const platform_draft_t &original, const std::string &platform_name) {
  for (step_t &step : steps) {
    step.line = line_of(step, original);
    step.text = text_of(step, original, platform_name) + (step.remark.empty() ? "" : ": " + step.remark);
  }
  return steps;
}

void apply(const steps_t &steps, platform_draft_t &platform, composition_options_t &options) {
  for (const step_t &step : steps) {
    switch (step.action) {
      case step_action_t::add_to_list:
        platform.add_to_list(step.key, step.value);
        break;
      case step_action_t::take_out_of_list:
        platform.take_out_of_list(step.key, step.value);
        break;
      case step_action_t::replace_in_list:
        platform.replace_in_list(step.key, step.old_value, step.value);
        break;
      case step_action_t::set_key:
        platform.set(step.key, step.value);
        break;
      case step_action_t::take_out_key:
        platform.erase(step.key);
        break;
      case step_action_t::give_option:
      case step_action_t::drop_option:
        apply_option(step, options);
        break;
    }
  }
}

}  // namespace edid_cli
