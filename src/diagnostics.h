// The four kinds of diagnostic line.
//
// A line names the operation that reports and the module that holds it, also where a helper does the work. The
// operation is declared once, for a file or for a function, and every line below reports in its name:
//
//   REPORTS_AS(decode_edid_block_0);
//   ...
//   LOG_ERROR("Failed decoding #%d standard timing.", number);
#pragma once

#include <atomic>
#include <cstdint>

#include "edid_composer.h"

namespace edid_composer {

/// The debug switch. Atomic so that a host may turn it while another thread composes; no order is needed with anything
/// else.
extern std::atomic<u8> g_debug_enabled;

/// debug_enabled(), without a call.
inline bool is_tracing() {
  return g_debug_enabled.load(std::memory_order_relaxed) != 0;
}

/// Who reports: module and operation as the reader of the log knows them.
struct site_t {
  const char *module;
  const char *operation;
};

// Cold: reports stand apart from the code that has nothing to report.
[[gnu::cold, gnu::format(printf, 3, 4)]] void log_error(const site_t &site, int line, const char *format, ...);
[[gnu::cold, gnu::format(printf, 3, 4)]] void log_warning(const site_t &site, int line, const char *format, ...);
[[gnu::cold, gnu::format(printf, 3, 4)]] void log_bug(const site_t &site, int line, const char *format, ...);
/// Writes a debug trace whatever the switch says; LOG_TRACE asks first.
[[gnu::cold, gnu::format(printf, 3, 4)]] void log_trace(const site_t &site, int line, const char *format, ...);

/// The name of an operation, which the compiler has found.
template <typename operation_t>
constexpr const char *operation_name(operation_t *, const char *name) {
  return name;
}

/// A pointer as text: "(nil)" or hexadecimal digits, with every C library.
struct address_t {
  char text[sizeof "0x" + 2 * sizeof(std::uintptr_t)];
};
address_t address(const void *pointer);

/// A C boolean as text.
inline const char *true_or_false(bool value) {
  return value ? "true" : "false";
}

}  // namespace edid_composer

/// Declares `site`, in whose name the lines of the enclosing scope report. The build gives each module's folder its
/// name.
#define REPORTS_AS(operation)                                                       \
  static constexpr ::edid_composer::site_t site {                                   \
    EDID_COMPOSER_MODULE, ::edid_composer::operation_name(&(operation), #operation) \
  }

#define LOG_ERROR(...) ::edid_composer::log_error(site, __LINE__, __VA_ARGS__)
#define LOG_WARNING(...) ::edid_composer::log_warning(site, __LINE__, __VA_ARGS__)
#define LOG_BUG(...) ::edid_composer::log_bug(site, __LINE__, __VA_ARGS__)
#define LOG_TRACE(...) \
  (::edid_composer::is_tracing() ? ::edid_composer::log_trace(site, __LINE__, __VA_ARGS__) : void())
