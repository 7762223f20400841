// What is wrong with what the user gave: one line on standard error, and the program ends with status 2.
#pragma once

#include <stdexcept>

namespace edid_cli {

class bad_input_t : public std::runtime_error {
 public:
  using std::runtime_error::runtime_error;
};

}  // namespace edid_cli
