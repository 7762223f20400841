// edid-composer: composes and prints EDIDs from the command line.
#include <cstdio>
#include <exception>

#include "commands/command_line.h"
#include "commands/exit_status.h"
#include "io/program_name.h"
#include "io/standard_output.h"
#include "io/temporary_file.h"
#include "text/printable_text.h"

int main(int argument_count, char **arguments) {
  edid_cli::remove_temporary_files_on_signals();
  try {
    const int status = edid_cli::run_command_line(argument_count, arguments);
    edid_cli::flush_standard_output();
    return status;
  } catch (const std::exception &problem) {
    // What standard output still holds comes first, as it happened first.
    std::fflush(stdout);
    std::fprintf(stderr, "%s: %s\n", edid_cli::program_name, edid_cli::printable(problem.what()).c_str());
    return edid_cli::bad_input_status;
  }
}
