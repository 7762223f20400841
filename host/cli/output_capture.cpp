#include "output_capture.h"

#include <sys/mman.h>
#include <unistd.h>

#include <cerrno>
#include <cstdio>
#include <cstring>

#include "bad_input.h"

namespace edid_cli {
namespace {

int open_memory() {
  const int descriptor = memfd_create("edid-composer", MFD_CLOEXEC);
  if (descriptor < 0) {
    throw bad_input_t(std::string("cannot keep output: ") + std::strerror(errno));
  }
  return descriptor;
}

}  // namespace

output_capture_t::output_capture_t() : memory_(open_memory()), redirect_(memory_.get()) {}

std::string output_capture_t::take() {
  std::fflush(stdout);
  std::string text;
  char chunk[16384];
  for (ssize_t size = 0; (size = pread(memory_.get(), chunk, sizeof chunk, static_cast<off_t>(text.size()))) > 0;) {
    text.append(chunk, static_cast<std::size_t>(size));
  }
  if (ftruncate(memory_.get(), 0) != 0 || lseek(memory_.get(), 0, SEEK_SET) < 0) {
    throw bad_input_t(std::string("cannot keep output: ") + std::strerror(errno));
  }
  return text;
}

}  // namespace edid_cli
