#include "inputs.h"

#include <algorithm>
#include <charconv>
#include <iterator>

#include "commands/platform_settings.h"
#include "commands/shared_options.h"
#include "config_store.h"
#include "edid_input/edid_file.h"
#include "io/bad_input.h"
#include "text/utf8_text.h"

namespace edid_web {
namespace {

using edid_cli::bad_input_t;

constexpr const char *default_platform_name = "default platform";

/// Takes "12:" from the front; 0 where there is none.
unsigned take_number(std::string_view &text) {
  unsigned number = 0;
  const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), number);
  const auto length = static_cast<std::size_t>(end - text.data());
  if (error != std::errc() || length >= text.size() || text[length] != ':') {
    return 0;
  }
  text.remove_prefix(length + 1);
  return number;
}

/// Of "name:line:column: what is wrong", whose numbers may be missing.
complaint_t platform_complaint(const std::string &error, const std::string &name) {
  std::string_view rest = error;
  complaint_t complaint{"platform", error};
  if (rest.starts_with(name + ":")) {
    rest.remove_prefix(name.size() + 1);
    complaint.line = take_number(rest);
    complaint.column = take_number(rest);
    complaint.text = rest.substr(std::min(rest.find_first_not_of(' '), rest.size()));
  }
  return complaint;
}

json_t json_complaint(const complaint_t &complaint) {
  json_t json{{"place", complaint.place}, {"text", edid_cli::valid_utf8(complaint.text)}};
  if (!complaint.name.empty()) {
    json["name"] = complaint.name;
  }
  if (complaint.line != 0) {
    json["line"] = complaint.line;
    json["column"] = complaint.column;
  }
  return json;
}

}  // namespace

json_t json_complaints(const std::vector<complaint_t> &complaints) {
  json_t list = json_t::array();
  std::transform(complaints.begin(), complaints.end(), std::back_inserter(list), json_complaint);
  return list;
}

json_t setting_descriptions() {
  edid_cli::composition_options_t unused;
  json_t list = json_t::array();
  for (const edid_cli::option_t &option : edid_cli::setting_options(unused)) {
    list.push_back({{"name", edid_cli::setting_name(option)},
                    {"value", option.value_name},
                    {"description", option.description},
                    {"is_flag", static_cast<bool>(option.set)}});
  }
  return list;
}

std::string name_of(const json_t &file) {
  return file.at("name").get<std::string>();
}

std::string text_of(const json_t &file) {
  return file.at("text").get<std::string>();
}

inputs_t::inputs_t(const json_t &request) {
  options.debug = request.value("debug", false);
  take_settings(request.value("settings", json_t::object()));
  load_platform(request.value("platform", json_t()));
  read_sink(request.value("sink", json_t()));
}

std::string inputs_t::platform_text() const {
  return platform_text_;
}

/// A text that is empty and a flag that is false stand for an option that is not given.
void inputs_t::take_settings(const json_t &settings) {
  for (const edid_cli::option_t &option : edid_cli::setting_options(options)) {
    const std::string name = edid_cli::setting_name(option);
    const json_t value = settings.value(name, json_t());
    if (value.is_null() || value == "" || value == false) {
      continue;
    }
    try {
      option.set ? option.set() : option.take(value.get<std::string>());
      options.given.insert(name);
    } catch (const bad_input_t &problem) {
      complaints.push_back({"setting", problem.what(), name});
    }
  }
  if (options.ports.first != options.ports.last) {
    complaints.push_back({"setting", "one port, not a range of them", "port"});
  }
}

void inputs_t::load_platform(const json_t &platform) {
  if (platform.is_null()) {
    platform_name = default_platform_name;
    platform_text_ = config_store_default_text();
    is_platform_loaded = config_store_load_default();
  } else {
    platform_name = name_of(platform);
    platform_text_ = text_of(platform);
    options.platform_file = platform_name;
    is_platform_loaded = config_store_load_text(platform_text_.data(), platform_text_.size(), platform_name.c_str());
  }
  if (!is_platform_loaded) {
    complaints.push_back(platform_complaint(config_store_error(), platform_name));
    return;
  }
  try {
    edid_cli::require_platform_settings(options);
  } catch (const bad_input_t &problem) {
    complaints.push_back(platform_complaint(problem.what(), platform_name));
  }
}

void inputs_t::read_sink(const json_t &file) {
  if (file.is_null()) {
    return;
  }
  try {
    sink.name = name_of(file);
    sink.bytes = edid_cli::edid_of(text_of(file), sink.name);
  } catch (const bad_input_t &problem) {
    complaints.push_back({"sink", problem.what()});
  }
}

}  // namespace edid_web
