#include <cstdio>
#include <filesystem>
#include <vector>

#include "commands.h"
#include "decoded_edid.h"
#include "edid_file.h"
#include "exit_status.h"
#include "input.h"
#include "option_values.h"
#include "standard_output.h"

namespace edid_cli {
namespace {

/// Printing tells no result, so the same decoding is tried first, unseen.
bool decodes(const std::vector<u8> &edid) {
  const discarded_output_t unseen;
  return decoded_edid_t(edid).is_complete();
}

/// The name of a file without its folders.
std::string title_of(const std::string &file) {
  return file == standard_stream ? input_name(file) : std::filesystem::path(file).filename().string();
}

}  // namespace

int run(const print_options_t &options) {
  const std::vector<u8> edid = read_edid(options.source, options.drm_directory);
  const bool decoded = decodes(edid);
  print_edid(edid.data(), static_cast<u32>(edid.size()), options.brief ? 1 : 0, title_of(options.source).c_str());
  if (!decoded) {
    flush_standard_output();
    std::fprintf(stderr, "%s: %s: the library refused to decode this EDID\n", program_name,
                 input_name(options.source).c_str());
    return refused_status;
  }
  return done_status;
}

}  // namespace edid_cli
