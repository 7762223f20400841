// The options that every command has which composes.
#pragma once

#include <CLI/CLI.hpp>

#include "composition.h"

namespace edid_cli {

/// Adds "--drm-dir" to a command that reads EDIDs; @p directory must outlive the parsing.
void add_drm_directory(CLI::App &command, std::string &directory);

/// Platform, sink, port and settings. Lives as long as the command line is parsed.
class composition_arguments_t {
 public:
  explicit composition_arguments_t(CLI::App &command);
  composition_arguments_t(const composition_arguments_t &) = delete;
  composition_arguments_t &operator=(const composition_arguments_t &) = delete;

  /// What was given, once all has been parsed. Throws bad_input_t for what does not go together.
  composition_options_t options() const;

 private:
  void add_inputs(CLI::App &command);
  void add_settings(CLI::App &command);

  composition_options_t options_;
  latency_t latency_{};
  bool audio_sink_filter_ = false;
};

}  // namespace edid_cli
