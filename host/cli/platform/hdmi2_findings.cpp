#include "platform/hdmi2_findings.h"

#include <algorithm>
#include <map>

#include "edid_text/mode_names.h"
#include "platform/configuration_readings.h"
#include "platform/platform_keys.h"

namespace edid_cli {
namespace {

constexpr i32 as_the_sink = 2;

/// What a composition takes of the table, by the names of its keys.
class hdmi2_settings_t {
 public:
  explicit hdmi2_settings_t(const composition_t &without_sink) {
    for (const kept_reading_t &reading : without_sink.readings) {
      const bool is_of_table = inner_table_of(reading.key->name) == hdmi2_table;
      if (is_of_table && reading.entry >= 0 && reading.place >= 0) {
        lists_[reading.key->name].push_back(reading);
      } else if (is_of_table && reading.entry < 0) {
        numbers_[reading.key->name] = reading.used;
      }
    }
  }

  i32 operator[](const std::string &key) const {
    const auto found = numbers_.find(std::string(hdmi2_table) + "." + key);
    return found != numbers_.end() ? found->second : 0;
  }

  const std::vector<kept_reading_t> &list(const std::string &key) const {
    static const std::vector<kept_reading_t> none;
    const auto found = lists_.find(std::string(hdmi2_table) + "." + key);
    return found != lists_.end() ? found->second : none;
  }

 private:
  std::map<std::string, i32> numbers_;
  std::map<std::string, std::vector<kept_reading_t>> lists_;
};

struct rule_t {
  const char *key;  ///< Where the finding points.
  severity_t severity;
  bool (*is_broken)(const hdmi2_settings_t &table);
  const char *text;
};

bool has_no_bt2020(const hdmi2_settings_t &table) {
  return table["bt2020_rgb"] == 0 && table["bt2020_ycc"] == 0;
}

/// Rates above this need the status and control data channel, MHz.
constexpr i32 rate_without_scdc = 340;

bool has_no_scdc(const hdmi2_settings_t &table) {
  return table["scdc"] == 0 && table["tmds_limit"] <= rate_without_scdc;
}

constexpr rule_t rules[] = {
    {"hdr_pq", severity_t::warning, [](const auto &table) { return table["hdr_pq"] != 0 && has_no_bt2020(table); },
     "HDR with PQ needs BT.2020: bt2020_rgb and bt2020_ycc are both 0"},
    {"hdr_hlg", severity_t::warning, [](const auto &table) { return table["hdr_hlg"] != 0 && has_no_bt2020(table); },
     "HDR with HLG needs BT.2020: bt2020_rgb and bt2020_ycc are both 0"},
    {"dc_36bit_420", severity_t::warning,
     [](const auto &table) { return table["dc_36bit_420"] != 0 && table["dc_30bit_420"] == 0; },
     "36 bits in 4:2:0 ask for 30 bits as well: dc_30bit_420 is 0, and 30 bits are offered all the same"},
    {"dc_30bit_420", severity_t::warning,
     [](const auto &table) { return table["dc_30bit_420"] != 0 && table["y420"] == 0; }, "has no effect: y420 is 0"},
    {"dc_36bit_420", severity_t::warning,
     [](const auto &table) { return table["dc_36bit_420"] != 0 && table["y420"] == 0; }, "has no effect: y420 is 0"},
    {"vrr_max", severity_t::warning,
     [](const auto &table) { return table["vrr"] != 0 && table["vrr_max"] > 0 && table["vrr_max"] < 100; },
     "no source may use a range that ends below 100 Hz, so none is offered: write 100 or more, or 0 for no limit"},
    {"pass_freesync", severity_t::warning,
     [](const auto &table) { return table["pass_freesync"] != 0 && table["vrr"] != as_the_sink; },
     "has no effect: the block is passed on with vrr = 2 only"},
    {"read_request", severity_t::warning,
     [](const auto &table) { return table["read_request"] != 0 && has_no_scdc(table); },
     "has no effect: up to 340 MHz it needs scdc = 1"},
    {"scramble_low", severity_t::warning,
     [](const auto &table) { return table["scramble_low"] != 0 && has_no_scdc(table); },
     "has no effect: up to 340 MHz it needs scdc = 1"},
    {"vic_priority_list", severity_t::note, [](const auto &table) { return table.list("vic_priority_list").empty(); },
     "names no mode: none above VIC 64 is offered"},
    {"preferred_extended", severity_t::warning,
     [](const auto &table) { return table["preferred_extended"] != 0 && table.list("vic_priority_list").empty(); },
     "has no effect: vic_priority_list names no mode"},
};

position_t position_of(const std::string &key) {
  const auto node = configuration_node_t::find(platform_path(key));
  return node ? node->position() : position_t{};
}

finding_t finding_at(const std::string &name, severity_t severity, const std::string &text) {
  const std::string key = std::string(hdmi2_table) + "." + name;
  return {severity, position_of(key), key, text};
}

/// Whether no sink can have it, as the box's receiver is too slow.
bool is_too_fast(u32 vic, const hdmi2_settings_t &table) {
  constexpr u32 least_420_khz = 590'000;
  const u32 limit = static_cast<u32>(table["tmds_limit"] + 4) / 5 * 5 * 1000;
  const u32 clock = pixel_clock_of_vic(vic);
  const bool fits_420 = table["y420"] != 0 && clock >= least_420_khz && clock / 2 <= limit;
  return clock > limit && !fits_420;
}

findings_t find_too_fast_modes(const hdmi2_settings_t &table) {
  findings_t findings;
  for (const kept_reading_t &entry : table.list("vic_priority_list")) {
    const auto vic = static_cast<u32>(entry.used);
    if (is_too_fast(vic, table)) {
      const auto node = node_of(entry);
      findings.push_back({severity_t::warning, node ? node->position() : position_t{}, name_of(entry),
                          "no composition can offer VIC " + std::to_string(vic) + ": it needs " +
                              std::to_string((pixel_clock_of_vic(vic) + 999) / 1000) + " MHz, and tmds_limit is " +
                              std::to_string(table["tmds_limit"])});
    }
  }
  return findings;
}

}  // namespace

findings_t find_in_hdmi2_table(const composition_t &without_sink) {
  const hdmi2_settings_t table(without_sink);
  const auto node = configuration_node_t::find(platform_path(hdmi2_table));
  if (!node) {
    return {};
  }
  if (table["enable"] == 0) {
    return {{severity_t::note, node->position(), hdmi2_table, "has no effect: enable is not 1"}};
  }
  findings_t findings = find_too_fast_modes(table);
  for (const rule_t &rule : rules) {
    if (rule.is_broken(table)) {
      findings.push_back(finding_at(rule.key, rule.severity, rule.text));
    }
  }
  return findings;
}

}  // namespace edid_cli
