// What of an explanation matters first.
#pragma once

#include <string>
#include <vector>

#include "explain/rows.h"

namespace edid_cli {

/// How many of a table's rows are offered.
struct count_t {
  section_t section{};
  std::size_t offered = 0;
  std::size_t left_out = 0;
};

/// A reason and how many modes and formats were left out for it.
struct common_reason_t {
  std::string text;
  std::size_t count = 0;
};

struct summary_t {
  std::string status;                    ///< What was read of the sink, in one sentence.
  std::string preferred_video;           ///< The mode that a source prefers; empty: none.
  std::string best_video;                ///< The mode with the most pixels a second; empty: none.
  std::vector<std::string> hdmi2;        ///< What HDMI 2 adds: rate, HDR, colours and so on; empty without it.
  std::vector<std::string> audio;        ///< Each type that is offered, with the most channels.
  std::vector<std::string> lost;         ///< What the sink has and the new EDID doesn't offer, best first.
  std::vector<count_t> counts;           ///< Of video modes, 4Kx2K modes and audio formats.
  std::vector<common_reason_t> reasons;  ///< The three most common ones.
};

summary_t summary_of(const std::vector<row_t> &rows, const explained_t &explained);

/// "1920x1080p60, 1280x720p60 and 3 more": as many as are to be shown.
std::string first_of(const std::vector<std::string> &texts, std::size_t shown);

}  // namespace edid_cli
