#include "explain/decision_names.h"

#include <cstdlib>
#include <iterator>
#include <optional>

#include "edid_text/edid_value_texts.h"
#include "edid_text/mode_names.h"
#include "edid_text/physical_address_text.h"
#include "explain/hdmi2_features.h"
#include "explain/reason_texts.h"

namespace edid_cli {
namespace {

constexpr const char *latency_names[] = {"video latency", "audio latency", "interlaced video latency",
                                         "interlaced audio latency"};

/// The descriptor that an audio decision is about, as its first source has it.
std::optional<short_audio_desc_t> audio_of(const compose_decision_t &decision, const explained_t &explained) {
  if ((decision.origins & COMPOSE_ORIGIN_PLATFORM_AUDIO) != 0) {
    const list_entry_t *const entry = explained.places.entry(platform_list::audio, decision.priority_index);
    const auto value = entry != nullptr ? static_cast<u32>(std::strtol(entry->text.c_str(), nullptr, 10)) : 0U;
    short_audio_desc_t format{};
    if ((value >> 3 & 15U) != 0 && decode_edid_short_audio(static_cast<u8>(value), static_cast<u8>(value >> 8),
                                                           static_cast<u8>(value >> 16), &format) != 0) {
      return format;
    }
    return std::nullopt;
  }
  i32 place = decision.sink_index;
  for (const ll_entry_t *entry = explained.sink.audio_list.head; entry != nullptr; entry = entry->next) {
    if (place-- == 0) {
      return *static_cast<const short_audio_desc_t *>(entry->data);
    }
  }
  return std::nullopt;
}

std::string audio_name(const compose_decision_t &decision, const explained_t &explained) {
  const auto format = audio_of(decision, explained);
  if (format) {
    return audio_type_name(decision.code) + ", " + channels_name(format->channels);
  }
  constexpr u32 basic_audio_channels = 2;
  const bool is_basic = (decision.origins & COMPOSE_ORIGIN_LIBRARY) != 0;
  return audio_type_name(decision.code) + (is_basic ? ", " + channels_name(basic_audio_channels) : "");
}

std::string sink_timing_name(const compose_decision_t &decision, const explained_t &explained) {
  const i32(&value)[4] = decision.value;
  if ((decision.origins & COMPOSE_ORIGIN_DETAILED_TIMING) != 0) {
    // One without lines is none; it is named all the same, so that it can be found.
    return value[1] == 0 ? std::to_string(value[0]) + "x0" : raster_name(value[0], value[1], value[2], value[3] != 0);
  }
  i32 place = decision.sink_index;
  for (const ll_entry_t *entry = explained.sink.std_timings.head; entry != nullptr; entry = entry->next) {
    if (place-- == 0) {
      const auto &timing = *static_cast<const std_timing_t *>(entry->data);
      return raster_name(value[0], static_cast<i32>(standard_timing_lines(timing)), value[2], false);
    }
  }
  return raster_name(value[0], value[1], value[2], value[3] != 0);
}

/// "block 2 (DisplayID extension), block 3 (...)".
std::string unread_blocks(const sink_reading_t &reading) {
  std::string text;
  for (const sink_block_t &block : reading.blocks) {
    if (block.number > 1) {
      text += (text.empty() ? "block " : ", block ") + std::to_string(block.number) + " (" + block.kind + ")";
    }
  }
  return text;
}

constexpr const char *room_item_names[] = {"",
                                           "FreeSync",
                                           "HDR dynamic metadata",
                                           "HDR10+",
                                           "Dolby Vision",
                                           "3D structures",
                                           "modes up to VIC 64",
                                           "modes in 4:2:0 only",
                                           "modes above VIC 64",
                                           "serial number text"};

/// A feature, with the number where it has one.
std::string feature_name(const compose_decision_t &decision, const hdmi2_feature_t &feature) {
  const std::string name = feature.name;
  const std::string code = std::to_string(decision.code);
  switch (decision.subject) {
    case COMPOSE_SUBJECT_LINK_RATE:
      return name + " " + code + " MHz";
    case COMPOSE_SUBJECT_YCBCR_420:
      return name + ": " + code + (decision.code == 1 ? " mode" : " modes");
    case COMPOSE_SUBJECT_VRR:
      return name + (decision.code != 0 ? " from " + code + " Hz" : "");
    case COMPOSE_SUBJECT_PREFERRED_TIMING:
      return name + (decision.code != 0 ? ": " + short_mode_name(decision.code) : "");
    default:
      return name;
  }
}

std::string derived_name(const compose_decision_t &decision) {
  const std::string code = std::to_string(decision.code);
  if (const hdmi2_feature_t *const feature = find_hdmi2_feature(decision.subject, decision.code)) {
    return feature_name(decision, *feature);
  }
  switch (decision.subject) {
    case COMPOSE_SUBJECT_NATIVE_RATE:
      return "refresh family " + code + " Hz";
    case COMPOSE_SUBJECT_GEOMETRY_LIMIT:
      return decision.reason == COMPOSE_REASON_GEOMETRY_UNLIMITED ? "height limit: none"
                                                                  : "height limit " + code + " lines";
    case COMPOSE_SUBJECT_CURRENT_MODE:
      return decision.code == 0 ? "current mode" : "current mode " + short_mode_name(decision.code);
    case COMPOSE_SUBJECT_PHYSICAL_ADDRESS:
      return decision.verdict == COMPOSE_VERDICT_LEFT_OUT ? "physical address: none"
                                                          : "physical address " + physical_address_text(decision.code);
    case COMPOSE_SUBJECT_DEEP_COLOR:
      return "deep colour, " + code + " bits";
    case COMPOSE_SUBJECT_TMDS_CLOCK:
      return decision.code == 0 ? "TMDS clock: not declared" : "TMDS clock " + code + " MHz";
    case COMPOSE_SUBJECT_LATENCY:
      return decision.code < std::size(latency_names) ? latency_names[decision.code] : "latency " + code;
    case COMPOSE_SUBJECT_3D:
      return decision.code != 0 ? "3D" : "3D: none";
    case COMPOSE_SUBJECT_PADDING:
      return "padding: " + code + (decision.code == 1 ? " mode" : " modes");
    case COMPOSE_SUBJECT_EXTENSION_ROOM:
      return "extension: " + code + " bytes";
    case COMPOSE_SUBJECT_ROOM_ITEM:
      return std::string("room for ") +
             (decision.code < std::size(room_item_names) ? room_item_names[decision.code] : code.c_str());
    default:
      return std::string(compose_subject_string(decision.subject)) + " " + code;
  }
}

}  // namespace

bool is_of_unread_block(const compose_decision_t &decision, const sink_reading_t &reading) {
  return decision.subject == COMPOSE_SUBJECT_SINK_TIMING && (decision.origins & COMPOSE_ORIGIN_DETAILED_TIMING) != 0 &&
         decision.sink_index >= 0 && static_cast<std::size_t>(decision.sink_index) >= reading.detailed_timings;
}

std::string decision_name(const compose_decision_t &decision, const explained_t &explained) {
  switch (decision.subject) {
    case COMPOSE_SUBJECT_EXTENDED_MODE:
      return video_mode_name(decision.code);
    case COMPOSE_SUBJECT_VIDEO_MODE:
      return video_mode_name(sink_vic(decision, explained));
    case COMPOSE_SUBJECT_SINK_TIMING:
      return is_of_unread_block(decision, explained.reading) ? "bytes of " + unread_blocks(explained.reading)
                                                             : sink_timing_name(decision, explained);
    case COMPOSE_SUBJECT_4K_MODE:
      return mode_4k_name(decision.code);
    case COMPOSE_SUBJECT_AUDIO_FORMAT:
      return audio_name(decision, explained);
    default:
      return derived_name(decision);
  }
}

}  // namespace edid_cli
