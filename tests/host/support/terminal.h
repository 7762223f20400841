// A terminal, as a program sees one on its standard output or error.
#pragma once

#include <string>

namespace host_test {

class terminal_t {
 public:
  terminal_t();
  ~terminal_t();
  terminal_t(const terminal_t &) = delete;
  terminal_t &operator=(const terminal_t &) = delete;

  /// The device.
  const std::string &name() const { return name_; }
  /// What was written to it so far; lines end in a line feed.
  std::string content();

 private:
  int descriptor_;
  std::string name_;
  int other_side_ = -1;
  std::string content_;
};

}  // namespace host_test
