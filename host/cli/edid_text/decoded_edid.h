// An EDID as the library decodes it.
#pragma once

#include <vector>

#include "edid_composer.h"

namespace edid_cli {

/// Decodes on construction, which prints what the library has to say.
class decoded_edid_t {
 public:
  explicit decoded_edid_t(const std::vector<u8> &bytes);
  ~decoded_edid_t();
  decoded_edid_t(const decoded_edid_t &) = delete;
  decoded_edid_t &operator=(const decoded_edid_t &) = delete;

  /// Returns whether all of it decoded; the record holds what did.
  bool is_complete() const { return is_complete_; }
  const edid_t &record() const { return record_; }

 private:
  edid_t record_{};
  bool is_prepared_ = false;
  bool is_complete_ = false;
};

}  // namespace edid_cli
