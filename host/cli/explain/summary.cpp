#include "explain/summary.h"

#include <algorithm>
#include <cstdint>
#include <map>

#include "edid_text/mode_names.h"
#include "explain/reason_texts.h"

namespace edid_cli {
namespace {

constexpr std::size_t shown_reasons = 3;

bool is_mode(const row_t &row) {
  return row.section == section_t::video || row.section == section_t::mode_4k || row.section == section_t::extended;
}

/// Pixels a second; 0 for what is no mode.
std::uint64_t pixel_rate(const row_t &row, const explained_t &explained) {
  const i32(&value)[4] = row.decision.value;
  std::optional<raster_t> raster;
  if (row.decision.subject == COMPOSE_SUBJECT_VIDEO_MODE) {
    raster = raster_of_vic(sink_vic(row.decision, explained));
  } else if (row.decision.subject == COMPOSE_SUBJECT_EXTENDED_MODE) {
    raster = raster_of_vic(row.decision.code);
  } else if (row.decision.subject == COMPOSE_SUBJECT_4K_MODE) {
    raster = raster_of_hdmi_vic(row.decision.code);
  } else if (row.decision.subject == COMPOSE_SUBJECT_SINK_TIMING) {
    raster =
        raster_t{static_cast<u32>(value[0]), 0, static_cast<u32>(value[1]), value[3] != 0, static_cast<u32>(value[2])};
  }
  return raster ? raster->pixel_rate() : 0;
}

std::vector<row_t> offered_modes(const std::vector<row_t> &rows) {
  std::vector<row_t> modes;
  std::copy_if(rows.begin(), rows.end(), std::back_inserter(modes),
               [](const row_t &row) { return is_mode(row) && row.is_offered(); });
  return modes;
}

std::string preferred_video(const std::vector<row_t> &rows) {
  const auto first = std::find_if(rows.begin(), rows.end(), [](const row_t &row) {
    return row.section == section_t::video && row.is_offered() && row.decision.position == 0;
  });
  return first != rows.end() ? first->name : "";
}

std::string best_video(const std::vector<row_t> &rows, const explained_t &explained) {
  const std::vector<row_t> modes = offered_modes(rows);
  const auto best = std::max_element(modes.begin(), modes.end(), [&explained](const row_t &left, const row_t &right) {
    return pixel_rate(left, explained) < pixel_rate(right, explained);
  });
  return best != modes.end() ? best->name : "";
}

std::vector<std::string> offered_features(const std::vector<row_t> &rows) {
  std::vector<std::string> names;
  for (const row_t &row : rows) {
    if (row.section == section_t::hdmi2 && row.is_offered()) {
      names.push_back(row.name);
    }
  }
  return names;
}

/// A format's name is its type and channels: "PCM, 8 channels".
std::vector<std::string> offered_audio(const std::vector<row_t> &rows) {
  std::vector<const row_t *> best;
  for (const row_t &row : rows) {
    if (row.section != section_t::audio || !row.is_offered()) {
      continue;
    }
    const auto same = std::find_if(best.begin(), best.end(),
                                   [&row](const row_t *other) { return other->decision.code == row.decision.code; });
    if (same == best.end()) {
      best.push_back(&row);
    } else if ((*same)->name < row.name) {
      *same = &row;
    }
  }
  std::vector<std::string> names(best.size());
  std::transform(best.begin(), best.end(), names.begin(), [](const row_t *row) { return row->name; });
  return names;
}

/// Whether a mode that is left out as a VIC is offered as the 4Kx2K mode that it is in HDMI 1.4.
bool is_offered_as_4k(const row_t &row, const std::vector<row_t> &rows) {
  const bool has_vic = row.decision.subject == COMPOSE_SUBJECT_VIDEO_MODE || row.section == section_t::extended;
  const u32 hdmi_vic = has_vic ? hdmi_vic_of_vic(row.decision.code) : 0;
  return hdmi_vic != 0 && std::any_of(rows.begin(), rows.end(), [hdmi_vic](const row_t &other) {
           return other.section == section_t::mode_4k && other.is_offered() && other.decision.code == hdmi_vic;
         });
}

std::vector<std::string> lost_of_sink(const std::vector<row_t> &rows, const explained_t &explained) {
  std::vector<row_t> lost;
  std::copy_if(rows.begin(), rows.end(), std::back_inserter(lost), [&](const row_t &row) {
    return row.is_of_sink() && !row.is_offered() && row.merged.empty() && !row.rests_on_unread &&
           !row.is_offered_otherwise && !is_offered_as_4k(row, rows);
  });
  std::stable_sort(lost.begin(), lost.end(), [&explained](const row_t &left, const row_t &right) {
    return pixel_rate(left, explained) > pixel_rate(right, explained);
  });
  std::vector<std::string> names;
  for (const row_t &row : lost) {
    if (std::find(names.begin(), names.end(), row.name) == names.end()) {
      names.push_back(row.name);
    }
  }
  return names;
}

std::string reason_in_common(const row_t &row, const sink_reading_t &reading) {
  if (row.rests_on_unread) {
    return reading.missing_part;
  }
  const bool is_above = row.decision.subject == COMPOSE_SUBJECT_VIDEO_MODE && row.decision.code > last_library_vic;
  return is_above ? "VICs above 64 need hdmi2.enable = 1" : compose_reason_string(row.decision.reason);
}

std::vector<common_reason_t> common_reasons(const std::vector<row_t> &rows, const sink_reading_t &reading) {
  std::vector<common_reason_t> reasons;
  for (const row_t &row : rows) {
    if (is_of_values(row.section) || row.is_offered() || row.is_offered_otherwise) {
      continue;
    }
    const std::string text = reason_in_common(row, reading);
    const auto known =
        std::find_if(reasons.begin(), reasons.end(), [&text](const auto &reason) { return reason.text == text; });
    known != reasons.end() ? ++known->count : reasons.emplace_back(common_reason_t{text, 1}).count;
  }
  std::stable_sort(reasons.begin(), reasons.end(),
                   [](const auto &left, const auto &right) { return left.count > right.count; });
  reasons.resize(std::min(reasons.size(), shown_reasons));
  return reasons;
}

std::vector<count_t> counts_of(const std::vector<row_t> &rows) {
  std::vector<count_t> counts;
  for (const section_t section : sections) {
    if (is_of_values(section)) {
      continue;
    }
    count_t count{section};
    for (const row_t &row : rows) {
      if (row.section == section) {
        ++(row.is_offered() ? count.offered : count.left_out);
      }
    }
    if (is_always_there(section) || count.offered + count.left_out != 0) {
      counts.push_back(count);
    }
  }
  return counts;
}

std::string status_of(const sink_reading_t &reading) {
  if (!reading.is_given) {
    return "There is no sink.";
  }
  std::string text;
  for (const std::string &gap : reading.gaps) {
    text += (text.empty() ? "" : " ") + gap;
  }
  return text.empty() ? "All of the sink's EDID was read." : text;
}

}  // namespace

summary_t summary_of(const std::vector<row_t> &rows, const explained_t &explained) {
  const sink_reading_t &reading = explained.reading;
  return {status_of(reading),     preferred_video(rows),        best_video(rows, explained),
          offered_features(rows), offered_audio(rows),          lost_of_sink(rows, explained),
          counts_of(rows),        common_reasons(rows, reading)};
}

std::string first_of(const std::vector<std::string> &texts, std::size_t shown) {
  std::string text;
  for (std::size_t index = 0; index < std::min(texts.size(), shown); ++index) {
    text += (text.empty() ? "" : "; ") + texts[index];
  }
  return texts.size() > shown ? text + " and " + std::to_string(texts.size() - shown) + " more" : text;
}

}  // namespace edid_cli
