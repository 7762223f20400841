// What came of several compositions, printed at their end.
#pragma once

#include <map>
#include <string>
#include <vector>

#include "batch/batch_result.h"

namespace edid_cli {

/// Keeps failures, and each different diagnostic once; so it stays small however many compositions there are.
class batch_summary_t {
 public:
  void add(const std::string &label, const batch_result_t &result);
  bool has_failures() const { return !failures_.empty(); }
  bool has_compositions() const { return composed_ != 0 || has_failures(); }
  std::string text() const;

 private:
  struct failure_t {
    std::string label;
    std::string reason;
  };
  struct diagnostic_count_t {
    std::size_t times = 0;
    std::size_t order = 0;
    std::string first_label;
    std::string first_text;
  };

  void count(const std::string &diagnostic, const std::string &label);

  std::size_t composed_ = 0;
  std::vector<failure_t> failures_;
  std::vector<std::string> passed_over_;
  std::map<std::string, diagnostic_count_t> diagnostics_;  ///< By what they say.
  std::size_t uncounted_ = 0;
};

}  // namespace edid_cli
