#include "commands/platform_settings.h"

#include <algorithm>
#include <iterator>

#include "commands/shared_options.h"
#include "io/bad_input.h"
#include "io/input.h"
#include "io/standard_output.h"
#include "platform/nearest_name.h"

namespace edid_cli {
namespace {

/// A value as it would stand on the command line. A list has commas between its entries.
std::string option_text(const configuration_node_t &node, bool is_unsigned) {
  if (const auto number = node.integer()) {
    return is_unsigned ? std::to_string(static_cast<u32>(*number)) : std::to_string(*number);
  }
  if (const auto text = node.text()) {
    return *text;
  }
  std::string joined;
  for (const configuration_node_t &entry : node.children()) {
    joined += (joined.empty() ? "" : ",") + option_text(entry, is_unsigned);
  }
  return joined;
}

class taker_t {
 public:
  explicit taker_t(composition_options_t &options) : options_(options), settings_(setting_options(options)) {}

  findings_t run() && {
    if (const auto table = configuration_node_t::find(settings_table)) {
      for (const configuration_node_t &key : table->children()) {
        take(key);
      }
    }
    return std::move(findings_);
  }

 private:
  void refuse(const configuration_node_t &key, std::string text) {
    findings_.push_back(
        {severity_t::error, key.position(), std::string(settings_table) + "." + key.name(), std::move(text)});
  }

  void take(const configuration_node_t &key) {
    const std::string name = key.name();
    const auto setting = std::find_if(settings_.begin(), settings_.end(),
                                      [&name](const option_t &option) { return setting_name(option) == name; });
    if (setting == settings_.end()) {
      refuse_unknown(key);
    } else if (!options_.given.contains(name)) {
      take_value(key, *setting);
    }
  }

  void take_value(const configuration_node_t &key, const option_t &setting) {
    if (setting.set) {
      const auto value = key.integer();
      if (!value || (*value != 0 && *value != 1)) {
        refuse(key, "is not true or false");
      } else if (*value == 1) {
        setting.set();
      }
      return;
    }
    try {
      // Masks have 32 bits.
      setting.take(option_text(key, setting.value_name == "MASK"));
    } catch (const bad_input_t &problem) {
      refuse(key, problem.what());
    }
  }

  void refuse_unknown(const configuration_node_t &key) {
    std::vector<std::string> names;
    std::transform(settings_.begin(), settings_.end(), std::back_inserter(names), setting_name);
    const auto nearest = nearest_name(key.name(), names);
    refuse(key, "there is no such setting" + (nearest ? ": did you mean " + *nearest + "?" : std::string()));
  }

  composition_options_t &options_;
  std::vector<option_t> settings_;
  findings_t findings_;
};

}  // namespace

findings_t take_platform_settings(composition_options_t &options) {
  return taker_t(options).run();
}

void require_platform_settings(composition_options_t &options) {
  const findings_t findings = take_platform_settings(options);
  if (!findings.empty()) {
    const finding_t &first = findings.front();
    // The default platform has no mistakes.
    throw bad_input_t(input_name(options.platform_file.value_or("")) + ":" + std::to_string(first.position.line) + ":" +
                      std::to_string(first.position.column) + ": " + first.key + ": " + first.text);
  }
}

platform_check_t check_platform_with_settings(std::span<const named_sink_t> sinks) {
  // The findings say in other words what the library prints.
  const discarded_output_t unseen;
  composition_options_t options;
  const findings_t wrong_settings = take_platform_settings(options);
  platform_check_t check = check_platform(options.settings, sinks);
  check.findings.insert(check.findings.end(), wrong_settings.begin(), wrong_settings.end());
  sort_findings(check.findings);
  return check;
}

}  // namespace edid_cli
