// What a composition reads of the platform configuration that is loaded, and what is wrong with it.
#pragma once

#include <string>
#include <vector>

#include "platform/configuration_node.h"

namespace edid_cli {

/// One key, as a composition reads it.
struct key_reading_t {
  std::string key;
  std::string value;
  std::string default_value;
  std::string limits;
  position_t position;  ///< Of the key; without a line where the default is taken.
};

struct finding_t {
  position_t position;
  std::string key;  ///< Empty: of the whole configuration.
  std::string text;
};

struct platform_check_t {
  std::vector<key_reading_t> readings;
  std::vector<finding_t> findings;  ///< In the order of the file; what is missing comes first.
};

platform_check_t check_platform();

}  // namespace edid_cli
