// Keeping what the library prints, which it does on C's standard output.
#pragma once

#include <string>

#include "file_descriptor.h"
#include "standard_output.h"

namespace edid_cli {

/// While it lives, standard output is gathered in memory.
class output_capture_t {
 public:
  /// Throws bad_input_t when the system has no descriptors or memory left.
  output_capture_t();

  /// What was printed since the last call.
  std::string take();

 private:
  file_descriptor_t memory_;
  standard_output_redirect_t redirect_;
};

}  // namespace edid_cli
