// Lets every allocation of an operation fail, one at a time, and compares what comes of it with a table.
//
// All heap memory of the library is list entries and their payloads: an operation allocates two blocks for each entry
// that it creates. A table therefore lists the entries that an operation creates, in order, in stretches of the same
// kind, and what is said and done when one of them cannot be had.
#pragma once

#include <functional>
#include <string>
#include <vector>

namespace robustness {

struct stretch_t {
  std::string name;
  int entries;
  /// All diagnostics of the operation when this stretch's entry (counted from 0) cannot be created; @p bug is the line
  /// of the allocation itself.
  std::function<std::string(int entry, const std::string &bug)> output;
  /// What the operation then leaves behind.
  std::function<std::string(int entry)> outcome;
};

/// The allocation's line and then, whatever the entry, these.
std::function<std::string(int, const std::string &)> lines(const std::string &behind);

/// The same outcome for every entry.
std::function<std::string(int)> always(const std::string &outcome);

/// Works, releases everything again, and returns in words what it had left behind.
using operation_t = std::function<std::string()>;

/// What a run of the operation prints, as it is to be compared.
using capture_t = std::function<std::string(const std::function<void()> &)>;

/// Runs the operation once for each allocation that it makes, with that one failing, and once more without any failing.
/// Each run has to say and leave what the table tells, and to free all that it allocated; each is followed by a run
/// where nothing fails, which has to do what it always does.
void expect_failures(const std::vector<stretch_t> &table, const operation_t &operation, const capture_t &capture);

/// As above, but from the failing allocation on every one fails. Each run has to report that, to free all that it
/// allocated, and to leave what @p is_acceptable takes.
void expect_survival(const operation_t &operation, const std::function<bool(const std::string &)> &is_acceptable);

}  // namespace robustness
