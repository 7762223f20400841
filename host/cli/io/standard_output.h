// Where the library's output goes: it prints on C's standard output.
#pragma once

#include <functional>
#include <string>

#include "io/file_descriptor.h"

namespace edid_cli {

/// While it lives, standard output goes to where another descriptor points.
class standard_output_redirect_t {
 public:
  /// Throws bad_input_t when the system has no descriptors left.
  explicit standard_output_redirect_t(int target);
  ~standard_output_redirect_t();
  standard_output_redirect_t(const standard_output_redirect_t &) = delete;
  standard_output_redirect_t &operator=(const standard_output_redirect_t &) = delete;

 private:
  file_descriptor_t original_;
};

/// While it lives, what is printed on standard output is not seen.
class discarded_output_t {
 public:
  /// Throws bad_input_t like the redirection, and where there is no null device.
  discarded_output_t();

 private:
  file_descriptor_t nowhere_;
  standard_output_redirect_t redirect_;
};

/// What is printed on standard output while a function runs. Throws bad_input_t where there is no room for it.
std::string printed_by(const std::function<void()> &print);

/// Writes out what is buffered. Throws bad_input_t when any of the output could not be written.
void flush_standard_output();

}  // namespace edid_cli
