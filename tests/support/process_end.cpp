#include "support/process_end.h"

#include <sys/mman.h>
#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cerrno>
#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <system_error>

#ifdef EDID_COMPOSER_COVERAGE
extern "C" void __gcov_dump();
#endif

namespace test_support {
namespace {

// Coverage counters are written at the end of a process, which an abort is not.
void count_coverage_until_the_abort() {
#ifdef EDID_COMPOSER_COVERAGE
  std::signal(SIGABRT, [](int) { __gcov_dump(); });
#endif
}

[[noreturn]] void fail(const char *what) {
  throw std::system_error(errno, std::generic_category(), what);
}

/// A file in memory.
class memory_file_t {
 public:
  memory_file_t() : descriptor_(memfd_create("output of a child", MFD_CLOEXEC)) {
    if (descriptor_ < 0) fail("memfd_create");
  }
  memory_file_t(const memory_file_t &) = delete;
  memory_file_t &operator=(const memory_file_t &) = delete;
  ~memory_file_t() { close(descriptor_); }

  int descriptor() const { return descriptor_; }

  std::string text() const {
    const off_t size = lseek(descriptor_, 0, SEEK_END);
    std::string result(static_cast<std::size_t>(size), '\0');
    if (pread(descriptor_, result.data(), result.size(), 0) != size) fail("pread");
    return result;
  }

 private:
  int descriptor_;
};

[[noreturn]] void run_child(const std::function<void()> &action, const memory_file_t &out, const memory_file_t &err) {
  const rlimit no_core_file{0, 0};
  setrlimit(RLIMIT_CORE, &no_core_file);
  dup2(out.descriptor(), STDOUT_FILENO);
  dup2(err.descriptor(), STDERR_FILENO);
  static char buffer[65536];
  std::setvbuf(stdout, buffer, _IOFBF, sizeof(buffer));
  count_coverage_until_the_abort();
  action();
  std::_Exit(EXIT_SUCCESS);
}

}  // namespace

process_end_t end_of_process(const std::function<void()> &action) {
  const memory_file_t out;
  const memory_file_t err;
  std::fflush(stdout);
  const pid_t child = fork();
  if (child < 0) fail("fork");
  if (child == 0) run_child(action, out, err);
  int status = 0;
  while (waitpid(child, &status, 0) < 0) {
    if (errno != EINTR) fail("waitpid");
  }
  return {WIFSIGNALED(status) ? WTERMSIG(status) : 0, out.text(), err.text()};
}

}  // namespace test_support
