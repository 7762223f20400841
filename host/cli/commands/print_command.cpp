#include "commands/print_command.h"

#include <unistd.h>

#include <cstdio>
#include <filesystem>
#include <memory>
#include <string>
#include <vector>

#include "commands/exit_status.h"
#include "commands/shared_options.h"
#include "edid_input/edid_file.h"
#include "edid_text/edid_report.h"
#include "io/input.h"
#include "io/program_name.h"
#include "io/standard_output.h"
#include "text/printable_text.h"

namespace edid_cli {
namespace {

struct print_options_t {
  std::string source;
  std::string drm_directory;
  bool brief = false;
};

/// The name of a file without its folders.
std::string title_of(const std::string &file) {
  return file == standard_stream ? input_name(file) : std::filesystem::path(file).filename().string();
}

int run(const print_options_t &options) {
  const std::vector<u8> edid = read_edid(options.source, options.drm_directory);
  const report_content_t content = report_content(edid);
  const auto print = [&] { print_report(edid, content, title_of(options.source), options.brief); };
  // The library prints a sink's texts as they are, and a terminal obeys what is among them.
  if (isatty(STDOUT_FILENO) == 1) {
    std::fputs(printable_lines(printed_by(print)).c_str(), stdout);
  } else {
    print();
  }
  if (!content.is_complete) {
    flush_standard_output();
    std::fprintf(stderr, "%s: %s: the library refused to decode this EDID\n", program_name,
                 printable(input_name(options.source)).c_str());
    return refused_status;
  }
  return done_status;
}

}  // namespace

command_t print_command() {
  const auto target = std::make_shared<print_options_t>();
  return {"print",
          "Print an EDID as a readable report",
          {flag("--brief", target->brief, "Identity, video, audio and address only"),
           drm_directory_option(target->drm_directory), edid_operand("FILE", target->source)},
          [target] { return run(*target); }};
}

}  // namespace edid_cli
