// How a process ends that a test lets run into an abort, and what it left on its two outputs.
#pragma once

#include <functional>
#include <string>

namespace test_support {

struct process_end_t {
  int signal = 0;               ///< The signal that ended the process; 0 when it ended by itself.
  std::string standard_output;  ///< Not masked.
  std::string standard_error;
};

/// Runs @p action in a child process whose standard output is a fully buffered file. Only what the child wrote out
/// before it ended is in the result.
process_end_t end_of_process(const std::function<void()> &action);

}  // namespace test_support
