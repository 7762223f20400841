#include "diagnostics.h"

#include <cinttypes>
#include <cstdarg>
#include <cstdio>
#include <cstring>

#include "output.h"

namespace edid_composer {

constinit std::atomic<u8> g_debug_enabled{0};

void log_error(const site_t &site, int line, const char *format, ...) {
  std::va_list arguments;
  va_start(arguments, format);
  write_line(COMPOSE_LOG_ERROR, site, line, format, arguments);
  va_end(arguments);
}

void log_warning(const site_t &site, int line, const char *format, ...) {
  std::va_list arguments;
  va_start(arguments, format);
  write_line(COMPOSE_LOG_WARNING, site, line, format, arguments);
  va_end(arguments);
}

void log_bug(const site_t &site, int line, const char *format, ...) {
  std::va_list arguments;
  va_start(arguments, format);
  write_line(COMPOSE_LOG_BUG, site, line, format, arguments);
  va_end(arguments);
}

void log_trace(const site_t &site, int line, const char *format, ...) {
  std::va_list arguments;
  va_start(arguments, format);
  write_line(COMPOSE_LOG_TRACE, site, line, format, arguments);
  va_end(arguments);
}

address_t address(const void *pointer) {
  address_t address;
  if (pointer == nullptr) {
    std::strcpy(address.text, "(nil)");
  } else {
    std::snprintf(address.text, sizeof address.text, "0x%" PRIxPTR, reinterpret_cast<std::uintptr_t>(pointer));
  }
  return address;
}

}  // namespace edid_composer

void debug_enable(bool enable) {
  edid_composer::g_debug_enabled.store(enable ? 1 : 0, std::memory_order_relaxed);
}

bool debug_enabled(void) {
  return edid_composer::is_tracing();
}
