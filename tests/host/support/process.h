// Running a program as a process of its own.
#pragma once

#include <sys/types.h>

#include <optional>
#include <string>
#include <vector>

namespace host_test {

struct process_result_t {
  int status = -1;  ///< The exit status; -1 when a signal ended it.
  std::string output;
  std::string error;
};

struct process_t {
  std::string program;
  std::vector<std::string> arguments;
  std::string input{};                           ///< What it reads on standard input.
  std::optional<std::string> output_file{};      ///< Where standard output goes instead of into the result.
  std::optional<std::string> error_file{};       ///< Where standard error goes instead of into the result.
  std::optional<std::size_t> file_size_limit{};  ///< Files that would grow beyond it cannot be written.
  std::optional<mode_t> creation_mask{};         ///< The umask.
  std::vector<std::string> environment{};        ///< "NAME=value" each, in addition to the test's own.

  process_result_t run() const;
};

}  // namespace host_test
