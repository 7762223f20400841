#include "commands/check_platform_command.h"

#include <cstdio>
#include <memory>
#include <string>

#include "commands/exit_status.h"
#include "commands/option_values.h"
#include "io/input.h"
#include "io/standard_output.h"
#include "platform/platform_check.h"
#include "platform/platform_file.h"
#include "text/printable_text.h"
#include "text/text_table.h"

namespace edid_cli {
namespace {

std::string origin_of(const position_t &position) {
  return position.line != 0 ? "line " + std::to_string(position.line) : "default";
}

/// "file:line:column: key: what is wrong", without those that do not apply.
std::string finding_line(const std::string &file, const finding_t &finding) {
  std::string line = file;
  if (finding.position.line != 0) {
    line += ":" + std::to_string(finding.position.line) + ":" + std::to_string(finding.position.column);
  }
  line += ": ";
  if (!finding.key.empty()) {
    line += finding.key + ": ";
  }
  return printable(line + finding.text);
}

int run(const std::string &file) {
  load_platform(file);
  platform_check_t check;
  {
    // The findings say it in other words.
    const discarded_output_t unseen;
    check = check_platform();
  }
  text_table_t table;
  table.add({"KEY", "VALUE", "DEFAULT", "LIMITS", "FROM"});
  for (const key_reading_t &reading : check.readings) {
    table.add({reading.key, reading.value, reading.default_value, reading.limits, origin_of(reading.position)});
  }
  std::printf("%s\n", table.text().c_str());
  for (const finding_t &finding : check.findings) {
    std::printf("%s\n", finding_line(input_name(file), finding).c_str());
  }
  const std::size_t count = check.findings.size();
  std::printf("%s\n",
              count == 0 ? "no findings" : (std::to_string(count) + (count == 1 ? " finding" : " findings")).c_str());
  return count == 0 ? done_status : refused_status;
}

}  // namespace

command_t check_platform_command() {
  const auto file = std::make_shared<std::string>();
  return {"check-platform",
          "Tell what a composition reads of a platform configuration, and its mistakes",
          {required(option("FILE", "", *file, parse_file_name, "The platform configuration (TOML)"))},
          [file] { return run(*file); }};
}

}  // namespace edid_cli
