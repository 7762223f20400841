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

[[gnu::format(printf, 2, 3)]] void log_error(const site_t &site, const char *format, ...);
[[gnu::format(printf, 2, 3)]] void log_warning(const site_t &site, const char *format, ...);
[[gnu::format(printf, 2, 3)]] void log_bug(const site_t &site, const char *format, ...);
/// Writes a debug trace whatever the switch says; LOG_TRACE asks first.
[[gnu::format(printf, 2, 3)]] void log_trace(const site_t &site, const char *format, ...);

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

#define LOG_ERROR(...) ::edid_composer::log_error(HERE, __VA_ARGS__)
#define LOG_WARNING(...) ::edid_composer::log_warning(HERE, __VA_ARGS__)
#define LOG_BUG(...) ::edid_composer::log_bug(HERE, __VA_ARGS__)
#define LOG_TRACE(...) (debug_enabled() ? ::edid_composer::log_trace(HERE, __VA_ARGS__) : void())

#define LOG_ERROR_AS(site, ...) ::edid_composer::log_error(HERE_AS(site), __VA_ARGS__)
#define LOG_WARNING_AS(site, ...) ::edid_composer::log_warning(HERE_AS(site), __VA_ARGS__)
#define LOG_BUG_AS(site, ...) ::edid_composer::log_bug(HERE_AS(site), __VA_ARGS__)
#define LOG_TRACE_AS(site, ...) (debug_enabled() ? ::edid_composer::log_trace(HERE_AS(site), __VA_ARGS__) : void())
