#include "platform/list_findings.h"

#include <algorithm>
#include <map>
#include <string_view>

namespace edid_cli {
namespace {

using readings_t = std::vector<kept_reading_t>;

/// A list of modes that a platform adds to the sink's, and the list that must name them too.
struct pair_t {
  std::string_view addition;
  std::string_view priority;
};
constexpr pair_t pairs[] = {
    {"60_hz_addition_list", "60_hz_priority_list"},
    {"50_hz_addition_list", "50_hz_priority_list"},
    {"4k_x_2k_addition_list", "4k_x_2k_priority_list"},
    {"hdmi2.vic_addition_list", "hdmi2.vic_priority_list"},
};

bool is_priority_list(std::string_view name) {
  return std::any_of(std::begin(pairs), std::end(pairs), [name](const pair_t &pair) { return pair.priority == name; });
}

/// What makes two entries of a list the same.
std::string subject_of(const kept_reading_t &entry) {
  return entry.key->kind == CONFIGURATION_STANDARD_TIMINGS ? entry.text : std::to_string(entry.used);
}

std::string code_text(const kept_reading_t &entry) {
  switch (entry.key->kind) {
    case CONFIGURATION_VIDEO_MODES:
    case CONFIGURATION_EXTENDED_VICS:
      return "VIC " + std::to_string(entry.used);
    case CONFIGURATION_HDMI_VICS:
      return "4Kx2K mode " + std::to_string(entry.used);
    case CONFIGURATION_TIMING_BITS:
      return "bit " + std::to_string(entry.used);
    default:
      return "\"" + entry.text + "\"";
  }
}

class finder_t {
 public:
  explicit finder_t(const composition_t &without_sink) : composition_(without_sink) {
    for (const kept_reading_t &reading : composition_.readings) {
      if (reading.place >= 0) {
        lists_[reading.key->name].push_back(&reading);
      }
    }
  }

  findings_t run() && {
    for (const auto &[name, entries] : lists_) {
      find_repetitions(name, entries);
    }
    for (const pair_t &pair : pairs) {
      find_unused_additions(pair);
    }
    for (const compose_decision_t &decision : composition_.decisions) {
      if (decision.subject == COMPOSE_SUBJECT_AUDIO_FORMAT && decision.verdict == COMPOSE_VERDICT_LEFT_OUT) {
        find_audio_format(decision);
      }
    }
    return std::move(findings_);
  }

 private:
  using entries_t = std::vector<const kept_reading_t *>;

  void find(severity_t severity, const kept_reading_t &entry, std::string text) {
    const auto node = node_of(entry);
    findings_.push_back({severity, node ? node->position() : position_t{}, name_of(entry), std::move(text)});
  }

  void find_repetitions(const std::string &list, const entries_t &entries) {
    if (entries.front()->key->kind == CONFIGURATION_AUDIO_FORMATS) {
      return;
    }
    std::map<std::string, const kept_reading_t *> seen;
    for (const kept_reading_t *entry : entries) {
      const auto [first, is_new] = seen.emplace(subject_of(*entry), entry);
      if (is_new) {
        continue;
      }
      const bool is_extended = entry->key->kind == CONFIGURATION_EXTENDED_VICS;
      const bool takes_room =
          (is_priority_list(list) && !is_extended) || entry->key->kind == CONFIGURATION_STANDARD_TIMINGS;
      find(takes_room ? severity_t::warning : severity_t::note, *entry,
           "repeats " + name_of(*first->second) + (takes_room ? ": " + code_text(*entry) + " is offered twice" : ""));
    }
  }

  void find_unused_additions(const pair_t &pair) {
    const entries_t &priority = lists_[std::string(pair.priority)];
    for (const kept_reading_t *entry : lists_[std::string(pair.addition)]) {
      const bool is_named = std::any_of(priority.begin(), priority.end(),
                                        [entry](const kept_reading_t *one) { return one->used == entry->used; });
      if (!is_named) {
        find(severity_t::warning, *entry,
             "no composition can offer " + code_text(*entry) + ": " + std::string(pair.priority) + " does not name it");
      }
    }
  }

  /// Formats of the platform that are left out even without a sink.
  void find_audio_format(const compose_decision_t &decision) {
    const entries_t &formats = lists_["audio.entry_?"];
    const auto place = static_cast<std::size_t>(decision.priority_index);
    if (decision.priority_index < 0 || place >= formats.size()) {
      return;
    }
    const kept_reading_t &entry = *formats[place];
    if (decision.reason == COMPOSE_REASON_DUPLICATE) {
      find(severity_t::note, entry, "has no effect: a format before it covers it");
    } else if (decision.reason == COMPOSE_REASON_NO_ROOM &&
               decision.value[0] == static_cast<i32>(entry.key->most_entries)) {
      find(severity_t::warning, entry,
           "has no effect: only " + std::to_string(entry.key->most_entries) + " formats are encoded");
    } else if (decision.reason == COMPOSE_REASON_SINK_FORMATS_ONLY) {
      find(severity_t::note, entry, "has no effect: audio.pass_through offers the formats of the sink only");
    }
  }

  const composition_t &composition_;
  std::map<std::string, entries_t> lists_;
  findings_t findings_;
};

}  // namespace

findings_t find_between_entries(const composition_t &without_sink) {
  return finder_t(without_sink).run();
}

}  // namespace edid_cli
