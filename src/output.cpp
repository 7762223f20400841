#include "output.h"

#include <cstdio>
#include <cstring>

namespace edid_composer {
namespace {

/// The redirection in force on this thread; null: stdout.
constinit thread_local log_redirection_t *g_redirection = nullptr;

/// Reports and dumps name nobody.
constexpr site_t nobody{"", ""};

void write_to_stdout(compose_log_kind kind, const site_t &site, int line, const char *format, std::va_list arguments) {
  if (kind == COMPOSE_LOG_TRACE) {
    std::vprintf(format, arguments);
    std::printf(" \t\t\t%s():%d\n", site.operation, line);
    return;
  }
  const char *const level = kind == COMPOSE_LOG_ERROR ? "ERROR" : kind == COMPOSE_LOG_WARNING ? "WARNING" : "BUG";
  std::printf("%s:%d:%s() %s: ", site.module, line, site.operation, level);
  std::vprintf(format, arguments);
  std::putchar('\n');
}

}  // namespace

void print(const char *format, ...) {
  std::va_list arguments;
  va_start(arguments, format);
  if (g_redirection == nullptr) {
    std::vprintf(format, arguments);
  } else {
    g_redirection->add_text(format, arguments);
  }
  va_end(arguments);
}

void write_line(compose_log_kind kind, const site_t &site, int line, const char *format, std::va_list arguments) {
  if (g_redirection == nullptr) {
    write_to_stdout(kind, site, line, format, arguments);
  } else {
    g_redirection->add_line(kind, site, line, format, arguments);
  }
}

log_redirection_t::log_redirection_t(compose_log_t log, void *context)
    : log_(log), context_(context), outer_(g_redirection) {
  g_redirection = this;
}

log_redirection_t::~log_redirection_t() {
  flush();
  g_redirection = outer_;
}

void log_redirection_t::add_text(const char *format, std::va_list arguments) {
  const u32 room = longest_line + 1 - length_;
  const int wanted = std::vsnprintf(text_ + length_, room, format, arguments);
  if (wanted < 0) return;
  if (static_cast<u32>(wanted) < room) {
    length_ += static_cast<u32>(wanted);
  } else {
    // The rest is cut, but for the newline that every line's last piece ends in.
    length_ = longest_line;
    if (format[std::strlen(format) - 1] == '\n') text_[length_++] = '\n';
    text_[length_] = '\0';
  }

  char *begin = text_;
  for (char *end = nullptr; (end = std::strchr(begin, '\n')) != nullptr; begin = end + 1) {
    *end = '\0';
    deliver(COMPOSE_LOG_TEXT, nobody, 0, begin);
  }
  length_ -= static_cast<u32>(begin - text_);
  std::memmove(text_, begin, length_ + 1);
}

void log_redirection_t::add_line(compose_log_kind kind, const site_t &site, int line, const char *format,
                                 std::va_list arguments) {
  flush();
  std::vsnprintf(text_, longest_line + 1, format, arguments);
  deliver(kind, site, line, text_);
}

/// Delivers what stands there of a line that was not ended.
void log_redirection_t::flush() {
  if (length_ == 0) return;
  length_ = 0;
  deliver(COMPOSE_LOG_TEXT, nobody, 0, text_);
}

void log_redirection_t::deliver(compose_log_kind kind, const site_t &site, int line, const char *text) {
  const compose_log_line_t record{.size = sizeof(compose_log_line_t),
                                  .kind = kind,
                                  .module = site.module,
                                  .function = site.operation,
                                  .line = static_cast<u32>(line),
                                  .text = text};
  // What the callback itself makes the library print is not part of this composition.
  g_redirection = outer_;
  log_(&record, context_);
  g_redirection = this;
}

}  // namespace edid_composer
