#include "commands/explain_command.h"

#include <cstdio>
#include <filesystem>
#include <memory>
#include <optional>

#include "batch/batch_tasks.h"
#include "commands/exit_status.h"
#include "commands/option_values.h"
#include "commands/platform_settings.h"
#include "commands/shared_options.h"
#include "edid_input/edid_file.h"
#include "explain/answer.h"
#include "explain/explanation_json.h"
#include "explain/explanation_page.h"
#include "explain/explanation_text.h"
#include "explain/observation.h"
#include "io/atomic_file.h"
#include "io/bad_input.h"
#include "io/input.h"
#include "io/program_name.h"
#include "platform/platform_file.h"

namespace edid_cli {
namespace {

struct explain_options_t {
  composition_options_t composition;
  std::optional<std::string> want;  ///< One mode or format that is asked about; none: all decisions.
  bool json = false;
  bool wide = false;      ///< The tables with all columns.
  std::string html_file;  ///< Empty: no page.
};

constexpr int offered_status = 0;
constexpr int not_offered_status = 1;

std::string platform_name(const composition_options_t &options) {
  if (!options.platform_file) {
    return "default platform";
  }
  return *options.platform_file == standard_stream ? input_name(*options.platform_file)
                                                   : std::filesystem::path(*options.platform_file).filename().string();
}

int print_answers(const explain_options_t &options, const std::vector<wanted_t> &wanted, const explained_t &explained) {
  const answers_t answers = answers_to(wanted, explained);
  std::fputs((options.json ? answer_json(*options.want, answers) : answer_text(answers)).c_str(), stdout);
  return answers.is_any_offered() ? offered_status : not_offered_status;
}

void print_explanation(const explain_options_t &options, const explanation_t &explanation) {
  if (!options.html_file.empty()) {
    write_output(options.html_file, explanation_page(explanation));
  }
  if (options.json) {
    std::fputs(explanation_json(explanation).c_str(), stdout);
  } else if (options.html_file.empty()) {
    const table_width_t width = options.wide ? table_width_t::wide : table_width_t::narrow;
    std::fputs(explanation_text(explanation, width).c_str(), stdout);
  }
}

void check(const explain_options_t &options) {
  if (asks_for_several(options.composition)) {
    throw bad_input_t("explain looks at one composition: one sink and one port");
  }
  if (options.want && !options.html_file.empty()) {
    throw bad_input_t("--want and --html don't go together");
  }
  if (options.wide && (options.json || options.want || !options.html_file.empty())) {
    throw bad_input_t("--wide is for the tables: it goes with neither --json, --want nor --html");
  }
  if (options.json && options.html_file == standard_stream) {
    throw bad_input_t("--json and --html cannot both go to standard output");
  }
}

int run(explain_options_t &options) {
  check_composition_options(options.composition);
  check(options);
  const std::vector<wanted_t> wanted = options.want ? parse_wanted(*options.want) : std::vector<wanted_t>{};
  load_platform(options.composition.platform_file);
  require_platform_settings(options.composition);
  const std::optional<std::string> &source = options.composition.sink;
  given_sink_t sink{source ? input_name(*source) : "", read_sink(source, options.composition.drm_directory)};
  // What the library says goes to standard error: standard output is for the explanation.
  const observation_t observation(options.composition, std::move(sink), platform_name(options.composition),
                                  written_to(stderr));
  if (!observation.is_composed()) {
    std::fprintf(stderr, "%s: the library refused to compose an EDID\n", program_name);
    return options.want ? bad_input_status : refused_status;
  }
  const explained_t explained = observation.explained();
  if (options.want) {
    return print_answers(options, wanted, explained);
  }
  print_explanation(options, explanation_of(explained));
  return done_status;
}

}  // namespace

command_t explain_command() {
  const auto target = std::make_shared<explain_options_t>();
  std::vector<option_t> options = composition_options(target->composition);
  options.insert(options.end(), {option(
                                     "--want", "MODE", target->want, [](const std::string &text) { return text; },
                                     "Print whether one mode or format is offered, why, and what to change: 1080p60, "
                                     "4k30, vic 16, pcm8, ac3, 3d, deep-color, hdr10, vrr"),
                                 flag("--wide", target->wide, "Print where each row comes from, without wrapping"),
                                 flag("--json", target->json, "Print a JSON document"),
                                 option("--html", "FILE", target->html_file, parse_file_name,
                                        "Write a page for a browser; - for standard output")});
  return {"explain", "Explain why a composed EDID offers what it offers", std::move(options),
          [target] { return run(*target); }};
}

}  // namespace edid_cli
