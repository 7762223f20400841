// A command: what its help shows, what it takes, and what it does.
#pragma once

#include <functional>
#include <string>
#include <vector>

#include "commands/option.h"

namespace edid_cli {

struct command_t {
  std::string name;
  std::string description;
  std::vector<option_t> options;  ///< Their targets belong to @ref run.
  std::function<int()> run;       ///< Returns the exit status. Throws bad_input_t.
};

}  // namespace edid_cli
