// The lines that describe a detailed timing, in the report and in traces.
#pragma once

#include "edid_composer.h"

namespace edid_composer {

/// Each begins with a tab and has no newline.
class timing_lines_t {
 public:
  explicit timing_lines_t(const detailed_timing_t &timing);

  using line_t = char[56];
  const line_t *begin() const { return lines_; }
  const line_t *end() const { return lines_ + count_; }

 private:
  void add(const char *label, u32 number);
  void add(const char *label, const char *word);
  void add_size(const char *label, u32 millimetres);

  line_t lines_[18];
  u32 count_ = 0;
};

}  // namespace edid_composer
