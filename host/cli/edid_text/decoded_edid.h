// An EDID as the library decodes it.
#pragma once

#include <vector>

#include "edid_composer.h"
#include "edid_text/edid_field.h"

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
  /// What all of its extensions say of HDMI 2; nothing where the base block did not decode.
  const hdmi2_t &hdmi2() const { return hdmi2_; }
  edid_records_t records() const { return {record_, hdmi2_}; }

 private:
  edid_t record_{};
  hdmi2_t hdmi2_{};
  bool is_prepared_ = false;
  bool is_complete_ = false;
};

/// What all extensions of an EDID say of HDMI 2; nothing where its base block is refused. Prints like the above.
hdmi2_t decoded_hdmi2(const std::vector<u8> &bytes);

/// Whether an EDID holds a data block or a mode that came with HDMI 2, HDR or wide colour.
bool has_hdmi2(const hdmi2_t &hdmi2);

}  // namespace edid_cli
