// What a source cannot use, or should not be told, in an EDID that was composed.
#pragma once

#include <string>
#include <vector>

#include "composition/composition.h"

namespace edid_cli {

enum class severity_t {
  note,     ///< As it is meant to be, perhaps.
  warning,  ///< Not what somebody meant who wrote it.
  error     ///< Breaks the box: sources read garbage, or nothing.
};

/// "note", "warning" or "error".
const char *severity_text(severity_t severity);

enum class problem_kind_t {
  refused,
  not_announced,
  video_block_too_long,
  hdmi_block_too_long,
  extension_full,
  too_few_modes,
  tmds_clock_above_hdmi_1_4,
  tmds_clock_above_sink,
  deep_color_not_in_sink,
  sink_unread,
  left_out_for_room,
};

struct problem_t {
  problem_kind_t kind;
  severity_t severity;
  std::string text;  ///< A clause, such as "the extension needs 130 bytes".
};

/// What is wrong with a composition that was observed. @p sink: the sink's record, where the new EDID is to be compared
/// with it.
std::vector<problem_t> problems_of(const composition_t &composition, const edid_t *sink = nullptr);

/// Why nobody should use the EDID, as clauses: its errors, and a sink that was not read to its end. None: it is fit.
std::vector<std::string> reasons_against(const composition_t &composition);

}  // namespace edid_cli
