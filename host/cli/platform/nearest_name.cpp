#include "platform/nearest_name.h"

#include <algorithm>
#include <vector>

#include "text/lower_case.h"

namespace edid_cli {
namespace {

/// How many letters of one have to be changed, left out, added or exchanged with their neighbour to give the other.
std::size_t distance(const std::string &from, const std::string &to) {
  std::vector<std::vector<std::size_t>> changes(from.size() + 1, std::vector<std::size_t>(to.size() + 1));
  for (std::size_t i = 0; i <= from.size(); ++i) {
    for (std::size_t j = 0; j <= to.size(); ++j) {
      if (i == 0 || j == 0) {
        changes[i][j] = i + j;
        continue;
      }
      const std::size_t replaced = changes[i - 1][j - 1] + (from[i - 1] == to[j - 1] ? 0 : 1);
      changes[i][j] = std::min({changes[i - 1][j] + 1, changes[i][j - 1] + 1, replaced});
      if (i > 1 && j > 1 && from[i - 1] == to[j - 2] && from[i - 2] == to[j - 1]) {
        changes[i][j] = std::min(changes[i][j], changes[i - 2][j - 2] + 1);
      }
    }
  }
  return changes[from.size()][to.size()];
}

}  // namespace

std::optional<std::string> nearest_name(std::string_view written, std::span<const std::string> names) {
  const std::string text = lower_case(written);
  std::optional<std::string> nearest;
  std::size_t fewest = std::max<std::size_t>(text.size() / 3, 1) + 1;
  for (const std::string &name : names) {
    const std::size_t longer = std::max(text.size(), name.size());
    if (longer - std::min(text.size(), name.size()) >= fewest) {
      continue;
    }
    const std::size_t changes = distance(text, lower_case(name));
    if (changes < fewest) {
      fewest = changes;
      nearest = name;
    }
  }
  return nearest;
}

}  // namespace edid_cli
