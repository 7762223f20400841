// Which files a command line composes, and from what.
#pragma once

#include <string>
#include <vector>

#include "batch/compose_options.h"

namespace edid_cli {

/// One of several compositions.
struct task_t {
  std::string label;      ///< What the summary calls it.
  std::string sink_file;  ///< Empty: the sink of the command line.
  u32 port = 0;
  std::string output_file;  ///< Empty: another task writes the file that this one would.
  std::string log_file;
};

/// Returns whether a command line asks for several compositions: a folder of sinks, a range of ports, or both.
bool asks_for_several(const composition_options_t &options);

/// All of them, sink by sink in order of their names, then port by port; the folder that they go to exists then.
/// Throws bad_input_t.
std::vector<task_t> plan_tasks(const compose_options_t &options);

}  // namespace edid_cli
