#include "commands/check_platform_command.h"

#include <algorithm>
#include <cstdio>
#include <filesystem>
#include <memory>
#include <string>

#include "commands/exit_status.h"
#include "commands/option_values.h"
#include "commands/platform_settings.h"
#include "commands/shared_options.h"
#include "edid_input/edid_file.h"
#include "edid_input/sink_folder.h"
#include "io/bad_input.h"
#include "io/input.h"
#include "platform/platform_file.h"
#include "text/printable_text.h"
#include "text/text_table.h"
#include "text/utf8_text.h"

namespace edid_cli {
namespace {

struct check_options_t {
  std::string file;
  std::vector<std::string> sinks;  ///< Files, folders or connectors.
  std::string drm_directory;
  bool strict = false;
};

/// The sinks of the command line. Files of folders that are no EDIDs are passed over.
std::vector<named_sink_t> read_sinks(const check_options_t &options, std::vector<std::string> &passed_over) {
  std::vector<named_sink_t> sinks;
  for (const std::string &source : options.sinks) {
    if (!is_sink_folder(source)) {
      sinks.push_back({input_name(source), read_edid(source, options.drm_directory)});
      continue;
    }
    for (const std::string &name : files_in(source)) {
      try {
        sinks.push_back({name, read_edid_file((std::filesystem::path(source) / name).string())});
      } catch (const not_an_edid_t &problem) {
        passed_over.emplace_back(problem.what());
      }
    }
  }
  return sinks;
}

std::string origin_of(const position_t &position) {
  return position.line != 0 ? "line " + std::to_string(position.line) : "default";
}

/// "file:line:column: severity: key: what is wrong", without those that do not apply.
std::string finding_line(const std::string &file, const finding_t &finding) {
  std::string line = file;
  if (finding.position.line != 0) {
    line += ":" + std::to_string(finding.position.line) + ":" + std::to_string(finding.position.column);
  }
  line += std::string(": ") + severity_text(finding.severity) + ": ";
  if (!finding.key.empty()) {
    line += finding.key + ": ";
  }
  // A text that was cut may end within a character.
  return printable(valid_utf8(line + finding.text));
}

std::size_t count_of(const findings_t &findings, severity_t severity) {
  return static_cast<std::size_t>(std::count_if(
      findings.begin(), findings.end(), [severity](const finding_t &finding) { return finding.severity == severity; }));
}

/// "2 errors, 1 warning"; "no findings".
std::string summary_of(const findings_t &findings) {
  std::string summary;
  for (const severity_t severity : {severity_t::error, severity_t::warning, severity_t::note}) {
    if (const std::size_t count = count_of(findings, severity); count != 0) {
      summary += (summary.empty() ? "" : ", ") + std::to_string(count) + " " + severity_text(severity) +
                 (count == 1 ? "" : "s");
    }
  }
  return summary.empty() ? "no findings" : summary;
}

int run(const check_options_t &options) {
  if (options.file == standard_stream &&
      std::find(options.sinks.begin(), options.sinks.end(), standard_stream) != options.sinks.end()) {
    throw bad_input_t("FILE and --sink cannot both be read from standard input");
  }
  load_platform(options.file);
  std::vector<std::string> passed_over;
  const std::vector<named_sink_t> sinks = read_sinks(options, passed_over);
  const platform_check_t check = check_platform_with_settings(sinks);

  text_table_t table;
  table.add({"KEY", "VALUE", "DEFAULT", "LIMITS", "FROM"});
  for (const key_reading_t &reading : check.readings) {
    table.add({reading.key, reading.value, reading.default_value, reading.limits, origin_of(reading.position)});
  }
  std::printf("%s\n", table.text().c_str());
  for (const std::string &name : passed_over) {
    std::printf("passed over: %s\n", printable(name).c_str());
  }
  for (const finding_t &finding : check.findings) {
    std::printf("%s\n", finding_line(input_name(options.file), finding).c_str());
  }
  std::printf("%s\n", summary_of(check.findings).c_str());
  const bool fails = count_of(check.findings, severity_t::error) != 0 ||
                     (options.strict && count_of(check.findings, severity_t::warning) != 0);
  return fails ? refused_status : done_status;
}

}  // namespace

command_t check_platform_command() {
  const auto target = std::make_shared<check_options_t>();
  return {"check-platform",
          "Check a platform configuration: what is read of it, mistakes, and what follows from them",
          {required(option("FILE", "", target->file, parse_file_name, "The platform configuration (TOML)")),
           repeated({"--sink", "FILE", "EDID of a sink to compose for as well, or a folder of them; may be repeated",
                     [target](const std::string &text) { target->sinks.push_back(parse_file_name(text)); }}),
           drm_directory_option(target->drm_directory),
           flag("--strict", target->strict, "Exit with status 1 for warnings too")},
          [target] { return run(*target); }};
}

}  // namespace edid_cli
