// A composition in memory, and every decision that the library took in it.
#pragma once

#include <optional>
#include <vector>

#include "composition.h"

namespace edid_cli {

struct explanation_t {
  new_edid_t new_edid{};
  std::vector<compose_decision_t> decisions;
};

/// Composes for the first port with the platform that is loaded. None: the library refused, and has said why on
/// standard output.
std::optional<explanation_t> explain_composition(const composition_options_t &options, const std::vector<u8> &sink);

}  // namespace edid_cli
