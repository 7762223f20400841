// One composition: its options, and how it is done.
#pragma once

#include <array>
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

/// Composes for one port with the platform that is loaded. None: the library refused, and has said why on standard
/// output.
std::optional<new_edid_t> compose(const composition_options_t &options, u32 port, const std::vector<u8> &sink);

}  // namespace edid_cli
