#include "diagnostics.h"

#include <cstdarg>
#include <cstdio>

namespace edid_composer {
namespace {

[[gnu::format(printf, 3, 0)]] void write_prefixed(const char *level, const site_t &site, const char *format,
                                                  std::va_list arguments) {
  std::printf("%s:%d:%s() %s: ", site.module, site.line, site.function, level);
  std::vprintf(format, arguments);
  std::putchar('\n');
}

}  // namespace

void log_error(const site_t &site, const char *format, ...) {
  std::va_list arguments;
  va_start(arguments, format);
  write_prefixed("ERROR", site, format, arguments);
  va_end(arguments);
}

void log_warning(const site_t &site, const char *format, ...) {
  std::va_list arguments;
  va_start(arguments, format);
  write_prefixed("WARNING", site, format, arguments);
  va_end(arguments);
}

void log_bug(const site_t &site, const char *format, ...) {
  std::va_list arguments;
  va_start(arguments, format);
  write_prefixed("BUG", site, format, arguments);
  va_end(arguments);
}

void log_trace(const site_t &site, const char *format, ...) {
  std::va_list arguments;
  va_start(arguments, format);
  std::vprintf(format, arguments);
  va_end(arguments);
  std::printf(" \t\t\t%s():%d\n", site.function, site.line);
}

}  // namespace edid_composer
