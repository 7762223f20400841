// edid-composer: composes and prints EDIDs from the command line.
#include <cstdio>
#include <exception>
#include <variant>

#include "arguments.h"
#include "bad_input.h"
#include "commands.h"
#include "exit_status.h"
#include "option_values.h"
#include "standard_output.h"

namespace edid_cli {
namespace {

int run(const help_t &help) {
  std::fputs(help.text.c_str(), stdout);
  return done_status;
}

int run_command(int argument_count, char **arguments) {
  const arguments_t parsed = parse_arguments(argument_count, arguments);
  const int status = std::visit([](const auto &options) { return run(options); }, parsed);
  flush_standard_output();
  return status;
}

}  // namespace
}  // namespace edid_cli

int main(int argument_count, char **arguments) {
  try {
    return edid_cli::run_command(argument_count, arguments);
  } catch (const std::exception &problem) {
    // What standard output still holds comes first, as it happened first.
    std::fflush(stdout);
    std::fprintf(stderr, "%s: %s\n", edid_cli::program_name, problem.what());
    return edid_cli::bad_input_status;
  }
}
