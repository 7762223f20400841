#include "explain/explanation_json.h"

#include <algorithm>
#include <iterator>
#include <nlohmann/json.hpp>
#include <span>

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

json_t json_block(const sink_block_t &block) {
  return {{"block", block.number}, {"kind", block.kind}, {"read", block.is_read}};
}

json_t json_status(const sink_reading_t &reading) {
  return {{"base", compose_sink_status_string(reading.base_status)},
          {"base_id", reading.base_status},
          {"extension", compose_extension_status_string(reading.extension_status)},
          {"extension_id", reading.extension_status},
          {"complete", !reading.is_incomplete()},
          {"gaps", json_list(reading.gaps, json_text)},
          {"blocks", json_list(reading.blocks, json_block)}};
}

json_t json_fact(const fact_t &fact) {
  return {{"name", json_text(fact.name)}, {"values", json_list(fact.values, json_text)}};
}

json_t json_sink(const explanation_t &explanation) {
  if (explanation.sink_bytes.empty()) {
    return nullptr;
  }
  return {{"source", json_text(explanation.sink_source)},
          {"manufacturer", json_text(explanation.sink_manufacturer)},
          {"name", json_text(explanation.sink_name)},
          {"bytes", json_bytes(explanation.sink_bytes)},
          {"status", json_status(explanation.reading)}};
}

json_t json_count(const count_t &count) {
  return {{"section", section_id(count.section)},
          {"title", section_title(count.section)},
          {"offered", count.offered},
          {"left_out", count.left_out}};
}

json_t json_reason(const common_reason_t &reason) {
  return {{"reason", reason.text}, {"count", reason.count}};
}

json_t json_summary(const summary_t &summary) {
  return {{"status", json_text(summary.status)},
          {"preferred_video", json_text(summary.preferred_video)},
          {"best_video", json_text(summary.best_video)},
          {"hdmi2", json_list(summary.hdmi2, json_text)},
          {"audio", json_list(summary.audio, json_text)},
          {"lost", json_list(summary.lost, json_text)},
          {"counts", json_list(summary.counts, json_count)},
          {"reasons", json_list(summary.reasons, json_reason)}};
}

json_t json_compared(const compared_t &row) {
  return {{"field", json_text(row.field)}, {"sink", json_text(row.left)}, {"new_edid", json_text(row.right)}};
}

json_t json_key(const key_reading_t &key) {
  return {{"key", json_text(key.key)},
          {"value", json_text(key.value)},
          {"default", json_text(key.default_value)},
          {"limits", json_text(key.limits)},
          {"from", line_text(key.position)}};
}

json_t json_finding(const finding_t &finding) {
  return {{"severity", severity_text(finding.severity)},
          {"from", line_text(finding.position)},
          {"key", json_text(finding.key)},
          {"text", json_text(finding.text)}};
}

json_t json_bytes_field(const byte_field_t &field) {
  return {{"offset", field.offset},
          {"size", field.size},
          {"part", byte_block_title(field.block)},
          {"name", json_text(field.name)},
          {"meaning", json_text(field.meaning)}};
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
  json_t json{{"section", section_id(row.section)},
              {"subject", compose_subject_string(decision.subject)},
              {"subject_id", decision.subject},
              {"code", decision.code},
              {"name", json_text(row.name)},
              {"verdict", compose_verdict_string(decision.verdict)},
              {"verdict_id", decision.verdict},
              {"verdict_text", verdict_text(row)},
              {"reason", compose_reason_string(decision.reason)},
              {"reason_id", decision.reason},
              {"values", json_t(decision.value)},
              {"sentence", json_text(row.sentence)},
              {"position", decision.position < 0 ? json_t(nullptr) : json_t(decision.position)},
              {"sources", json_list(row.sources, json_source)}};
  if (row.rests_on_unread) {
    json["rests_on_unread"] = true;
  }
  if (!row.merged.empty()) {
    json["merged"] = json_list(row.merged, json_row);
  }
  return json;
}

json_t json_step(const step_t &step) {
  json_t json{{"text", json_text(step.text)},
              {"action", step_action_id(step.action)},
              {"key", json_text(step.key)},
              {"value", json_text(step.value)}};
  if (!step.old_value.empty()) {
    json["old_value"] = json_text(step.old_value);
  }
  if (!step.remark.empty()) {
    json["remark"] = json_text(step.remark);
  }
  if (step.line != 0) {
    json["line"] = step.line;
  }
  return json;
}

json_t json_steps(const steps_t &steps) {
  return json_list(steps, json_step);
}

json_t json_answer(const answer_t &answer) {
  return {{"name", json_text(answer.name)},
          {"offered", answer.is_offered},
          {"reasons", json_list(answer.reasons, json_text)},
          {"steps", answer.ways.empty() ? json_t::array() : json_steps(answer.ways.front())},
          {"other_ways", json_list(other_ways(answer), json_steps)},
          {"no_way", answer.no_way.empty() ? json_t(nullptr) : json_text(answer.no_way)}};
}

std::string document(const json_t &json) {
  constexpr int indentation = 2;
  return json.dump(indentation) + "\n";
}

}  // namespace

std::string explanation_json(const explanation_t &explanation) {
  const platform_check_t &check = explanation.platform_check;
  return document({{"version", document_version},
                   {"program", explanation.program},
                   {"title", json_text(explanation.title)},
                   {"sink", json_sink(explanation)},
                   {"platform", json_text(explanation.platform)},
                   {"settings", json_settings(explanation.options)},
                   {"summary", json_summary(explanation.summary)},
                   {"warnings", json_list(explanation.warnings, json_text)},
                   {"edid", json_bytes(explanation.new_edid)},
                   {"decisions", json_list(explanation.rows, json_row)},
                   {"facts",
                    {{"sink", json_list(explanation.sink_facts, json_fact)},
                     {"platform", json_list(explanation.platform_facts, json_fact)},
                     {"new_edid", json_list(explanation.new_edid_facts, json_fact)}}},
                   {"comparison", json_list(explanation.comparison, json_compared)},
                   {"bytes", json_list(explanation.bytes, json_bytes_field)},
                   {"keys", json_list(check.readings, json_key)},
                   {"findings", json_list(check.findings, json_finding)}});
}

std::string answer_json(const std::string &wanted, const answers_t &answers) {
  return document({{"version", document_version},
                   {"want", json_text(wanted)},
                   {"sink_gaps", json_list(answers.sink_gaps, json_text)},
                   {"answers", json_list(answers.answers, json_answer)}});
}

}  // namespace edid_cli
