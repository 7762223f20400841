// Rows of the table of keys, by their names.
#pragma once

#include <algorithm>
#include <stdexcept>
#include <string>

#include "edid_composer/platform/configuration_keys.h"

namespace key_rows {

inline const edid_composer::platform_key_t &row(const std::string &name) {
  const auto rows = edid_composer::platform_keys();
  const auto found = std::find_if(rows.begin(), rows.end(), [&name](const auto &row) { return row.key.name == name; });
  if (found == rows.end()) throw std::out_of_range(name);
  return *found;
}

inline const configuration_key_t &key(const std::string &name) {
  return row(name).key;
}

}  // namespace key_rows
