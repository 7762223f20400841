#include "operations.h"

#include <algorithm>
#include <iterator>

#include "commands/platform_settings.h"
#include "composition/library_line.h"
#include "config_store.h"
#include "edid_input/edid_file.h"
#include "edid_text/edid_comparison.h"
#include "edid_text/edid_output.h"
#include "explain/explanation_json.h"
#include "io/bad_input.h"
#include "io/standard_output.h"
#include "printed_report.h"
#include "text/printable_text.h"
#include "text/utf8_text.h"
#include "toml_edit.h"

namespace edid_web {
namespace {

using edid_cli::bad_input_t;
using edid_cli::edid_format_t;
using edid_cli::explained_t;
using edid_cli::observation_t;
using edid_cli::valid_utf8;

/// Members of a document, one of which may be a document itself, which is made elsewhere.
std::string document(const json_t &members, const std::string &name = "", const std::string &inner = "") {
  std::string text = members.dump();
  if (!inner.empty()) {
    text.pop_back();
    text += (members.empty() ? "\"" : ",\"") + name + "\":" + inner + "}";
  }
  return text;
}

/// What the library says, up to a limit: with traces a hostile sink makes it say a lot.
class transcript_t {
 public:
  edid_cli::line_listener_t listener() {
    return [this](const compose_log_line_t &line) {
      if (text_.size() < most_characters) {
        text_ += edid_cli::printed(line);
      } else if (!is_cut_) {
        text_ += "(more is left out)\n";
        is_cut_ = true;
      }
    };
  }

  std::string text() const { return valid_utf8(edid_cli::printable_lines(text_)); }

 private:
  static constexpr std::size_t most_characters = 200'000;
  std::string text_;
  bool is_cut_ = false;
};

json_t json_finding(const edid_cli::finding_t &finding) {
  return {{"severity", edid_cli::severity_text(finding.severity)},
          {"line", finding.position.line},
          {"column", finding.position.column},
          {"key", valid_utf8(finding.key)},
          {"text", valid_utf8(finding.text)}};
}

/// Nobody reads more of them.
constexpr std::size_t most_findings = 500;

edid_cli::findings_t findings_of(const inputs_t &inputs) {
  if (!inputs.is_platform_loaded) {
    return {};
  }
  std::vector<edid_cli::named_sink_t> sinks;
  if (!inputs.sink.bytes.empty()) {
    sinks.push_back({inputs.sink.name, inputs.sink.bytes});
  }
  return edid_cli::check_platform_with_settings(sinks).findings;
}

/// The first of the findings, and how many there are.
json_t json_findings(const edid_cli::findings_t &findings) {
  json_t list = json_t::array();
  const auto shown = std::span(findings).first(std::min(findings.size(), most_findings));
  std::transform(shown.begin(), shown.end(), std::back_inserter(list), json_finding);
  return {{"findings", std::move(list)}, {"findings_in_all", findings.size()}};
}

/// Composes on construction, and complains where the library refuses.
struct complaining_observation_t : observation_t {
  complaining_observation_t(inputs_t &inputs, transcript_t &transcript)
      : observation_t(inputs.options, inputs.sink, inputs.platform_name, transcript.listener()) {
    if (!is_composed()) inputs.complaints.push_back({"library", "refuses to compose: " + composition().refusal});
  }
};

std::string compose(const json_t &request, std::string_view) {
  inputs_t inputs(request);
  json_t members = json_findings(findings_of(inputs));
  std::string explanation;
  if (inputs.are_usable()) {
    transcript_t transcript;
    const complaining_observation_t observation(inputs, transcript);
    members["messages"] = transcript.text();
    if (observation.is_composed()) {
      explanation = explanation_json(explanation_of(observation.explained()));
      const edid_cli::new_edid_t &edid = observation.composition().new_edid;
      members["hex"] = formatted(edid, edid_format_t::hex);
      members["report"] = printed_report(edid, "New EDID");
      members["sink_report"] = inputs.sink.bytes.empty() ? "" : printed_report(inputs.sink.bytes, "Sink");
    }
  }
  members["problems"] = json_complaints(inputs.complaints);
  return document(members, "explanation", explanation);
}

/// The answers to "want" where the inputs are usable, and what @p use makes of them.
template <typename use_t>
std::string answered(const json_t &request, use_t use) {
  inputs_t inputs(request);
  if (inputs.are_usable()) {
    transcript_t unused;
    const complaining_observation_t observation(inputs, unused);
    if (observation.is_composed()) {
      const auto wanted = edid_cli::parse_wanted(request.at("want").get<std::string>());
      return use(inputs, answers_to(wanted, observation.explained()));
    }
  }
  return document({{"problems", json_complaints(inputs.complaints)}});
}

std::string want(const json_t &request, std::string_view) {
  return answered(request, [&request](const inputs_t &, const edid_cli::answers_t &answers) {
    return document({{"problems", json_t::array()}}, "answer",
                    answer_json(request.at("want").get<std::string>(), answers));
  });
}

/// Of the settings, those that steps change: a text, or whether a flag is given; null where it is not.
json_t changed_settings(const edid_cli::steps_t &steps) {
  json_t settings = json_t::object();
  for (const edid_cli::step_t &step : steps) {
    const std::string name = step.key.starts_with("--") ? step.key.substr(2) : step.key;
    if (step.action == edid_cli::step_action_t::give_option) {
      settings[name] = step.value.empty() ? json_t(true) : json_t(step.value);
    } else if (step.action == edid_cli::step_action_t::drop_option) {
      settings[name] = nullptr;
    }
  }
  return settings;
}

/// Does the steps of the way number "way" of the answer number "answer".
std::string apply(const json_t &request, std::string_view) {
  return answered(request, [&request](const inputs_t &inputs, const edid_cli::answers_t &answers) {
    const auto &ways = answers.answers.at(request.at("answer").get<std::size_t>()).ways;
    const edid_cli::steps_t &steps = ways.at(request.at("way").get<std::size_t>());
    return document({{"problems", json_t::array()},
                     {"platform", with_steps(inputs.platform_text(), inputs.platform_name, steps)},
                     {"settings", changed_settings(steps)}});
  });
}

std::string read(const json_t &request, std::string_view content) {
  const std::vector<u8> bytes = edid_cli::edid_of(std::string(content), request.at("name").get<std::string>());
  return document({{"text", formatted(bytes, edid_format_t::hex)}});
}

std::string compare(const json_t &request, std::string_view) {
  const auto bytes_of = [&request](const char *side) {
    const json_t &file = request.at(side);
    return edid_cli::edid_of(text_of(file), name_of(file));
  };
  const edid_cli::discarded_output_t unseen;
  const edid_cli::decoded_edid_t left(bytes_of("left"));
  const edid_cli::decoded_edid_t right(bytes_of("right"));
  json_t rows = json_t::array();
  for (const edid_cli::compared_t &row : edid_cli::comparison_of(left.records(), right.records())) {
    rows.push_back({{"field", row.field}, {"left", valid_utf8(row.left)}, {"right", valid_utf8(row.right)}});
  }
  return document({{"rows", std::move(rows)}});
}

std::string about(const json_t &, std::string_view) {
  return document({{"settings", setting_descriptions()}, {"platform", config_store_default_text()}});
}

struct operation_t {
  std::string_view name;
  std::string (*run)(const json_t &request, std::string_view content);
};

constexpr operation_t operations[] = {
    {"about", about}, {"read", read}, {"compose", compose}, {"want", want}, {"apply", apply}, {"compare", compare},
};

}  // namespace

std::string run_operation(const json_t &request, std::string_view content) {
  const std::string name = request.at("operation").get<std::string>();
  for (const operation_t &operation : operations) {
    if (operation.name == name) {
      return operation.run(request, content);
    }
  }
  throw bad_input_t("there is no operation \"" + name + "\"");
}

}  // namespace edid_web
