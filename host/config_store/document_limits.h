// What the TOML parser must not be given: it takes some input for granted, and it recurses without a bound of ours.
#pragma once

#include <optional>
#include <string>
#include <string_view>

#include "config_tree.h"

namespace edid_config_store {

/// Tables and arrays in each other, and names in a dotted key, count one level each.
inline constexpr int max_depth = 64;

struct document_problem_t {
  node_position_t position;
  std::string text;
};

/// Looks through a document before it is parsed: for a character outside of ASCII that stands outside of strings and
/// comments, where TOML allows none, and for nesting beyond max_depth. What else is wrong is left to the parser.
std::optional<document_problem_t> find_beyond_limits(std::string_view document);

}  // namespace edid_config_store
