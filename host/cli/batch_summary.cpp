#include "batch_summary.h"

#include <algorithm>

#include "diagnostic_lines.h"
#include "text_lines.h"
#include "text_table.h"

namespace edid_cli {
namespace {

/// So many different diagnostics are told one by one.
constexpr std::size_t most_diagnostics = 20;

}  // namespace

void batch_summary_t::add(const std::string &label, const batch_result_t &result) {
  if (result.failure.empty()) {
    ++composed_;
  } else {
    failures_.push_back({label, result.failure});
  }
  count_diagnostics(label, result.output);
}

void batch_summary_t::count_diagnostics(const std::string &label, std::string_view output) {
  for (const text_line_t &line : lines_of(output)) {
    const auto diagnostic = parse_diagnostic(line.text);
    if (!diagnostic) {
      continue;
    }
    const std::string text = std::string(diagnostic->kind) + ": " + std::string(trimmed(diagnostic->message));
    const auto known = diagnostics_.find(text);
    if (known != diagnostics_.end()) {
      ++known->second.times;
    } else if (diagnostics_.size() < most_diagnostics) {
      diagnostics_[text] = {1, diagnostics_.size(), label};
    } else {
      ++uncounted_;
    }
  }
}

std::string batch_summary_t::text() const {
  text_table_t counts;
  counts.add({"composed", std::to_string(composed_)});
  counts.add({"failed", std::to_string(failures_.size())});
  std::string text = counts.text();
  if (!failures_.empty()) {
    text_table_t table;
    table.add({"FAILED", "REASON"});
    for (const failure_t &failure : failures_) {
      table.add({failure.label, failure.reason});
    }
    text += "\n" + table.text();
  }
  if (!diagnostics_.empty()) {
    std::vector<text_table_t::row_t> rows(diagnostics_.size());
    for (const auto &[message, count] : diagnostics_) {
      rows[count.order] = {std::to_string(count.times), count.first_label, message};
    }
    text_table_t table;
    table.add({"TIMES", "FIRST", "THE LIBRARY SAID"});
    std::for_each(rows.begin(), rows.end(), [&table](const auto &row) { table.add(row); });
    if (uncounted_ > 0) {
      table.add({std::to_string(uncounted_), "", "other messages"});
    }
    text += "\n" + table.text();
  }
  return text;
}

}  // namespace edid_cli
