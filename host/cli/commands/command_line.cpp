#include "commands/command_line.h"

#include <cstdio>

#include "commands/audio_mask_command.h"
#include "commands/check_platform_command.h"
#include "commands/compose_command.h"
#include "commands/diff_command.h"
#include "commands/exit_status.h"
#include "commands/explain_command.h"
#include "commands/option_parser.h"
#include "commands/platform_command.h"
#include "commands/print_command.h"
#include "commands/sinks_command.h"
#include "edid_composer.h"
#include "io/program_name.h"

namespace edid_cli {

int run_command_line(int argument_count, char **arguments) {
  const program_t program{
      program_name,
      "Composes the EDID that a video platform shows on its HDMI input; explains, prints and checks. FILE may be "
      "- for standard input.",
      std::string(program_name) + " " EDID_COMPOSER_VERSION "\n" + gVersion,
      {compose_command(), explain_command(), print_command(), diff_command(), sinks_command(), check_platform_command(),
       audio_mask_command(), platform_command()}};
  const auto parsed = parse_command_line(program, argument_count, arguments);
  if (const auto *const command = std::get_if<const command_t *>(&parsed)) {
    return (*command)->run();
  }
  std::fputs(std::get<help_t>(parsed).text.c_str(), stdout);
  return done_status;
}

}  // namespace edid_cli
