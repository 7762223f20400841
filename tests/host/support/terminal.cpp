#include "support/terminal.h"

#include <fcntl.h>
#include <stdlib.h>
#include <termios.h>
#include <unistd.h>

#include <stdexcept>

namespace host_test {

terminal_t::terminal_t() : descriptor_(posix_openpt(O_RDWR | O_NOCTTY | O_NONBLOCK)) {
  if (descriptor_ < 0 || grantpt(descriptor_) != 0 || unlockpt(descriptor_) != 0) {
    throw std::runtime_error("cannot make a terminal");
  }
  name_ = ptsname(descriptor_);
  // Kept open, so that what was written stays to be read.
  other_side_ = open(name_.c_str(), O_RDWR | O_NOCTTY);
  termios settings{};
  tcgetattr(other_side_, &settings);
  settings.c_oflag &= ~static_cast<tcflag_t>(OPOST);
  tcsetattr(other_side_, TCSANOW, &settings);
}

terminal_t::~terminal_t() {
  close(other_side_);
  close(descriptor_);
}

std::string terminal_t::content() {
  char text[4096];
  for (ssize_t size = 0; (size = read(descriptor_, text, sizeof text)) > 0;) {
    content_.append(text, static_cast<std::size_t>(size));
  }
  return content_;
}

}  // namespace host_test
