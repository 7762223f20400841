#include "explain/rows.h"

#include <algorithm>
#include <functional>
#include <iterator>
#include <limits>
#include <tuple>

#include "edid_text/mode_names.h"
#include "explain/decision_names.h"
#include "explain/hdmi2_features.h"
#include "explain/reason_texts.h"

namespace edid_cli {
namespace {

constexpr const char *section_titles[] = {
    "Video modes", "4Kx2K modes", "Modes above VIC 64", "Audio formats", "Limits and derived values", "HDMI 2"};
constexpr const char *section_ids[] = {"video", "4k", "extended", "audio", "derived", "hdmi2"};

section_t section_of(u32 subject) {
  switch (subject) {
    case COMPOSE_SUBJECT_VIDEO_MODE:
    case COMPOSE_SUBJECT_SINK_TIMING:
      return section_t::video;
    case COMPOSE_SUBJECT_4K_MODE:
      return section_t::mode_4k;
    case COMPOSE_SUBJECT_EXTENDED_MODE:
      return section_t::extended;
    case COMPOSE_SUBJECT_AUDIO_FORMAT:
      return section_t::audio;
    default:
      return is_of_hdmi2(subject) ? section_t::hdmi2 : section_t::derived;
  }
}

auto order_of(const row_t &row) {
  constexpr i32 last = std::numeric_limits<i32>::max();
  const compose_decision_t &decision = row.decision;
  const bool is_derived = is_of_values(row.section);
  const bool is_placed = row.is_offered() && decision.position >= 0;
  return std::tuple(row.section, is_derived ? decision.subject : 0U, !is_derived && !row.is_offered(),
                    is_placed ? decision.position : last, decision.subject, decision.code);
}

constexpr u32 sink_origins = COMPOSE_ORIGIN_DETAILED_TIMING | COMPOSE_ORIGIN_STANDARD_TIMING |
                             COMPOSE_ORIGIN_SHORT_VIDEO | COMPOSE_ORIGIN_SINK_4K | COMPOSE_ORIGIN_SINK_AUDIO |
                             COMPOSE_ORIGIN_SINK_420;

/// Whether the sink has a feature that is left out, as the numbers behind its reason say.
bool is_lost_feature(const compose_decision_t &decision) {
  switch (decision.reason) {
    case COMPOSE_REASON_OFF:
      return decision.value[1] != 0;
    case COMPOSE_REASON_NO_ROOM:
      return decision.subject == COMPOSE_SUBJECT_PASSED_BLOCK;
    case COMPOSE_REASON_VRR_RANGE_INVALID:
    case COMPOSE_REASON_RATE_BELOW_BLOCK:
    case COMPOSE_REASON_VRR_CHANGED:
      return true;
    default:
      return false;
  }
}

/// Whether a timing stands in an extension that is malformed.
bool is_doubtful(const compose_decision_t &decision, const sink_reading_t &reading) {
  return decision.reason == COMPOSE_REASON_TIMING_WITHOUT_VIC &&
         (decision.origins & COMPOSE_ORIGIN_DETAILED_TIMING) != 0 &&
         reading.extension_status == COMPOSE_EXTENSION_MALFORMED && decision.sink_index >= 0 &&
         static_cast<std::size_t>(decision.sink_index) >= reading.base_timings;
}

/// The VIC above 64 under which a timing of the sink is offered; 0 for none.
u32 offered_vic_of(const row_t &row, const composition_t &composition) {
  if (row.decision.reason != COMPOSE_REASON_TIMING_WITHOUT_VIC) {
    return 0;
  }
  const auto found = std::find_if(
      composition.decisions.begin(), composition.decisions.end(), [&row](const compose_decision_t &decision) {
        return decision.subject == COMPOSE_SUBJECT_EXTENDED_MODE && decision.verdict != COMPOSE_VERDICT_LEFT_OUT &&
               short_mode_name(decision.code) == row.name;
      });
  return found != composition.decisions.end() ? found->code : 0;
}

row_t row_of(const compose_decision_t &decision, const explained_t &explained) {
  row_t row{section_of(decision.subject),         decision,
            decision_name(decision, explained),   reason_sentence(decision, explained),
            rests_on_unread(decision, explained), sources_of(decision, explained)};
  if (is_of_unread_block(decision, explained.reading)) {
    row.sentence = "This library reads one extension. It takes the bytes after it for timings, and offers none.";
  } else if (is_doubtful(decision, explained.reading)) {
    row.sentence = "It is in an extension that is malformed, and may not be a timing.";
    row.rests_on_unread = true;
  } else if (const u32 vic = offered_vic_of(row, explained.composition)) {
    row.sentence = "The sink has it; it is offered as VIC " + std::to_string(vic) + ".";
    row.is_offered_otherwise = true;
  }
  return row;
}

/// Whether one is left out because the other, of the other side, is offered.
bool is_same_format(const row_t &offered, const row_t &other) {
  constexpr u32 covered[] = {COMPOSE_REASON_PLATFORM_FORMATS_ONLY, COMPOSE_REASON_SINK_FORMATS_ONLY,
                             COMPOSE_REASON_DUPLICATE};
  return offered.section == section_t::audio && offered.is_offered() && other.section == section_t::audio &&
         !other.is_offered() && offered.name == other.name && offered.is_of_sink() != other.is_of_sink() &&
         std::find(std::begin(covered), std::end(covered), other.decision.reason) != std::end(covered);
}

/// One row for a format that is offered of one side and left out of the other. The order of the rows changes.
void merge_audio(std::vector<row_t> &rows) {
  const auto is_left_out = [](const row_t &row) { return row.section == section_t::audio && !row.is_offered(); };
  const auto first_left_out = std::stable_partition(rows.begin(), rows.end(), std::not_fn(is_left_out));
  std::vector<row_t> others(std::make_move_iterator(first_left_out), std::make_move_iterator(rows.end()));
  rows.erase(first_left_out, rows.end());
  for (row_t &other : others) {
    const auto offered =
        std::find_if(rows.begin(), rows.end(), [&other](const row_t &row) { return is_same_format(row, other); });
    if (offered == rows.end()) {
      rows.push_back(std::move(other));
      continue;
    }
    // Once is enough for a sink that lists it twice.
    if (offered->merged.empty()) {
      offered->sentence += other.is_of_sink() ? " The sink has it too." : " The platform has it too.";
    }
    offered->sources.insert(offered->sources.end(), other.sources.begin(), other.sources.end());
    offered->merged.push_back(std::move(other));
  }
}

/// One row for all that was taken for timings.
void merge_unread_blocks(std::vector<row_t> &rows, const sink_reading_t &reading) {
  const auto is_unread = [&reading](const row_t &row) { return is_of_unread_block(row.decision, reading); };
  const auto first = std::find_if(rows.begin(), rows.end(), is_unread);
  if (first == rows.end()) {
    return;
  }
  for (auto other = std::next(first); other != rows.end(); ++other) {
    if (is_unread(*other)) {
      first->merged.push_back(*other);
    }
  }
  rows.erase(std::remove_if(std::next(first), rows.end(), is_unread), rows.end());
}

}  // namespace

bool row_t::is_of_sink() const {
  return (decision.origins & sink_origins) != 0 || (section == section_t::hdmi2 && is_lost_feature(decision));
}

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
  if (!is_of_values(row.section) || row.decision.verdict == COMPOSE_VERDICT_CHANGED) {
    return compose_verdict_string(row.decision.verdict);
  }
  return row.is_offered() ? "in force" : "not in force";
}

bool is_of_values(section_t section) {
  return section == section_t::derived || section == section_t::hdmi2;
}

bool is_always_there(section_t section) {
  return section != section_t::extended && section != section_t::hdmi2;
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
    rows.push_back(row_of(decision, explained));
  }
  merge_audio(rows);
  merge_unread_blocks(rows, explained.reading);
  std::stable_sort(rows.begin(), rows.end(),
                   [](const row_t &left, const row_t &right) { return order_of(left) < order_of(right); });
  return rows;
}

}  // namespace edid_cli
