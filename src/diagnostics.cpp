#include "diagnostics.h"

#include <cstdarg>

#include "output.h"

namespace edid_composer {

void log_error(const char *module, const char *function, int line, const char *format, ...) {
  std::va_list arguments;
  va_start(arguments, format);
  write_line(COMPOSE_LOG_ERROR, module, function, line, format, arguments);
  va_end(arguments);
}

void log_warning(const char *module, const char *function, int line, const char *format, ...) {
  std::va_list arguments;
  va_start(arguments, format);
  write_line(COMPOSE_LOG_WARNING, module, function, line, format, arguments);
  va_end(arguments);
}

void log_bug(const char *module, const char *function, int line, const char *format, ...) {
  std::va_list arguments;
  va_start(arguments, format);
  write_line(COMPOSE_LOG_BUG, module, function, line, format, arguments);
  va_end(arguments);
}

void log_trace(const char *function, int line, const char *format, ...) {
  std::va_list arguments;
  va_start(arguments, format);
  write_line(COMPOSE_LOG_TRACE, "", function, line, format, arguments);
  va_end(arguments);
}

void log_trace(const site_t &site, const char *format, ...) {
  std::va_list arguments;
  va_start(arguments, format);
  write_line(COMPOSE_LOG_TRACE, "", site.function, site.line, format, arguments);
  va_end(arguments);
}

}  // namespace edid_composer
