#include "commands/compose_command.h"

#include <cstdio>
#include <memory>
#include <vector>

#include "batch/batch.h"
#include "batch/batch_tasks.h"
#include "commands/exit_status.h"
#include "commands/option_values.h"
#include "commands/platform_settings.h"
#include "commands/shared_options.h"
#include "composition/composition.h"
#include "edid_input/edid_file.h"
#include "io/atomic_file.h"
#include "io/bad_input.h"
#include "io/input.h"
#include "io/program_name.h"
#include "io/standard_output.h"
#include "platform/platform_file.h"
#include "text/printable_text.h"

namespace edid_cli {
namespace {

int compose_single(const compose_options_t &options) {
  const std::vector<u8> sink = read_sink(options.composition.sink, options.composition.drm_directory);
  // Nothing but the EDID may arrive where the EDID is awaited.
  std::FILE *const lines = options.output == standard_stream ? stderr : stdout;
  const composition_t composition =
      compose(options.composition, options.composition.ports.first, sink, written_to(lines), decisions_of(options));
  const std::string failure = failure_of(composition, options);
  if (!failure.empty()) {
    flush_standard_output();
    std::fprintf(stderr, "%s: %s\n", program_name, printable(failure).c_str());
    return refused_status;
  }
  write_output(options.output, formatted(composition.new_edid, options.format));
  return done_status;
}

int run(compose_options_t &options) {
  check_composition_options(options.composition);
  load_platform(options.composition.platform_file);
  require_platform_settings(options.composition);
  if (asks_for_several(options.composition)) {
    return compose_several(options) ? done_status : refused_status;
  }
  if (options.log) {
    throw bad_input_t("--log needs several EDIDs: a folder of sinks, or a range of ports");
  }
  return compose_single(options);
}

}  // namespace

command_t compose_command() {
  const auto target = std::make_shared<compose_options_t>();
  std::vector<option_t> options = composition_options(target->composition);
  options.insert(
      options.end(),
      {required(option("-o,--output", "FILE", target->output, parse_file_name,
                       "Where the EDID goes; - for standard output. For several: a folder, or a file name with {sink} "
                       "and {port} in it")),
       option("--format", "raw|hex", target->format, parse_edid_format,
              "Write bytes, or hexadecimal text (default raw)"),
       option("--jobs", "N", target->jobs, parse_jobs,
              "Of several, compose N at the same time (default: the number of processors)"),
       flag("--strict", target->strict,
            "Fail and write no EDID if a sink is not read to its end, or if no source could use the EDID"),
       flag("--log", target->log, "For several: write the library's lines to a .log file beside each EDID")});
  return {"compose", "Compose an EDID, or one for each of several sinks or ports", std::move(options),
          [target] { return run(*target); }};
}

}  // namespace edid_cli
