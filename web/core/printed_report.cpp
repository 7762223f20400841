#include "printed_report.h"

#include <cstdio>
#include <memory>

#include "edid_text/edid_report.h"
#include "io/bad_input.h"
#include "io/standard_output.h"
#include "text/printable_text.h"
#include "text/utf8_text.h"

namespace edid_web {
namespace {

using file_t = std::unique_ptr<std::FILE, int (*)(std::FILE *)>;

/// The program's own way, a temporary file without a name, does not work here: Emscripten's descriptors are copied by
/// opening the file's name again. The file is in the page's memory.
constexpr const char *file_name = "/report";

file_t open_file(const char *mode) {
  file_t file(std::fopen(file_name, mode), std::fclose);
  if (file == nullptr) {
    throw edid_cli::bad_input_t("there is no room for the report");
  }
  return file;
}

}  // namespace

std::string printed_report(std::span<const u8> bytes, const std::string &title) {
  const std::vector<u8> edid(bytes.begin(), bytes.end());
  const edid_cli::report_content_t content = edid_cli::report_content(edid);
  {
    const file_t file = open_file("w");
    const edid_cli::standard_output_redirect_t redirect(fileno(file.get()));
    print_report(edid, content, title, false);
  }
  const file_t file = open_file("r");
  std::string text;
  char chunk[4096];
  for (std::size_t size = 0; (size = std::fread(chunk, 1, sizeof chunk, file.get())) != 0;) {
    text.append(chunk, size);
  }
  return edid_cli::valid_utf8(edid_cli::printable_lines(text));
}

}  // namespace edid_web
