#include "explain/rows.h"

#include <algorithm>
#include <cstdlib>
#include <iterator>
#include <limits>
#include <optional>
#include <tuple>

#include "edid_text/physical_address_text.h"
#include "explain/mode_names.h"
#include "explain/reason_texts.h"

namespace edid_cli {
namespace {

constexpr const char *section_titles[] = {"Video modes", "4Kx2K modes", "Audio formats", "Limits and derived values"};
constexpr const char *section_ids[] = {"video", "4k", "audio", "derived"};
constexpr const char *latency_names[] = {"video latency", "audio latency", "interlaced video latency",
                                         "interlaced audio latency"};

section_t section_of(u32 subject) {
  switch (subject) {
    case COMPOSE_SUBJECT_VIDEO_MODE:
    case COMPOSE_SUBJECT_SINK_TIMING:
      return section_t::video;
    case COMPOSE_SUBJECT_4K_MODE:
      return section_t::mode_4k;
    case COMPOSE_SUBJECT_AUDIO_FORMAT:
      return section_t::audio;
    default:
      return section_t::derived;
  }
}

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
  const std::string channels =
      format ? ", " + std::to_string(format->channels) + (format->channels == 1 ? " channel" : " channels") : "";
  return audio_type_name(decision.code) + channels;
}

std::string sink_timing_name(const compose_decision_t &decision) {
  const i32(&value)[4] = decision.value;
  return raster_name(value[0], value[1], value[2], value[3] != 0);
}

std::string derived_name(const compose_decision_t &decision) {
  const std::string code = std::to_string(decision.code);
  switch (decision.subject) {
    case COMPOSE_SUBJECT_NATIVE_RATE:
      return "refresh family " + code + " Hz";
    case COMPOSE_SUBJECT_GEOMETRY_LIMIT:
      return decision.reason == COMPOSE_REASON_GEOMETRY_UNLIMITED ? "height limit: none"
                                                                  : "height limit " + code + " lines";
    case COMPOSE_SUBJECT_CURRENT_MODE:
      return decision.code == 0 ? "current mode" : "current mode " + short_mode_name(decision.code);
    case COMPOSE_SUBJECT_PHYSICAL_ADDRESS:
      return "physical address " + physical_address_text(decision.code);
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
    default:
      return std::string(compose_subject_string(decision.subject)) + " " + code;
  }
}

std::string name_of(const compose_decision_t &decision, const explained_t &explained) {
  switch (decision.subject) {
    case COMPOSE_SUBJECT_VIDEO_MODE:
      return video_mode_name(decision.code);
    case COMPOSE_SUBJECT_SINK_TIMING:
      return sink_timing_name(decision);
    case COMPOSE_SUBJECT_4K_MODE:
      return mode_4k_name(decision.code);
    case COMPOSE_SUBJECT_AUDIO_FORMAT:
      return audio_name(decision, explained);
    default:
      return derived_name(decision);
  }
}

auto order_of(const row_t &row) {
  constexpr i32 last = std::numeric_limits<i32>::max();
  const compose_decision_t &decision = row.decision;
  const bool is_derived = row.section == section_t::derived;
  const bool is_placed = row.is_offered() && decision.position >= 0;
  return std::tuple(row.section, is_derived ? decision.subject : 0U, !is_derived && !row.is_offered(),
                    is_placed ? decision.position : last, decision.subject, decision.code);
}

}  // namespace

std::vector<std::string> warnings_of(const std::vector<row_t> &rows) {
  constexpr u32 warned_of[] = {COMPOSE_REASON_TOO_FEW_MODES, COMPOSE_REASON_ROOM_EXCEEDED,
                               COMPOSE_REASON_BLOCK_TOO_LONG, COMPOSE_REASON_NOT_ANNOUNCED,
                               COMPOSE_REASON_DEEP_COLOR_REQUIRED};
  std::vector<std::string> warnings;
  for (const row_t &row : rows) {
    if (std::find(std::begin(warned_of), std::end(warned_of), row.decision.reason) != std::end(warned_of)) {
      warnings.push_back(row.sentence);
    }
  }
  return warnings;
}

const char *verdict_text(const row_t &row) {
  if (row.section != section_t::derived || row.decision.verdict == COMPOSE_VERDICT_CHANGED) {
    return compose_verdict_string(row.decision.verdict);
  }
  return row.is_offered() ? "in force" : "not in force";
}

const char *section_title(section_t section) {
  return section_titles[static_cast<std::size_t>(section)];
}

const char *section_id(section_t section) {
  return section_ids[static_cast<std::size_t>(section)];
}

std::string source_text(const row_t &row) {
  std::string text;
  for (const source_t &source : row.sources) {
    text += (text.empty() ? "" : "; ") + source.text;
  }
  return text;
}

std::vector<row_t> rows_of(const explained_t &explained) {
  std::vector<row_t> rows;
  for (const compose_decision_t &decision : explained.composition.decisions) {
    rows.push_back({section_of(decision.subject), decision, name_of(decision, explained),
                    reason_sentence(decision, explained), sources_of(decision, explained)});
  }
  std::stable_sort(rows.begin(), rows.end(),
                   [](const row_t &left, const row_t &right) { return order_of(left) < order_of(right); });
  return rows;
}

}  // namespace edid_cli
