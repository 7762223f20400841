#include "batch/batch_summary.h"

#include <algorithm>

#include "text/printable_text.h"
#include "text/text_table.h"

namespace edid_cli {
namespace {

/// So many different diagnostics are listed one by one.
constexpr std::size_t most_diagnostics = 20;

/// Bug lines end with an address in memory, of which each thread has its own.
std::string without_address(const std::string &diagnostic) {
  return diagnostic.starts_with("BUG") ? diagnostic.substr(0, diagnostic.rfind("0x")) : diagnostic;
}

}  // namespace

void batch_summary_t::add(const std::string &label, const batch_result_t &result) {
  if (!result.passed_over.empty()) {
    passed_over_.push_back(result.passed_over);
  } else if (result.failure.empty()) {
    ++composed_;
  } else {
    failures_.push_back({label, result.failure});
  }
  for (const std::string &diagnostic : result.diagnostics) {
    count(diagnostic, label);
  }
}

void batch_summary_t::count(const std::string &diagnostic, const std::string &label) {
  const std::string subject = without_address(diagnostic);
  const auto known = diagnostics_.find(subject);
  if (known != diagnostics_.end()) {
    ++known->second.times;
  } else if (diagnostics_.size() < most_diagnostics) {
    diagnostics_[subject] = {1, diagnostics_.size(), label, diagnostic};
  } else {
    ++uncounted_;
  }
}

std::string batch_summary_t::text() const {
  text_table_t counts;
  counts.add({"composed", std::to_string(composed_)});
  counts.add({"failed", std::to_string(failures_.size())});
  std::string text = counts.text();
  if (!passed_over_.empty()) {
    text += "\n";
    for (const std::string &file : passed_over_) {
      text += "passed over: " + printable(file) + "\n";
    }
  }
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
    for (const auto &[subject, count] : diagnostics_) {
      rows[count.order] = {std::to_string(count.times), count.first_label, count.first_text};
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
