#include "explain/explanation_text.h"

#include "text/printable_text.h"
#include "text/text_table.h"

namespace edid_cli {
namespace {

constexpr std::size_t most_columns = 100;
constexpr std::size_t shown_losses = 3;

std::string sink_text(const explanation_t &explanation) {
  const std::string name = explanation.sink_name.empty() ? "" : " (" + explanation.sink_name + ")";
  return explanation.sink_source.empty() ? "none" : explanation.sink_source + name;
}

std::string video_text(const summary_t &summary) {
  if (summary.best_video.empty()) {
    return "none";
  }
  const std::string best = "at best " + summary.best_video;
  return summary.preferred_video.empty()                 ? best
         : summary.preferred_video == summary.best_video ? best + ", which is preferred"
                                                         : best + "; preferred: " + summary.preferred_video;
}

std::string reasons_text(const summary_t &summary) {
  std::string text;
  for (const common_reason_t &reason : summary.reasons) {
    text += (text.empty() ? "" : "; ") + std::to_string(reason.count) + " times: " + reason.text;
  }
  return text;
}

std::string none_if_empty(const std::string &text) {
  return text.empty() ? "none" : text;
}

std::string head_of(const explanation_t &explanation, std::size_t columns) {
  const summary_t &summary = explanation.summary;
  text_table_t table;
  table.add({"sink:", sink_text(explanation)});
  table.add({"platform:", explanation.platform});
  table.add({"status:", summary.status});
  table.add({"video:", video_text(summary)});
  if (!summary.hdmi2.empty()) {
    table.add({"hdmi 2:", first_of(summary.hdmi2, summary.hdmi2.size())});
  }
  table.add({"audio:", none_if_empty(first_of(summary.audio, summary.audio.size()))});
  if (explanation.reading.is_given) {
    table.add({"lost:", none_if_empty(first_of(summary.lost, shown_losses))});
  }
  table.add({"reasons:", none_if_empty(reasons_text(summary))});
  for (const std::string &warning : explanation.warnings) {
    table.add({"warning:", warning});
  }
  return table.text(columns);
}

std::string section_table(const explanation_t &explanation, section_t section, table_width_t width) {
  const bool is_wide = width == table_width_t::wide;
  text_table_t table;
  for (const row_t &row : explanation.rows) {
    if (row.section != section) {
      continue;
    }
    if (table.empty()) {
      table.add(is_wide ? text_table_t::row_t{"VERDICT", "WHAT", "WHY", "FROM"}
                        : text_table_t::row_t{"VERDICT", "WHAT", "WHY"});
    }
    text_table_t::row_t cells{verdict_text(row), row.name, row.sentence};
    if (is_wide) {
      cells.push_back(source_text(row));
    }
    table.add(std::move(cells));
  }
  return table.text(is_wide ? text_table_t::any_width : most_columns);
}

std::string way_text(const steps_t &steps) {
  std::string text;
  for (const step_t &step : steps) {
    text += "  - " + printable(step.text) + "\n";
  }
  return text;
}

std::string one_answer(const answer_t &answer) {
  std::string text = answer.name + (answer.is_offered ? " is offered.\n" : " is not offered.\n");
  for (const std::string &reason : answer.reasons) {
    text += "  " + printable(reason) + "\n";
  }
  if (!answer.no_way.empty()) {
    text += printable(answer.no_way) + "\n";
  }
  for (std::size_t way = 0; way < answer.ways.size(); ++way) {
    text += (way == 0 ? "To have it offered:\n" : "Or:\n") + way_text(answer.ways[way]);
  }
  return text;
}

}  // namespace

std::string explanation_text(const explanation_t &explanation, table_width_t width) {
  std::string text = head_of(explanation, width == table_width_t::wide ? text_table_t::any_width : most_columns);
  for (const section_t section : sections) {
    const std::string rows = section_table(explanation, section, width);
    if (!rows.empty() || is_always_there(section)) {
      text += std::string("\n") + section_title(section) + "\n" + (rows.empty() ? "none\n" : rows);
    }
  }
  return text;
}

std::string answer_text(const answers_t &answers) {
  std::string text;
  for (const std::string &gap : answers.sink_gaps) {
    text += printable(gap) + "\n";
  }
  for (const answer_t &answer : answers.answers) {
    text += (text.empty() ? "" : "\n") + one_answer(answer);
  }
  return text;
}

}  // namespace edid_cli
