// One composition, and what came of it.
#pragma once

#include <array>
#include <cstdio>
#include <functional>
#include <vector>

#include "composition/composition_options.h"
#include "edid_composer.h"

namespace edid_cli {

inline constexpr std::size_t new_edid_size = 256;
using new_edid_t = std::array<u8, new_edid_size>;

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
