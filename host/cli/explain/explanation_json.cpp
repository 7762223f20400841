#include <cstdio>
#include <span>

#include "explain/json_writer.h"
#include "explain/outputs.h"

namespace edid_cli {
namespace {

/// Of both documents. A program that reads them shall look at it first.
constexpr std::int64_t document_version = 1;

std::string hexadecimal(std::span<const u8> bytes) {
  std::string text;
  for (const u8 byte : bytes) {
    char digits[3];
    std::snprintf(digits, sizeof digits, "%02x", static_cast<unsigned>(byte));
    text += digits;
  }
  return text;
}

/// A place, which is null where there is none.
void write_place(json_writer_t &json, const char *name, i32 place) {
  json.key(name);
  if (place < 0) {
    json.null();
  } else {
    json.value(std::int64_t{place});
  }
}

void write_sink(json_writer_t &json, const explained_t &explained) {
  json.key("sink");
  if (explained.sink_bytes.empty()) {
    json.null();
    return;
  }
  json.open_object().member("source", explained.sink_name);
  json.member("manufacturer", static_cast<const char *>(explained.sink.manufacturer));
  json.member("name", static_cast<const char *>(explained.sink.monitor_name));
  json.member("bytes", hexadecimal(explained.sink_bytes)).close();
}

void write_settings(json_writer_t &json, const composition_options_t &options) {
  const compose_cfg_t &settings = options.settings;
  json.key("settings").open_object();
  json.member("port", std::int64_t{options.ports.first});
  json.member("audio_mask", std::int64_t{settings.audio_mask});
  json.member("audio_sink_filter", settings.audio_sink_filter == 1);
  json.member("3d", std::int64_t{settings.hdmi_3d_mode});
  json.key("latency").open_list();
  for (const u32 latency : settings.edid_latency) {
    json.value(std::int64_t{latency});
  }
  json.close().close();
}

void write_sources(json_writer_t &json, const row_t &row) {
  json.key("sources").open_list();
  for (const source_t &source : row.sources) {
    json.open_object().member("kind", source_kind_id(source.kind)).member("text", source.text);
    if (!source.key.empty()) {
      json.member("key", source.key);
    }
    if (source.line != 0) {
      json.member("line", std::int64_t{source.line});
    }
    json.close();
  }
  json.close();
}

void write_row(json_writer_t &json, const row_t &row) {
  const compose_decision_t &decision = row.decision;
  json.open_object().member("section", section_id(row.section));
  json.member("subject", compose_subject_string(decision.subject)).member("subject_id", std::int64_t{decision.subject});
  json.member("code", std::int64_t{decision.code}).member("name", row.name);
  json.member("verdict", compose_verdict_string(decision.verdict)).member("verdict_id", std::int64_t{decision.verdict});
  json.member("reason", compose_reason_string(decision.reason)).member("reason_id", std::int64_t{decision.reason});
  json.key("values").open_list();
  for (const i32 value : decision.value) {
    json.value(std::int64_t{value});
  }
  json.close().member("sentence", row.sentence);
  write_place(json, "position", decision.position);
  write_sources(json, row);
  json.close();
}

}  // namespace

std::string explanation_json(const explained_t &explained) {
  json_writer_t json;
  json.open_object().member("version", document_version);
  write_sink(json, explained);
  json.member("platform", explained.places.name());
  write_settings(json, explained.options);
  json.member("edid", hexadecimal(explained.composition.new_edid));
  json.key("decisions").open_list();
  for (const row_t &row : rows_of(explained)) {
    write_row(json, row);
  }
  json.close().close();
  return json.text();
}

std::string answer_json(const std::string &wanted, const std::vector<answer_t> &answers) {
  json_writer_t json;
  json.open_object().member("version", document_version).member("want", wanted);
  json.key("answers").open_list();
  for (const answer_t &answer : answers) {
    json.open_object().member("name", answer.name).member("offered", answer.is_offered);
    json.key("reasons").open_list();
    for (const std::string &reason : answer.reasons) {
      json.value(reason);
    }
    json.close().key("steps").open_list();
    for (const step_t &step : answer.steps) {
      json.open_object().member("text", step.text).member("key", step.key);
      if (step.line != 0) {
        json.member("line", std::int64_t{step.line});
      }
      json.close();
    }
    json.close().close();
  }
  json.close().close();
  return json.text();
}

}  // namespace edid_cli
