#include "explain/explanation.h"

#include <string_view>

#include "edid_text/edid_fields.h"
#include "io/program_name.h"
#include "io/standard_output.h"

namespace edid_cli {
namespace {

/// Fields of an EDID, and whether of those with many values the number is told only.
struct told_field_t {
  std::string_view field;
  bool is_counted;
};

constexpr told_field_t told_fields[] = {
    {"monitor name", false},
    {"manufacturer", false},
    {"video mode", true},
    {"4Kx2K mode", false},
    {"audio format", true},
    {"speakers", false},
    {"physical address", false},
    {"highest TMDS clock in MHz", false},
    {"deep colour, 30 bits", false},
    {"deep colour, 36 bits", false},
    {"mandatory 3D", false},
};

constexpr std::string_view told_keys[] = {
    "monitor_name",          "native_refresh_rate",   "geometry_limit",      "current_mode_set_to_priority",
    "60_hz_priority_list",   "60_hz_addition_list",   "50_hz_priority_list", "50_hz_addition_list",
    "4k_x_2k_priority_list", "4k_x_2k_addition_list", "audio.pass_through",
};

/// A file without its folders: whoever reads the page does not have them.
std::string short_name(const std::string &source) {
  return source.empty() ? "none" : source.substr(source.rfind('/') + 1);
}

std::string title_of(const explained_t &explained) {
  const bool has_name = explained.sink.monitor_name[0] != '\0';
  const std::string sink = explained.sink_bytes.empty() ? "no sink"
                           : has_name                   ? explained.sink.monitor_name
                                                        : short_name(explained.sink_name);
  return "EDID of " + explained.places.name() + " for " + sink;
}

std::vector<fact_t> edid_facts(const edid_records_t &edid, const std::string &source) {
  std::vector<fact_t> facts{{"from", {source}}};
  for (const told_field_t &told : told_fields) {
    for (const edid_field_t &field : edid_fields()) {
      if (field.name != told.field) {
        continue;
      }
      auto values = field.values(edid);
      facts.push_back(told.is_counted ? fact_t{std::string(field.name) + "s", {std::to_string(values.size())}}
                                      : fact_t{std::string(field.name), std::move(values)});
    }
  }
  return facts;
}

std::vector<fact_t> platform_facts(const platform_check_t &check, const std::string &name) {
  std::vector<fact_t> facts{{"from", {name}}};
  for (const std::string_view key : told_keys) {
    for (const key_reading_t &reading : check.readings) {
      if (reading.key == key) {
        facts.push_back({std::string(key), {reading.value + ", " + line_text(reading.position)}});
      }
    }
  }
  facts.push_back({"findings", {check.findings.empty() ? "none" : std::to_string(check.findings.size())}});
  return facts;
}

}  // namespace

std::string line_text(const position_t &position) {
  return position.line != 0 ? "line " + std::to_string(position.line) : "default";
}

explanation_t explanation_of(const explained_t &explained) {
  const new_edid_t &bytes = explained.composition.new_edid;
  // What the library prints here it has printed before, or the document says it in other words.
  const discarded_output_t unseen;
  const decoded_edid_t new_edid(std::vector<u8>(bytes.begin(), bytes.end()));
  const hdmi2_t sink_hdmi2 = decoded_hdmi2(explained.sink_bytes);
  const edid_records_t sink_records{explained.sink, sink_hdmi2};

  explanation_t explanation;
  explanation.title = title_of(explained);
  explanation.program = std::string(program_name) + " " EDID_COMPOSER_VERSION;
  explanation.sink_source = explained.sink_name;
  explanation.sink_file = short_name(explained.sink_name);
  explanation.sink_manufacturer = explained.sink.manufacturer;
  explanation.sink_name = explained.sink.monitor_name;
  explanation.sink_bytes = explained.sink_bytes;
  explanation.reading = explained.reading;
  explanation.platform = explained.places.name();
  explanation.options = explained.options;

  explanation.rows = rows_of(explained);
  explanation.warnings = warnings_of(explanation.rows);
  explanation.summary = summary_of(explanation.rows, explained);

  explanation.platform_check = check_platform(explained.options.settings, {});
  explanation.sink_facts = edid_facts(sink_records, explanation.sink_file);
  explanation.platform_facts = platform_facts(explanation.platform_check, explanation.platform);
  explanation.new_edid_facts = edid_facts(new_edid.records(), "composed");
  explanation.comparison = comparison_of(sink_records, new_edid.records());
  explanation.new_edid = bytes;
  explanation.bytes = name_bytes(bytes);
  return explanation;
}

}  // namespace edid_cli
