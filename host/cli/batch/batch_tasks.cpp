#include "batch/batch_tasks.h"

#include <algorithm>
#include <filesystem>
#include <map>
#include <set>

#include "edid_input/sink_folder.h"
#include "io/bad_input.h"
#include "io/input.h"

namespace edid_cli {
namespace {

namespace fs = std::filesystem;

constexpr std::string_view sink_field = "{sink}";
constexpr std::string_view port_field = "{port}";

bool is_folder(const std::string &path) {
  std::error_code ignored;
  return fs::is_directory(path, ignored);
}

/// What stands for each sink in file names: its name without the ending, unless another sink's is the same.
std::vector<std::string> short_names_of(const std::vector<std::string> &files) {
  std::map<std::string, int> uses;
  for (const std::string &file : files) {
    ++uses[fs::path(file).stem().string()];
  }
  std::vector<std::string> names;
  for (const std::string &file : files) {
    const std::string stem = fs::path(file).stem().string();
    names.push_back(uses[stem] == 1 ? stem : file);
  }
  return names;
}

std::string name_of_only_sink(const composition_options_t &options) {
  if (!options.sink) {
    return "none";
  }
  return *options.sink == standard_stream ? "stdin" : fs::path(*options.sink).stem().string();
}

/// Beside a file, with another ending than that of EDIDs, and one more where another file has that name.
std::string log_file_of(std::string file, std::string_view ending, const std::set<std::string> &taken) {
  if (file.ends_with(ending)) {
    file.resize(file.size() - ending.size());
  }
  do {
    file += ".log";
  } while (taken.contains(file));
  return file;
}

std::string replaced(std::string text, std::string_view field, const std::string &value) {
  for (std::size_t at = 0; (at = text.find(field, at)) != std::string::npos; at += value.size()) {
    text.replace(at, field.size(), value);
  }
  return text;
}

bool has_field(const std::string &text, std::string_view field) {
  return text.find(field) != std::string::npos;
}

/// The pattern of file names. A folder is made where it is missing.
std::string pattern_of(const compose_options_t &options, bool several_sinks) {
  const bool several_ports = options.composition.ports.is_range;
  const std::string &output = options.output;
  if (output == standard_stream) {
    throw bad_input_t("--output: several EDIDs cannot go to standard output; name a folder");
  }
  if (has_field(output, sink_field) || has_field(output, port_field)) {
    if (several_sinks && !has_field(output, sink_field)) {
      throw bad_input_t("--output: a file name for several sinks needs {sink} in it");
    }
    if (several_ports && !has_field(output, port_field)) {
      throw bad_input_t("--output: a file name for several ports needs {port} in it");
    }
    return output;
  }
  std::error_code error;
  if (!is_folder(output) && !fs::create_directories(output, error)) {
    throw bad_input_t(output + ": is no folder for several EDIDs, and cannot be made one: " + error.message());
  }
  const std::string name = !several_sinks ? "port{port}" : several_ports ? "{sink}-port{port}" : "{sink}";
  return (fs::path(output) / name).string() + file_ending(options.format);
}

/// What is composed must not take the place of what it is composed from.
void refuse_folder_of_sinks(const std::string &pattern, const std::string &sinks) {
  std::error_code ignored;
  const fs::path parent = fs::path(pattern).parent_path();
  if (fs::equivalent(parent.empty() ? "." : parent, sinks, ignored)) {
    throw bad_input_t("--output: " + sinks + " is the folder of the sinks; name another one");
  }
}

}  // namespace

bool asks_for_several(const composition_options_t &options) {
  return options.ports.is_range || is_sink_folder(options.sink);
}

std::vector<task_t> plan_tasks(const compose_options_t &options) {
  const composition_options_t &composition = options.composition;
  const bool several_sinks = is_sink_folder(composition.sink);
  const auto files = several_sinks ? files_in(*composition.sink) : std::vector<std::string>{""};
  const auto names = several_sinks ? short_names_of(files) : std::vector<std::string>{name_of_only_sink(composition)};
  const std::string pattern = pattern_of(options, several_sinks);
  if (several_sinks) {
    refuse_folder_of_sinks(pattern, *composition.sink);
  }

  std::vector<task_t> tasks;
  std::set<std::string> taken;
  for (std::size_t sink = 0; sink < files.size(); ++sink) {
    for (u32 port = composition.ports.first; port <= composition.ports.last; ++port) {
      task_t task;
      task.port = port;
      task.sink_file = several_sinks ? (fs::path(*composition.sink) / files[sink]).string() : "";
      const std::string port_label = composition.ports.is_range ? "port " + std::to_string(port) : "";
      task.label = files[sink] + (several_sinks && !port_label.empty() ? ", " : "") + port_label;
      const std::string file = replaced(replaced(pattern, port_field, std::to_string(port)), sink_field, names[sink]);
      if (taken.insert(file).second) {
        task.output_file = file;
      }
      tasks.push_back(std::move(task));
    }
  }
  for (task_t &task : tasks) {
    if (!task.output_file.empty()) {
      task.log_file = log_file_of(task.output_file, file_ending(options.format), taken);
      taken.insert(task.log_file);
    }
  }
  return tasks;
}

}  // namespace edid_cli
