// The decisions of a composition as rows of text: what all outputs are made from.
#pragma once

#include <string>
#include <vector>

#include "explain/explained.h"
#include "explain/sources.h"

namespace edid_cli {

enum class section_t { video, mode_4k, extended, audio, derived, hdmi2 };
inline constexpr section_t sections[] = {section_t::video, section_t::mode_4k, section_t::extended,
                                         section_t::audio, section_t::derived, section_t::hdmi2};
/// Whether a section's rows are limits and features rather than modes and formats.
bool is_of_values(section_t section);
/// Whether a section is there without rows too: those of HDMI 2 are not.
bool is_always_there(section_t section);

struct row_t {
  section_t section{};
  compose_decision_t decision{};
  std::string name;
  std::string sentence;
  bool rests_on_unread = false;  ///< On a part of the sink's EDID that was not read.
  std::vector<source_t> sources;
  bool is_offered_otherwise = false;  ///< Left out as what it is here, but offered under a VIC above 64.
  std::vector<row_t> merged{};  ///< Decisions that are told on this row, as of the sink's format like an offered one.

  bool is_offered() const { return decision.verdict != COMPOSE_VERDICT_LEFT_OUT; }
  /// Whether the sink has it, whatever became of it.
  bool is_of_sink() const;
};

/// What is wrong with the new EDID as a whole.
std::vector<std::string> warnings_of(const std::vector<row_t> &rows);
/// The verdict in words; a derived value is not offered but in force.
const char *verdict_text(const row_t &row);
/// "Video modes".
const char *section_title(section_t section);
/// "video", for programs.
const char *section_id(section_t section);
/// All of a row's sources.
std::string source_text(const row_t &row);

/// Section after section; what is offered comes first, in the order of the EDID.
std::vector<row_t> rows_of(const explained_t &explained);

}  // namespace edid_cli
