// Reading a command line. Only the source of this header knows CLI11, which takes long to compile.
#pragma once

#include <string>
#include <variant>
#include <vector>

#include "commands/command.h"

namespace edid_cli {

/// The program as its help shows it.
struct program_t {
  std::string name;
  std::string description;
  std::string version;  ///< What --version prints.
  std::vector<command_t> commands;
};

/// The user asked for help or for the version, which is this text.
struct help_t {
  std::string text;
};

/// Hands the options' texts to the command that is given. Returns that command, of @p program. Throws bad_input_t.
std::variant<help_t, const command_t *> parse_command_line(const program_t &program, int argument_count,
                                                           char **arguments);

}  // namespace edid_cli
