// One composition: its options, and how it is done.
#pragma once

#include <array>
#include <cstdio>
#include <functional>
#include <optional>
#include <string>
#include <vector>

#include "edid_composer.h"
#include "option_values.h"

namespace edid_cli {

inline constexpr std::size_t new_edid_size = 256;
using new_edid_t = std::array<u8, new_edid_size>;

/// Everything that a composition depends on. File names may be standard_stream ("-").
struct composition_options_t {
  std::optional<std::string> platform_file;  ///< None: the default platform.
  std::optional<std::string> sink;           ///< A file, a folder or a connector. None: no sink.
  std::string drm_directory;
  port_range_t ports;
  compose_cfg_t settings{};  ///< Its port is set for each composition.
  bool debug = false;
};

/// Loads the platform into the process's configuration store. Throws bad_input_t.
void load_platform(const std::optional<std::string> &file);

/// The sink's EDID, empty when there is no sink. Throws bad_input_t.
std::vector<u8> read_sink(const composition_options_t &options);

/// What came of a composition.
struct composition_t {
  bool is_composed = false;  ///< If not, the library has refused, and has said why.
  new_edid_t new_edid{};
  compose_result_t result{};
  std::vector<compose_decision_t> decisions;
};

enum class decisions_t { dropped, kept };

/// Receives each line that the library writes; must not throw.
using line_listener_t = std::function<void(const compose_log_line_t &line)>;

/// A listener that writes each line to a stream, as the library does it to standard output.
line_listener_t written_to(std::FILE *stream);

/// Composes for one port with the platform that is loaded. May run on several threads at once.
composition_t compose(const composition_options_t &options, u32 port, const std::vector<u8> &sink,
                      const line_listener_t &listener, decisions_t decisions = decisions_t::dropped);

}  // namespace edid_cli
