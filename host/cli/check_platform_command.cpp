#include <cstdio>

#include "commands.h"
#include "composition.h"
#include "exit_status.h"
#include "input.h"
#include "platform_check.h"
#include "printable_text.h"
#include "standard_output.h"
#include "text_table.h"

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

}  // namespace

int run(const check_platform_options_t &options) {
  load_platform(options.file);
  platform_check_t check;
  {
    // What is found is told in other words.
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
    std::printf("%s\n", finding_line(input_name(options.file), finding).c_str());
  }
  const std::size_t count = check.findings.size();
  std::printf("%s\n",
              count == 0 ? "no findings" : (std::to_string(count) + (count == 1 ? " finding" : " findings")).c_str());
  return count == 0 ? done_status : refused_status;
}

}  // namespace edid_cli
