#include "platform/platform_check.h"

#include <algorithm>
#include <climits>

#include "platform/hdmi2_findings.h"
#include "platform/key_findings.h"
#include "platform/list_findings.h"
#include "platform/platform_keys.h"
#include "platform/unknown_keys.h"
#include "text/hexadecimal.h"

namespace edid_cli {
namespace {

std::string audio_text(i32 value) {
  const auto bytes = static_cast<u32>(value);
  short_audio_desc_t format{};
  const bool decodes = decode_edid_short_audio(static_cast<u8>(bytes), static_cast<u8>(bytes >> 8),
                                               static_cast<u8>(bytes >> 16), &format) != 0;
  const std::string number = hex_number(bytes, 6);
  return !decodes ? number
                  : number + " (" + short_audio_string(format.type) + ", " + std::to_string(format.channels) +
                        (format.channels == 1 ? " channel)" : " channels)");
}

std::string entries_text(const kept_reading_t &list) {
  const std::string entries = std::to_string(list.found) + (list.found == 1 ? " entry" : " entries");
  return list.used == list.found ? entries : std::to_string(list.used) + " of " + entries;
}

std::string value_text(const kept_reading_t &reading) {
  const configuration_key_t &key = *reading.key;
  if (key.kind == CONFIGURATION_AUDIO_FORMATS) {
    return reading.entry < 0 ? "absent" : audio_text(reading.used);
  }
  if (is_list(key)) {
    return entries_text(reading);
  }
  if (key.kind == CONFIGURATION_TEXT) {
    return "\"" + reading.text + "\"";
  }
  return key.kind == CONFIGURATION_UNSIGNED ? std::to_string(static_cast<u32>(reading.used))
                                            : std::to_string(reading.used);
}

/// Each audio format has a row; of a list, the list.
bool has_row(const kept_reading_t &reading) {
  return reading.key->kind == CONFIGURATION_AUDIO_FORMATS ? reading.entry >= 0 || reading.reason == CONFIGURATION_ABSENT
                                                          : reading.entry < 0;
}

key_reading_t row_of(const kept_reading_t &reading) {
  const auto node = node_of(reading);
  const bool is_from_file = reading.reason != CONFIGURATION_ABSENT && node;
  return {reading.entry < 0 ? name_text(*reading.key) : name_of(reading), value_text(reading),
          default_text(*reading.key), limits_text(*reading.key), is_from_file ? node->position() : position_t{}};
}

void append(findings_t &findings, const findings_t &more) {
  findings.insert(findings.end(), more.begin(), more.end());
}

}  // namespace

platform_check_t check_platform(const compose_cfg_t &settings, std::span<const named_sink_t> sinks) {
  platform_check_t check;
  const composition_t without_sink = compose_without_sink(settings);
  for (const kept_reading_t &reading : without_sink.readings) {
    if (has_row(reading)) {
      check.readings.push_back(row_of(reading));
    }
  }
  std::stable_sort(check.readings.begin(), check.readings.end(), [](const auto &left, const auto &right) {
    const auto line = [](const key_reading_t &row) { return row.position.line != 0 ? row.position.line : UINT_MAX; };
    return line(left) < line(right);
  });

  // Without the table, nothing else is worth saying.
  check.findings = find_missing_table();
  if (check.findings.empty()) {
    append(check.findings, find_in_readings(without_sink.readings));
    append(check.findings, find_between_entries(without_sink));
    append(check.findings, find_in_hdmi2_table(without_sink));
    append(check.findings, find_unknown_keys());
    append(check.findings, find_consequences(without_sink, settings, sinks));
  }
  sort_findings(check.findings);
  return check;
}

void sort_findings(findings_t &findings) {
  std::stable_sort(findings.begin(), findings.end(), [](const auto &left, const auto &right) {
    return std::pair(left.position.line, left.position.column) < std::pair(right.position.line, right.position.column);
  });
}

}  // namespace edid_cli
