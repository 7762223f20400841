#include <unistd.h>

#include <array>
#include <cstdio>
#include <memory>
#include <vector>

#include "atomic_file.h"
#include "bad_input.h"
#include "commands.h"
#include "config_store.h"
#include "edid_file.h"
#include "exit_status.h"
#include "input.h"
#include "option_values.h"
#include "standard_output.h"

namespace edid_cli {
namespace {

constexpr std::size_t new_edid_size = 256;
using new_edid_t = std::array<u8, new_edid_size>;

void load_platform(const std::optional<std::string> &file) {
  bool loaded = false;
  if (!file) {
    loaded = config_store_load_default();
  } else if (*file == standard_stream) {
    const std::string text = read_input(*file);
    loaded = config_store_load_text(text.data(), text.size(), input_name(*file).c_str());
  } else {
    loaded = config_store_load_file(file->c_str());
  }
  if (!loaded) {
    throw bad_input_t(config_store_error());
  }
}

bool compose(const compose_options_t &options, const std::vector<u8> &sink, new_edid_t &new_edid) {
  debug_enable(options.debug);
  return compose_edid(sink.empty() ? nullptr : sink.data(), static_cast<u32>(sink.size()), new_edid.data(),
                      static_cast<u32>(new_edid.size()), &options.settings);
}

}  // namespace

int run(const compose_options_t &options) {
  load_platform(options.platform_file);
  std::vector<u8> sink;
  if (options.sink_file) {
    sink = read_edid(*options.sink_file);
  }

  const bool to_standard_output = options.output_file == standard_stream;
  new_edid_t new_edid{};
  bool composed = false;
  {
    // Nothing but the EDID may arrive where the EDID is awaited.
    std::unique_ptr<standard_output_redirect_t> redirect;
    if (to_standard_output) {
      redirect = std::make_unique<standard_output_redirect_t>(STDERR_FILENO);
    }
    composed = compose(options, sink, new_edid);
  }
  if (!composed) {
    flush_standard_output();
    std::fprintf(stderr, "%s: the library refused to compose an EDID\n", program_name);
    return refused_status;
  }

  if (to_standard_output) {
    write_all(STDOUT_FILENO, new_edid, "standard output");
  } else {
    write_file_atomically(options.output_file, new_edid);
  }
  return done_status;
}

}  // namespace edid_cli
