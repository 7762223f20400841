#include "explain/explanation_json.h"

#include <algorithm>
#include <iterator>
#include <nlohmann/json.hpp>
#include <span>

#include "explain/rows.h"
#include "text/hexadecimal.h"
#include "text/utf8_text.h"

namespace edid_cli {
namespace {

using json_t = nlohmann::ordered_json;

/// Of both documents. A program that reads them shall look at it first.
constexpr int document_version = 1;

/// What comes from outside may have any bytes.
json_t json_text(std::string_view text) {
  return valid_utf8(text);
}

json_t json_bytes(std::span<const u8> bytes) {
  return hex_bytes(bytes, "", letters_t::small);
}

template <typename values_t, typename maker_t>
json_t json_list(const values_t &values, maker_t make) {
  json_t list = json_t::array();
  std::transform(std::begin(values), std::end(values), std::back_inserter(list), make);
  return list;
}

json_t json_sink(const explained_t &explained) {
  if (explained.sink_bytes.empty()) {
    return nullptr;
  }
  return {{"source", json_text(explained.sink_name)},
          {"manufacturer", json_text(explained.sink.manufacturer)},
          {"name", json_text(explained.sink.monitor_name)},
          {"bytes", json_bytes(explained.sink_bytes)}};
}

json_t json_settings(const composition_options_t &options) {
  const compose_cfg_t &settings = options.settings;
  return {{"port", options.ports.first},
          {"audio_mask", settings.audio_mask},
          {"audio_sink_filter", settings.audio_sink_filter == 1},
          {"3d", settings.hdmi_3d_mode},
          {"latency", json_t(settings.edid_latency)}};
}

json_t json_source(const source_t &source) {
  json_t json{{"kind", source_kind_id(source.kind)}, {"text", json_text(source.text)}};
  if (!source.key.empty()) {
    json["key"] = json_text(source.key);
  }
  if (source.line != 0) {
    json["line"] = source.line;
  }
  return json;
}

json_t json_row(const row_t &row) {
  const compose_decision_t &decision = row.decision;
  return {{"section", section_id(row.section)},
          {"subject", compose_subject_string(decision.subject)},
          {"subject_id", decision.subject},
          {"code", decision.code},
          {"name", json_text(row.name)},
          {"verdict", compose_verdict_string(decision.verdict)},
          {"verdict_id", decision.verdict},
          {"reason", compose_reason_string(decision.reason)},
          {"reason_id", decision.reason},
          {"values", json_t(decision.value)},
          {"sentence", json_text(row.sentence)},
          {"position", decision.position < 0 ? json_t(nullptr) : json_t(decision.position)},
          {"sources", json_list(row.sources, json_source)}};
}

json_t json_step(const step_t &step) {
  json_t json{{"text", json_text(step.text)}, {"key", json_text(step.key)}};
  if (step.line != 0) {
    json["line"] = step.line;
  }
  return json;
}

json_t json_answer(const answer_t &answer) {
  return {{"name", json_text(answer.name)},
          {"offered", answer.is_offered},
          {"reasons", json_list(answer.reasons, json_text)},
          {"steps", json_list(answer.steps, json_step)}};
}

std::string document(const json_t &json) {
  constexpr int indentation = 2;
  return json.dump(indentation) + "\n";
}

}  // namespace

std::string explanation_json(const explained_t &explained) {
  return document({{"version", document_version},
                   {"sink", json_sink(explained)},
                   {"platform", json_text(explained.places.name())},
                   {"settings", json_settings(explained.options)},
                   {"edid", json_bytes(explained.composition.new_edid)},
                   {"decisions", json_list(rows_of(explained), json_row)}});
}

std::string answer_json(const std::string &wanted, const std::vector<answer_t> &answers) {
  return document(
      {{"version", document_version}, {"want", json_text(wanted)}, {"answers", json_list(answers, json_answer)}});
}

}  // namespace edid_cli
