#include "diagnostics.h"

#include <cstdarg>
#include <cstdio>

namespace edid_composer {
namespace {

[[gnu::format(printf, 5, 0)]] void write_prefixed(const char *level, const char *module, const char *function, int line,
                                                  const char *format, std::va_list arguments) {
  std::printf("%s:%d:%s() %s: ", module, line, function, level);
  std::vprintf(format, arguments);
  std::putchar('\n');
}

[[gnu::format(printf, 3, 0)]] void write_trace(const char *function, int line, const char *format,
                                               std::va_list arguments) {
  std::vprintf(format, arguments);
  std::printf(" \t\t\t%s():%d\n", function, line);
}

}  // namespace

void log_error(const char *module, const char *function, int line, const char *format, ...) {
  std::va_list arguments;
  va_start(arguments, format);
  write_prefixed("ERROR", module, function, line, format, arguments);
  va_end(arguments);
}

void log_warning(const char *module, const char *function, int line, const char *format, ...) {
  std::va_list arguments;
  va_start(arguments, format);
  write_prefixed("WARNING", module, function, line, format, arguments);
  va_end(arguments);
}

void log_bug(const char *module, const char *function, int line, const char *format, ...) {
  std::va_list arguments;
  va_start(arguments, format);
  write_prefixed("BUG", module, function, line, format, arguments);
  va_end(arguments);
}

void log_trace(const char *function, int line, const char *format, ...) {
  std::va_list arguments;
  va_start(arguments, format);
  write_trace(function, line, format, arguments);
  va_end(arguments);
}

void log_trace(const site_t &site, const char *format, ...) {
  std::va_list arguments;
  va_start(arguments, format);
  write_trace(site.function, site.line, format, arguments);
  va_end(arguments);
}

}  // namespace edid_composer
