// "explain": why an EDID offers what it offers.
#include <unistd.h>

#include <algorithm>
#include <cstdio>
#include <filesystem>
#include <memory>

#include "atomic_file.h"
#include "bad_input.h"
#include "batch_tasks.h"
#include "commands.h"
#include "exit_status.h"
#include "explain/answer.h"
#include "explain/outputs.h"
#include "input.h"
#include "option_values.h"
#include "standard_output.h"

namespace edid_cli {
namespace {

constexpr int offered_status = 0;
constexpr int not_offered_status = 1;

/// The sink's record; an empty one where there is no sink.
class sink_record_t {
 public:
  explicit sink_record_t(const std::vector<u8> &bytes) {
    // The composition decodes it as well, and what the library says of it is told there.
    const discarded_output_t unseen;
    if (!bytes.empty()) {
      decoded_ = std::make_unique<decoded_edid_t>(bytes);
    }
  }

  const edid_t &get() const { return decoded_ ? decoded_->record() : none_; }

 private:
  std::unique_ptr<decoded_edid_t> decoded_;
  edid_t none_{};
};

std::string platform_name(const composition_options_t &options) {
  if (!options.platform_file) {
    return "default platform";
  }
  return *options.platform_file == standard_stream ? input_name(*options.platform_file)
                                                   : std::filesystem::path(*options.platform_file).filename().string();
}

void write_page(const std::string &file, const std::string &page) {
  const std::span<const u8> bytes(reinterpret_cast<const u8 *>(page.data()), page.size());
  if (file == standard_stream) {
    write_all(STDOUT_FILENO, bytes, "standard output");
  } else {
    write_file_atomically(file, bytes);
  }
}

int tell_answers(const explain_options_t &options, const std::vector<wanted_t> &wanted, const explained_t &explained) {
  std::vector<answer_t> answers;
  std::transform(wanted.begin(), wanted.end(), std::back_inserter(answers),
                 [&explained](const wanted_t &one) { return answer(one, explained); });
  std::fputs((options.json ? answer_json(*options.want, answers) : answer_text(answers)).c_str(), stdout);
  return std::any_of(answers.begin(), answers.end(), [](const answer_t &one) { return one.is_offered; })
             ? offered_status
             : not_offered_status;
}

void check(const explain_options_t &options) {
  if (asks_for_several(options.composition)) {
    throw bad_input_t("explain looks at one composition: one sink and one port");
  }
  if (options.want && !options.html_file.empty()) {
    throw bad_input_t("--want and --html don't go together");
  }
  if (options.json && options.html_file == standard_stream) {
    throw bad_input_t("--json and --html cannot both go to standard output");
  }
}

}  // namespace

int run(const explain_options_t &options) {
  check(options);
  const std::vector<wanted_t> wanted = options.want ? parse_wanted(*options.want) : std::vector<wanted_t>{};
  load_platform(options.composition.platform_file);
  const std::vector<u8> sink = read_sink(options.composition);
  const sink_record_t record(sink);
  const platform_places_t places(platform_name(options.composition));
  // What the library says goes to standard error: standard output is for the explanation.
  const composition_t composition =
      compose(options.composition, options.composition.ports.first, sink, written_to(stderr), decisions_t::kept);
  if (!composition.is_composed) {
    std::fprintf(stderr, "%s: the library refused to compose an EDID\n", program_name);
    return options.want ? bad_input_status : refused_status;
  }
  const std::string sink_name = options.composition.sink ? input_name(*options.composition.sink) : "";
  const explained_t explained{composition, sink, record.get(), sink_name, places, options.composition};
  if (options.want) {
    return tell_answers(options, wanted, explained);
  }
  if (!options.html_file.empty()) {
    write_page(options.html_file, explanation_page(explained));
  }
  if (options.json || options.html_file.empty()) {
    std::fputs((options.json ? explanation_json(explained) : explanation_text(explained)).c_str(), stdout);
  }
  return done_status;
}

}  // namespace edid_cli
