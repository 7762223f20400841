// A file descriptor that closes itself.
#pragma once

#include <unistd.h>

#include <utility>

namespace edid_cli {

class file_descriptor_t {
 public:
  explicit file_descriptor_t(int descriptor) : descriptor_(descriptor) {}
  ~file_descriptor_t() { close(); }
  file_descriptor_t(const file_descriptor_t &) = delete;
  file_descriptor_t &operator=(const file_descriptor_t &) = delete;

  bool is_open() const { return descriptor_ >= 0; }
  int get() const { return descriptor_; }

  /// Leaves closing to the caller.
  int release() { return std::exchange(descriptor_, -1); }

  void reset(int descriptor) {
    close();
    descriptor_ = descriptor;
  }

  /// Returns whether closing succeeded: only then is known that what was written has arrived.
  bool close() {
    const int descriptor = std::exchange(descriptor_, -1);
    return descriptor < 0 || ::close(descriptor) == 0;
  }

 private:
  int descriptor_;
};

}  // namespace edid_cli
