#include <fcntl.h>
#include <unistd.h>

#include <cstdio>
#include <cstring>
#include <filesystem>
#include <vector>

#include "bad_input.h"
#include "commands.h"
#include "edid_file.h"
#include "exit_status.h"
#include "input.h"
#include "option_values.h"
#include "standard_output.h"

namespace edid_cli {
namespace {

/// Printing tells no result, so the same decoding is tried first, unseen.
bool decodes(const std::vector<u8> &edid) {
  const file_descriptor_t nowhere(open("/dev/null", O_WRONLY | O_CLOEXEC));
  if (!nowhere.is_open()) {
    throw bad_input_t(std::string("/dev/null: ") + std::strerror(errno));
  }
  const standard_output_redirect_t redirect(nowhere.get());

  edid_t record;
  if (edid_prepare(&record) == 0) {
    return false;
  }
  bool decoded = decode_edid_block_0(edid.data(), &record) != 0;
  if (decoded && edid.size() > edid_block_size) {
    const auto size = static_cast<u32>(edid.size()) - edid_block_size;
    decoded = decode_edid_extensions(edid.data() + edid_block_size, size, &record) != 0;
  }
  return edid_destroy(&record) != 0 && decoded;
}

/// The name of a file without its folders.
std::string title_of(const std::string &file) {
  return file == standard_stream ? input_name(file) : std::filesystem::path(file).filename().string();
}

}  // namespace

int run(const print_options_t &options) {
  const std::vector<u8> edid = read_edid(options.file);
  const bool decoded = decodes(edid);
  print_edid(edid.data(), static_cast<u32>(edid.size()), options.brief ? 1 : 0, title_of(options.file).c_str());
  if (!decoded) {
    flush_standard_output();
    std::fprintf(stderr, "%s: %s: the library refused to decode this EDID\n", program_name,
                 input_name(options.file).c_str());
    return refused_status;
  }
  return done_status;
}

}  // namespace edid_cli
