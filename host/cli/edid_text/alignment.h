// Two lists side by side, with what they have in common in the same rows.
#pragma once

#include <optional>
#include <string>
#include <vector>

namespace edid_cli {

struct aligned_row_t {
  std::optional<std::string> left;
  std::optional<std::string> right;
};

/// Keeps the order of both lists, and the longest sequence that they have in common in rows of its own. What differs
/// between two such rows shares rows where both lists have something there.
std::vector<aligned_row_t> align(const std::vector<std::string> &left, const std::vector<std::string> &right);

}  // namespace edid_cli
