#include "platform/consequences.h"

#include <algorithm>
#include <map>
#include <memory>

#include "edid_text/decoded_edid.h"
#include "platform/made_sink.h"
#include "platform/platform_keys.h"

namespace edid_cli {
namespace {

/// The key that most often has to do with a problem: where the finding points.
std::string key_of(problem_kind_t kind, u32 family) {
  switch (kind) {
    case problem_kind_t::not_announced:
      return "monitor_name";
    case problem_kind_t::video_block_too_long:
    case problem_kind_t::too_few_modes:
      return std::to_string(family) + "_hz_priority_list";
    case problem_kind_t::tmds_clock_above_hdmi_1_4:
    case problem_kind_t::tmds_clock_above_sink:
      return "tmds_override";
    case problem_kind_t::deep_color_not_in_sink:
      return "dc_30bit";
    default:
      return "";
  }
}

u32 family_of(const composition_t &composition) {
  const auto rate =
      std::find_if(composition.decisions.begin(), composition.decisions.end(),
                   [](const compose_decision_t &decision) { return decision.subject == COMPOSE_SUBJECT_NATIVE_RATE; });
  return rate != composition.decisions.end() ? rate->code : 60;
}

/// The modes that a priority list names, best first.
std::vector<u32> modes_of(const std::vector<kept_reading_t> &readings, const std::string &list) {
  std::vector<u32> vics;
  for (const kept_reading_t &reading : readings) {
    const auto vic = static_cast<u32>(reading.used);
    if (reading.key->name == list && reading.place >= 0 && std::find(vics.begin(), vics.end(), vic) == vics.end()) {
      vics.push_back(vic);
    }
  }
  return vics;
}

class collector_t {
 public:
  explicit collector_t(const compose_cfg_t &settings) { options_.settings = settings; }

  void add(const composition_t &composition, const std::string &where, const edid_t *sink = nullptr) {
    for (const problem_t &problem : problems_of(composition, sink)) {
      // Sinks are unread for different reasons, and different things lack room; the rest is the same problem, whatever
      // its numbers.
      const bool has_subjects =
          problem.kind == problem_kind_t::sink_unread || problem.kind == problem_kind_t::left_out_for_room;
      const std::string subject = has_subjects ? problem.text : "";
      const auto [known, is_new] = occurrences_.emplace(std::pair(problem.kind, subject),
                                                        occurrence_t{problem, where, family_of(composition), 0});
      known->second.others += is_new ? 0 : 1;
    }
  }

  void compose_for(const named_sink_t &sink, bool is_real) {
    const composition_t composition = compose(
        options_, options_.settings.port, sink.edid, [](const compose_log_line_t &) {}, decisions_t::kept);
    const decoded_edid_t record(sink.edid);
    add(composition, sink.name, is_real ? &record.record() : nullptr);
  }

  findings_t findings() const {
    findings_t findings;
    for (const auto &[subject, occurrence] : occurrences_) {
      const std::string key = key_of(occurrence.problem.kind, occurrence.family);
      const auto node = key.empty() ? std::nullopt : configuration_node_t::find(platform_path(key));
      const std::string others = occurrence.others == 0 ? "" : " and " + std::to_string(occurrence.others) + " more";
      findings.push_back({occurrence.problem.severity, node ? node->position() : position_t{}, key,
                          occurrence.problem.text + " (" + occurrence.where + others + ")"});
    }
    return findings;
  }

 private:
  struct occurrence_t {
    problem_t problem;
    std::string where;
    u32 family;
    std::size_t others;
  };

  composition_options_t options_;
  std::map<std::pair<problem_kind_t, std::string>, occurrence_t> occurrences_;
};

}  // namespace

findings_t find_consequences(const composition_t &without_sink, const compose_cfg_t &settings,
                             std::span<const named_sink_t> sinks) {
  collector_t collector(settings);
  collector.add(without_sink, "without a sink");
  for (const u32 family : {60U, 50U}) {
    const std::vector<u32> vics = modes_of(without_sink.readings, std::to_string(family) + "_hz_priority_list");
    const std::vector<u32> extended = modes_of(without_sink.readings, "hdmi2.vic_priority_list");
    collector.compose_for(
        {"with a " + std::to_string(family) + " Hz sink that takes everything", made_sink(family, vics, extended)},
        false);
  }
  for (const named_sink_t &sink : sinks) {
    collector.compose_for({"with " + sink.name, sink.edid}, true);
  }
  return collector.findings();
}

}  // namespace edid_cli
