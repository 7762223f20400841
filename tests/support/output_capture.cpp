#include "support/output_capture.h"

#include <sys/mman.h>
#include <unistd.h>

#include <array>
#include <cstdio>
#include <system_error>

#include "edid_composer.h"
#include "support/patterns.h"

namespace test_support {
namespace {

[[noreturn]] void fail(const char *what) {
  throw std::system_error(errno, std::generic_category(), what);
}

/// Sends standard output to a file in memory for as long as it lives.
class redirected_stdout_t {
 public:
  redirected_stdout_t() : file_(memfd_create("captured output", MFD_CLOEXEC)) {
    if (file_ < 0) fail("memfd_create");
    std::fflush(stdout);
    saved_ = dup(STDOUT_FILENO);
    if (saved_ < 0 || dup2(file_, STDOUT_FILENO) < 0) fail("dup");
  }
  redirected_stdout_t(const redirected_stdout_t &) = delete;
  redirected_stdout_t &operator=(const redirected_stdout_t &) = delete;
  ~redirected_stdout_t() {
    std::fflush(stdout);
    dup2(saved_, STDOUT_FILENO);
    close(saved_);
    close(file_);
  }

  std::string text() const {
    std::fflush(stdout);
    std::string result;
    std::array<char, 65536> buffer{};
    for (;;) {
      const ssize_t count = pread(file_, buffer.data(), buffer.size(), static_cast<off_t>(result.size()));
      if (count < 0) fail("pread");
      if (count == 0) return result;
      result.append(buffer.data(), static_cast<std::size_t>(count));
    }
  }

 private:
  int file_;
  int saved_ = -1;
};

/// Keeps tracing on for as long as it lives.
class tracing_t {
 public:
  tracing_t() : was_enabled_(debug_enabled()) { debug_enable(true); }
  tracing_t(const tracing_t &) = delete;
  tracing_t &operator=(const tracing_t &) = delete;
  ~tracing_t() { debug_enable(was_enabled_); }

 private:
  bool was_enabled_;
};

std::string prefixed_line(const std::string &module, const std::string &function, const char *level,
                          const std::string &message) {
  return module + ":N:" + function + "() " + level + ": " + message + "\n";
}

}  // namespace

std::string raw_output_of(const std::function<void()> &action) {
  const redirected_stdout_t redirected;
  action();
  return redirected.text();
}

std::string masked(std::string text) {
  // Addresses have more digits than any 32-bit number that is printed in hexadecimal. Under valgrind they have six or
  // seven, as no number has that stands after a colon or an equals sign but for an audio format's "Val"; on a 32-bit
  // machine eight too, as a "Mask" has, and the types of a list and an entry, one beside the other.
  text =
      replaced(text, "(edid_composer|edid_decode_encode|utility|linked_list):[0-9]+:(\\w+\\(\\) (ERROR|WARNING|BUG): )",
               "$1:N:$2");
  text = replaced(text, "( \t\t\t\\w+\\(\\)):[0-9]+$", "$1:N");
  constexpr bool is_32_bit = sizeof(void *) == 4;
  text = replaced(text, is_32_bit ? "([a-jm-z][:=])0x[0-9a-f]{6,8}\\b" : "([a-km-z][:=])0x[0-9a-f]{6,7}\\b", "$1PTR");
  return replaced(text, "0x[0-9a-f]{9,16}\\b", "PTR");
}

std::string output_of(const std::function<void()> &action) {
  return masked(raw_output_of(action));
}

std::string traced_output_of(const std::function<void()> &action) {
  const tracing_t tracing;
  return output_of(action);
}

std::vector<std::string> lines_in(const std::string &text) {
  std::vector<std::string> lines;
  std::size_t start = 0;
  while (start < text.size()) {
    std::size_t end = text.find('\n', start);
    if (end == std::string::npos) end = text.size();
    lines.push_back(text.substr(start, end - start));
    start = end + 1;
  }
  return lines;
}

std::vector<std::string> lines_of(const std::function<void()> &action) {
  return lines_in(output_of(action));
}

std::vector<std::string> traced_lines_of(const std::function<void()> &action) {
  return lines_in(traced_output_of(action));
}

std::string error_line(const std::string &module, const std::string &function, const std::string &message) {
  return prefixed_line(module, function, "ERROR", message);
}

std::string warning_line(const std::string &module, const std::string &function, const std::string &message) {
  return prefixed_line(module, function, "WARNING", message);
}

std::string bug_line(const std::string &module, const std::string &function, const std::string &message) {
  return prefixed_line(module, function, "BUG", message);
}

std::string trace_line(const std::string &function, const std::string &message) {
  return message + " \t\t\t" + function + "():N\n";
}

int count_of(const std::string &text, const std::string &part) {
  int count = 0;
  if (part.empty()) return count;
  for (std::size_t at = text.find(part); at != std::string::npos; at = text.find(part, at + part.size()))
    ++count;
  return count;
}

}  // namespace test_support
