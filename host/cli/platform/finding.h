// What is wrong, or worth knowing, of a platform configuration.
#pragma once

#include <string>
#include <vector>

#include "composition/edid_problems.h"
#include "platform/configuration_node.h"

namespace edid_cli {

struct finding_t {
  severity_t severity;
  position_t position;
  std::string key;  ///< Empty: of the whole configuration.
  std::string text;
};

using findings_t = std::vector<finding_t>;

}  // namespace edid_cli
