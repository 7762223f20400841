#include <unistd.h>

#include <cstdio>
#include <vector>

#include "atomic_file.h"
#include "bad_input.h"
#include "batch.h"
#include "batch_tasks.h"
#include "commands.h"
#include "exit_status.h"
#include "input.h"
#include "option_values.h"
#include "standard_output.h"

namespace edid_cli {
namespace {

int compose_single(const compose_options_t &options) {
  const std::vector<u8> sink = read_sink(options.composition);
  const bool to_standard_output = options.output == standard_stream;
  // Nothing but the EDID may arrive where the EDID is awaited.
  const composition_t composition = compose(options.composition, options.composition.ports.first, sink,
                                            written_to(to_standard_output ? stderr : stdout));
  if (!composition.is_composed) {
    flush_standard_output();
    std::fprintf(stderr, "%s: the library refused to compose an EDID\n", program_name);
    return refused_status;
  }

  const std::string written = formatted(composition.new_edid, options.format);
  const std::span<const u8> bytes(reinterpret_cast<const u8 *>(written.data()), written.size());
  if (to_standard_output) {
    write_all(STDOUT_FILENO, bytes, "standard output");
  } else {
    write_file_atomically(options.output, bytes);
  }
  return done_status;
}

}  // namespace

int run(const compose_options_t &options) {
  load_platform(options.composition.platform_file);
  if (asks_for_several(options.composition)) {
    return compose_several(options);
  }
  if (options.log) {
    throw bad_input_t("--log goes with several EDIDs: a folder of sinks, or a range of ports");
  }
  return compose_single(options);
}

}  // namespace edid_cli
