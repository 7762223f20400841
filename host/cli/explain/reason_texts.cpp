#include "explain/reason_texts.h"

#include <cstdio>

#include "edid_text/mode_names.h"
#include "edid_text/physical_address_text.h"
#include "explain/hdmi2_features.h"
#include "explain/reason_table.h"
#include "text/hexadecimal.h"

namespace edid_cli {
namespace {

std::string sample_rates(i32 value) {
  char text[128] = "";
  audio_freq_string(static_cast<u32>(value), text, sizeof text);
  const std::string rates(text);
  return rates.substr(0, rates.find_last_not_of(' ') + 1);
}

std::string megahertz_of_kilohertz(i32 value) {
  char text[32];
  std::snprintf(text, sizeof text, "%.2f MHz", value / 1000.0);
  return text;
}

std::string channels_text(i32 value) {
  return std::to_string(value) + (value == 1 ? " channel" : " channels");
}

/// One number in the form that a letter stands for.
std::string formatted(i32 value, char form) {
  switch (form) {
    case 'n':  // A place, counted from 1.
      return std::to_string(value + 1);
    case 'h':
      return hex_number(static_cast<u32>(value));
    case 'a':
      return physical_address_text(static_cast<u32>(value));
    case 'r':
      return sample_rates(value);
    case 'k':
      return megahertz_of_kilohertz(value);
    case 'm':  // A sink's TMDS clock.
      return value == 0 ? "declares none" : "declares " + std::to_string(value) + " MHz";
    case 'c':
      return channels_text(value);
    case 'o':
      return value != 0 ? "yes" : "no";
    default:
      return std::to_string(value);
  }
}

std::string priority_list(const compose_decision_t &decision, const explained_t &explained) {
  return priority_list_of(decision.subject, explained.family());
}

std::string addition_list(const compose_decision_t &decision, const explained_t &explained) {
  return addition_list_of(decision.subject, explained.family());
}

/// Who has a mode that the priority list doesn't name.
std::string who_has_it(const compose_decision_t &decision, const explained_t &explained) {
  const bool sink = decision.sink_index >= 0;
  const bool addition = (decision.origins & COMPOSE_ORIGIN_ADDITION_LIST) != 0;
  return addition && !sink ? addition_list(decision, explained) : "The sink";
}

std::string other_family(const compose_decision_t &, const explained_t &explained) {
  return explained.family() == 60 ? "50" : "60";
}

std::string missing_part(const compose_decision_t &, const explained_t &explained) {
  return explained.reading.missing_part;
}

/// Where a source finds none of its kind, it is the extension that it does not find.
std::string why_no_room(const compose_decision_t &decision, const explained_t &explained) {
  // Not of modes but of blocks: what takes the room is the rest of the extension.
  if (decision.subject == COMPOSE_SUBJECT_PASSED_BLOCK || decision.subject == COMPOSE_SUBJECT_ROOM_ITEM) {
    return "the extension has no room for it";
  }
  return explained.is_extension_announced()
             ? "there is no room for it: a source finds " + std::to_string(decision.value[0]) + " of its kind"
             : "without a monitor name sources do not read the extension";
}

/// Only what has changed; bit rates and sample sizes are not among a reason's numbers.
std::string narrowed(const compose_decision_t &decision, const explained_t &) {
  const i32(&value)[4] = decision.value;
  std::string text;
  if (value[0] != value[1]) {
    text = channels_text(value[0]) + " became " + std::to_string(value[1]);
  }
  if (value[2] != value[3]) {
    text += (text.empty() ? "" : ", ") + sample_rates(value[2]) + " became " + sample_rates(value[3]);
  }
  return text.empty() ? "fewer sample sizes, or a lower bit rate" : text;
}

/// Rates are counted down: 59 Hz is 59.94 Hz.
std::string rate(const compose_decision_t &decision, const explained_t &) {
  const std::string family = std::to_string(decision.code);
  const std::string told = std::to_string(decision.value[1]);
  return told + " Hz" + (told == family ? "" : ", which counts as " + family);
}

std::string raster(const compose_decision_t &decision, const explained_t &) {
  const i32(&value)[4] = decision.value;
  return raster_name(value[0], value[1], value[2], value[3] != 0);
}

std::string declared(const compose_decision_t &decision, const explained_t &) {
  return decision.verdict == COMPOSE_VERDICT_LEFT_OUT ? "" : ": 0 ms is declared, as other latencies are";
}

/// The tallest mode is looked for among the short video descriptors.
std::string unlisted(const compose_decision_t &decision, const explained_t &) {
  return decision.code != 0 ? "" : ", and it has no short video descriptor";
}

std::string key_of_feature(const compose_decision_t &decision, const explained_t &) {
  const hdmi2_feature_t *const feature = find_hdmi2_feature(decision.subject, decision.code);
  return feature != nullptr ? feature->key : "the platform";
}

std::string though_sink_has_it(const compose_decision_t &decision, const explained_t &) {
  return decision.value[1] != 0 ? ", though the sink has it" : "";
}

/// Whose rate a mode is above.
std::string link(const compose_decision_t &decision, const explained_t &explained) {
  const compose_decision_t *const rate = find_decision(explained.composition, COMPOSE_SUBJECT_LINK_RATE);
  const bool is_of_box = decision.value[2] != 0 || rate == nullptr || rate->value[0] <= rate->value[1];
  return is_of_box ? "the box's receiver takes" : "the sink takes";
}

std::string vrr_range(const compose_decision_t &decision, const explained_t &) {
  const i32(&value)[4] = decision.value;
  return "refresh rates from " + std::to_string(value[0]) + " Hz " +
         (value[1] == 0 ? "without a limit" : "to " + std::to_string(value[1]) + " Hz");
}

struct named_place_t {
  std::string_view name;
  std::string (*text)(const compose_decision_t &decision, const explained_t &explained);
};

constexpr named_place_t named_places[] = {
    {"priority", priority_list},
    {"addition", addition_list},
    {"who", who_has_it},
    {"other", other_family},
    {"missing", missing_part},
    {"no_room", why_no_room},
    {"narrowed", narrowed},
    {"rate1", rate},
    {"raster0", raster},
    {"declared", declared},
    {"unlisted", unlisted},
    {"key", key_of_feature},
    {"though", though_sink_has_it},
    {"link", link},
    {"vrr_range", vrr_range},
};

/// What a place in braces stands for.
std::string resolved(std::string_view place, const compose_decision_t &decision, const explained_t &explained) {
  for (const named_place_t &named : named_places) {
    if (named.name == place) {
      return named.text(decision, explained);
    }
  }
  const i32(&value)[4] = decision.value;
  const std::size_t number = static_cast<std::size_t>(place.front() - '0');
  return formatted(value[number], place.size() > 2 ? place[2] : ' ');
}

/// The library reads a short video descriptor as one of VIC 1 to 127 with a native bit; CTA-861-F made the bytes from
/// 193 on VICs of their own.
std::string above_last_vic(const compose_decision_t &decision, const explained_t &explained) {
  const u32 vic = sink_vic(decision, explained);
  const std::string read_as =
      vic == decision.code ? "" : " It takes this one for VIC " + std::to_string(decision.code) + ".";
  const u32 hdmi_vic = hdmi_vic_of_vic(vic);
  const std::string other = hdmi_vic == 0 ? "" : " HDMI 1.4 has it as 4k:" + std::to_string(hdmi_vic) + ".";
  return "The sink has it; VICs above 64 are offered with hdmi2.enable = 1 only." + read_as + other;
}

}  // namespace

u32 sink_vic(const compose_decision_t &decision, const explained_t &explained) {
  i32 place = decision.sink_index;
  const bool is_above = decision.subject == COMPOSE_SUBJECT_VIDEO_MODE && decision.code > last_library_vic;
  for (const ll_entry_t *entry = explained.sink.video_list.head; is_above && entry != nullptr; entry = entry->next) {
    if (place-- == 0) {
      return vic_of(*static_cast<const short_video_desc_t *>(entry->data));
    }
  }
  return decision.code;
}

bool rests_on_unread(const compose_decision_t &decision, const explained_t &explained) {
  return explained.reading.is_incomplete() && reason_text(decision.reason).unread_sentence != nullptr;
}

std::string reason_sentence(const compose_decision_t &decision, const explained_t &explained) {
  const reason_text_t &row = reason_text(decision.reason);
  if (row.sentence == nullptr) {
    return compose_reason_string(decision.reason);
  }
  if (decision.subject == COMPOSE_SUBJECT_VIDEO_MODE && decision.code > last_library_vic) {
    return above_last_vic(decision, explained);
  }
  const char *const sentence = rests_on_unread(decision, explained) ? row.unread_sentence : row.sentence;
  std::string text;
  std::string_view rest = sentence;
  for (std::size_t open = 0; (open = rest.find('{')) != std::string_view::npos;) {
    const std::size_t close = rest.find('}', open);
    text += rest.substr(0, open);
    text += resolved(rest.substr(open + 1, close - open - 1), decision, explained);
    rest.remove_prefix(close + 1);
  }
  return text.append(rest);
}

}  // namespace edid_cli
