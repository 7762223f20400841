#include "explain/sources.h"

#include <string_view>

#include "edid_text/mode_names.h"
#include "edid_text/physical_address_text.h"
#include "explain/decision_names.h"
#include "explain/hdmi2_features.h"
#include "explain/reason_table.h"
#include "text/hexadecimal.h"

namespace edid_cli {
namespace {

constexpr const char *source_kind_ids[] = {"sink", "platform", "setting", "library"};

struct sink_origin_t {
  u32 origin;
  const char *name;
};

// A decision's place counts in the origin that is the lowest bit of its origins.
constexpr sink_origin_t sink_origins[] = {
    {COMPOSE_ORIGIN_DETAILED_TIMING, "detailed timing"},    {COMPOSE_ORIGIN_STANDARD_TIMING, "standard timing"},
    {COMPOSE_ORIGIN_SHORT_VIDEO, "short video descriptor"}, {COMPOSE_ORIGIN_SINK_4K, "HDMI VIC"},
    {COMPOSE_ORIGIN_SINK_AUDIO, "short audio descriptor"},  {COMPOSE_ORIGIN_SINK_420, "mode in YCbCr 4:2:0 only"},
};

struct sink_part_name_t {
  sink_part_t part;
  const char *name;
};

constexpr sink_part_name_t sink_part_names[] = {
    {sink_part_t::detailed_timing, "detailed timing"},
    {sink_part_t::standard_timing, "standard timing"},
    {sink_part_t::short_video, "short video descriptor"},
};

class gathering_t {
 public:
  gathering_t(const compose_decision_t &decision, const explained_t &explained)
      : decision_(decision), explained_(explained) {}

  std::vector<source_t> run() && {
    add_sink();
    add_lists();
    if (const hdmi2_feature_t *const feature = find_hdmi2_feature(decision_.subject, decision_.code)) {
      add_key(feature->key);
    }
    add_reason(reason_text(decision_.reason));
    if (names(COMPOSE_ORIGIN_LIBRARY)) {
      sources_.push_back({source_kind_t::library, "the library"});
    }
    return std::move(sources_);
  }

 private:
  bool names(u32 origin) const { return (decision_.origins & origin) != 0; }

  void add_sink() {
    if (is_of_unread_block(decision_, explained_.reading)) {
      sources_.push_back({source_kind_t::sink, "sink: bytes after block 1"});
      return;
    }
    std::string text;
    for (const sink_origin_t &row : sink_origins) {
      if (names(row.origin)) {
        text += text.empty() ? "sink: " : ", ";
        text += row.name;
        text += text.find(',') == std::string::npos && decision_.sink_index >= 0
                    ? " " + std::to_string(decision_.sink_index + 1)
                    : "";
      }
    }
    if (!text.empty()) {
      sources_.push_back({source_kind_t::sink, text});
    }
  }

  void add_entry(const std::string &list, i32 place) {
    if (const list_entry_t *const entry = explained_.places.entry(list, place)) {
      sources_.push_back({source_kind_t::platform, explained_.places.place_of(entry->position) + " " + entry->name,
                          entry->name, entry->position.line});
    }
  }

  void add_lists() {
    const u32 family = explained_.family();
    const u32 other = family == 60 ? 50 : 60;
    const bool is_of_other_family = decision_.reason == COMPOSE_REASON_OTHER_REFRESH_FAMILY;
    if (names(COMPOSE_ORIGIN_PRIORITY_LIST)) {
      add_entry(priority_list_of(decision_.subject, family), decision_.priority_index);
    } else if (names(COMPOSE_ORIGIN_OTHER_PRIORITY_LIST) && is_of_other_family) {
      add_entry(platform_list::priority(other), decision_.priority_index);
    }
    if (names(COMPOSE_ORIGIN_ADDITION_LIST)) {
      add_entry(addition_list_of(decision_.subject, family), decision_.addition_index);
    } else if (names(COMPOSE_ORIGIN_OTHER_ADDITION_LIST) && is_of_other_family) {
      add_entry(platform_list::addition(other), decision_.addition_index);
    }
    if (names(COMPOSE_ORIGIN_PLATFORM_AUDIO)) {
      add_entry(platform_list::audio, decision_.priority_index);
    }
  }

  void add_reason(const reason_text_t &text) {
    for (const sink_part_name_t &row : sink_part_names) {
      if (row.part == text.sink_part) {
        sources_.push_back(
            {source_kind_t::sink, std::string("sink: ") + row.name + " " + std::to_string(decision_.value[0] + 1)});
      }
    }
    if (text.sink_part == sink_part_t::address) {
      sources_.push_back({source_kind_t::sink, "sink: physical address " + physical_address_text(explained_.sink)});
    }
    for (const char *const key : text.keys) {
      if (key != nullptr && belongs(key)) {
        add_key(key);
      }
    }
    if (text.setting != nullptr) {
      add_setting(text.setting);
    }
  }

  /// Of the two colour depths only the one that the decision is about, unless one depends on the other.
  bool belongs(std::string_view key) const {
    const bool is_own =
        decision_.subject != COMPOSE_SUBJECT_DEEP_COLOR || decision_.reason != COMPOSE_REASON_DEEP_COLOR_OF_PLATFORM;
    return is_own || key == (decision_.code == 30 ? "dc_30bit" : "dc_36bit");
  }

  void add_key(const std::string &key) {
    const position_t position = platform_places_t::position_of(key);
    const std::string text = position.line == 0 ? explained_.places.name() + " " + key + " (not there)"
                                                : explained_.places.place_of(position) + " " + key + " = " +
                                                      platform_places_t::value_at(key);
    sources_.push_back({source_kind_t::platform, text, key, position.line});
  }

  void add_setting(const std::string &option) {
    sources_.push_back({source_kind_t::setting, option + value_of(option), option});
  }

  std::string value_of(std::string_view option) const {
    const compose_cfg_t &settings = explained_.options.settings;
    if (option == "--audio-mask") {
      return " " + hex_number(settings.audio_mask);
    }
    if (option == "--3d") {
      return settings.hdmi_3d_mode == always_3d_mode ? " on" : settings.hdmi_3d_mode == no_3d_mode ? " off" : " sink";
    }
    if (option == "--port") {
      return " " + std::to_string(explained_.options.ports.first);
    }
    if (option == "--latency") {
      return " " + std::to_string(decision_.code < 4 ? settings.edid_latency[decision_.code] : 0) + " ms";
    }
    if (option == "--current-mode") {
      const video_mode_t &mode = settings.hdmi_current_mode;
      return mode.width == 0 ? " (not given)"
                             : " " + raster_name(static_cast<i32>(mode.width), static_cast<i32>(mode.height),
                                                 static_cast<i32>(mode.refresh), mode.interlaced == 1);
    }
    return "";
  }

  const compose_decision_t &decision_;
  const explained_t &explained_;
  std::vector<source_t> sources_;
};

}  // namespace

const char *source_kind_id(source_kind_t kind) {
  return source_kind_ids[static_cast<std::size_t>(kind)];
}

std::vector<source_t> sources_of(const compose_decision_t &decision, const explained_t &explained) {
  return gathering_t(decision, explained).run();
}

}  // namespace edid_cli
