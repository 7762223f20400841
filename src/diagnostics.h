// The four kinds of diagnostic line, on C's stdout.
//
// A line names the operation that reports and the module that holds it. Code that several operations share takes the
// site of the operation that it works for and reports in its name.
#pragma once

#include "edid_composer.h"

namespace edid_composer {

/// Who reports: module and function as the reader of the log knows them, and the line of the report.
struct site_t {
  const char *module;
  const char *function;
  int line;
};

// The writers of the lines take a site in pieces, which travel in registers, and are cold: code that has nothing to
// report then builds no site, and its reports stand apart from it.

[[gnu::cold, gnu::format(printf, 4, 5)]] void log_error(const char *module, const char *function, int line,
                                                        const char *format, ...);
[[gnu::cold, gnu::format(printf, 4, 5)]] void log_warning(const char *module, const char *function, int line,
                                                          const char *format, ...);
[[gnu::cold, gnu::format(printf, 4, 5)]] void log_bug(const char *module, const char *function, int line,
                                                      const char *format, ...);
/// Writes a debug trace, which doesn't name its module, whatever the switch says; LOG_TRACE asks first.
[[gnu::cold, gnu::format(printf, 3, 4)]] void log_trace(const char *function, int line, const char *format, ...);
/// The same for a block that has asked the switch for all of its traces.
[[gnu::cold, gnu::format(printf, 2, 3)]] void log_trace(const site_t &site, const char *format, ...);

/// For "%p", which takes pointers to void only.
inline const void *address(const void *pointer) {
  return pointer;
}

/// A C boolean as text.
inline const char *true_or_false(bool value) {
  return value ? "true" : "false";
}

}  // namespace edid_composer

/// The site of the function it stands in. The build gives each module's folder its name.
#define HERE (::edid_composer::site_t{EDID_COMPOSER_MODULE, static_cast<const char *>(__func__), __LINE__})
/// This line, in the name of another site's function.
#define HERE_AS(site) (::edid_composer::site_t{(site).module, (site).function, __LINE__})
/// A site in pieces, as the writers take it.
#define PIECES(site) (site).module, (site).function, (site).line

#define LOG_ERROR(...) ::edid_composer::log_error(PIECES(HERE), __VA_ARGS__)
#define LOG_WARNING(...) ::edid_composer::log_warning(PIECES(HERE), __VA_ARGS__)
#define LOG_BUG(...) ::edid_composer::log_bug(PIECES(HERE), __VA_ARGS__)
#define LOG_TRACE(...) LOG_TRACE_AS(HERE, __VA_ARGS__)

#define LOG_ERROR_AS(site, ...) ::edid_composer::log_error(PIECES(HERE_AS(site)), __VA_ARGS__)
#define LOG_WARNING_AS(site, ...) ::edid_composer::log_warning(PIECES(HERE_AS(site)), __VA_ARGS__)
#define LOG_BUG_AS(site, ...) ::edid_composer::log_bug(PIECES(HERE_AS(site)), __VA_ARGS__)
#define LOG_TRACE_AS(site, ...) \
  (debug_enabled() ? ::edid_composer::log_trace((site).function, __LINE__, __VA_ARGS__) : void())
