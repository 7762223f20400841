#include "explain/explanation_text.h"

#include "explain/rows.h"
#include "text/printable_text.h"
#include "text/text_table.h"

namespace edid_cli {

std::string explanation_text(const explained_t &explained) {
  const std::vector<row_t> rows = rows_of(explained);
  std::string text = printable("sink: " + (explained.sink_name.empty() ? "none" : explained.sink_name) +
                               ", platform: " + explained.places.name()) +
                     "\n";
  for (const std::string &warning : warnings_of(rows)) {
    text += "warning: " + printable(warning) + "\n";
  }
  for (const section_t section : {section_t::video, section_t::mode_4k, section_t::audio, section_t::derived}) {
    text_table_t table;
    table.add({"VERDICT", "WHAT", "WHY", "FROM"});
    bool is_empty = true;
    for (const row_t &row : rows) {
      if (row.section == section) {
        table.add({verdict_text(row), row.name, row.sentence, source_text(row)});
        is_empty = false;
      }
    }
    text += std::string("\n") + section_title(section) + "\n";
    text += is_empty ? "none\n" : table.text();
  }
  return text;
}

std::string answer_text(const std::vector<answer_t> &answers) {
  std::string text;
  for (const answer_t &answer : answers) {
    text += (text.empty() ? "" : "\n") + answer.name + (answer.is_offered ? " is offered.\n" : " is not offered.\n");
    for (const std::string &reason : answer.reasons) {
      text += "  " + printable(reason) + "\n";
    }
    if (!answer.steps.empty()) {
      text += "To have it offered:\n";
    }
    for (const step_t &step : answer.steps) {
      text += "  - " + printable(step.text) + "\n";
    }
  }
  return text;
}

}  // namespace edid_cli
