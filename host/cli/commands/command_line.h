// The program's command line.
#pragma once

namespace edid_cli {

/// Does what the arguments ask for. Returns the exit status. Throws bad_input_t.
int run_command_line(int argument_count, char **arguments);

}  // namespace edid_cli
