#include "io/standard_output.h"

#include <fcntl.h>
#include <unistd.h>

#include <cerrno>
#include <cstdio>
#include <cstring>
#include <memory>

#include "io/bad_input.h"

namespace edid_cli {
namespace {

[[noreturn]] void refuse() {
  throw bad_input_t(std::string("standard output: cannot write: ") + std::strerror(errno));
}

int open_null_device() {
  constexpr const char *null_device = "/dev/null";
  const int descriptor = open(null_device, O_WRONLY | O_CLOEXEC);
  if (descriptor < 0) {
    throw bad_input_t(std::string(null_device) + ": " + std::strerror(errno));
  }
  return descriptor;
}

}  // namespace

standard_output_redirect_t::standard_output_redirect_t(int target)
    : original_(fcntl(STDOUT_FILENO, F_DUPFD_CLOEXEC, 3)) {
  flush_standard_output();
  if (!original_.is_open() || dup2(target, STDOUT_FILENO) < 0) {
    refuse();
  }
}

standard_output_redirect_t::~standard_output_redirect_t() {
  std::fflush(stdout);
  dup2(original_.get(), STDOUT_FILENO);
}

discarded_output_t::discarded_output_t() : nowhere_(open_null_device()), redirect_(nowhere_.get()) {}

std::string printed_by(const std::function<void()> &print) {
  const std::unique_ptr<std::FILE, int (*)(std::FILE *)> file(std::tmpfile(), std::fclose);
  if (file == nullptr) {
    throw bad_input_t(std::string("temporary file: ") + std::strerror(errno));
  }
  {
    const standard_output_redirect_t redirect(fileno(file.get()));
    print();
  }
  std::rewind(file.get());
  std::string text;
  char chunk[4096];
  for (std::size_t size = 0; (size = std::fread(chunk, 1, sizeof chunk, file.get())) != 0;) {
    text.append(chunk, size);
  }
  return text;
}

void flush_standard_output() {
  if (std::fflush(stdout) != 0 || std::ferror(stdout) != 0) {
    refuse();
  }
}

}  // namespace edid_cli
