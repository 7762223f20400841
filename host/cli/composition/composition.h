// One composition, and what came of it.
#pragma once

#include <array>
#include <cstdio>
#include <functional>
#include <string>
#include <vector>

#include "composition/composition_options.h"
#include "edid_composer.h"

namespace edid_cli {

inline constexpr std::size_t new_edid_size = 256;
using new_edid_t = std::array<u8, new_edid_size>;

/// What the library has read of a key of the configuration, or of an entry; see configuration_reading_t.
struct kept_reading_t {
  const configuration_key_t *key;
  u32 reason;
  i32 entry;
  i32 place;
  std::string node;
  std::string text;
  i32 found;
  i32 used;
};

/// What came of a composition.
struct composition_t {
  bool is_composed = false;
  std::string refusal;  ///< Why not: what the library has said of it; empty when it is composed.
  new_edid_t new_edid{};
  compose_result_t result{};
  // Of an observed composition:
  std::vector<compose_decision_t> decisions;
  std::vector<kept_reading_t> readings;
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
