// Where the library writes: C's stdout, or the log callback of the composition that this thread is serving.
#pragma once

#include <cstdarg>

#include "diagnostics.h"

namespace edid_composer {

/// Writes text of a report or a dump. A line may be written in pieces.
[[gnu::format(printf, 1, 2)]] void print(const char *format, ...);

/// Writes a line of a kind other than COMPOSE_LOG_TEXT.
[[gnu::format(printf, 4, 0)]] void write_line(compose_log_kind kind, const site_t &site, int line, const char *format,
                                              std::va_list arguments);

/// While it lives, what this thread writes goes to a callback, line by line.
class log_redirection_t {
 public:
  log_redirection_t(compose_log_t log, void *context);
  ~log_redirection_t();
  log_redirection_t(const log_redirection_t &) = delete;
  log_redirection_t &operator=(const log_redirection_t &) = delete;

 private:
  friend void print(const char *format, ...);
  friend void write_line(compose_log_kind, const site_t &, int, const char *, std::va_list);

  void add_text(const char *format, std::va_list arguments);
  void add_line(compose_log_kind kind, const site_t &site, int line, const char *format, std::va_list arguments);
  void flush();
  void deliver(compose_log_kind kind, const site_t &site, int line, const char *text);

  compose_log_t log_;
  void *context_;
  log_redirection_t *outer_;
  u32 length_ = 0;  ///< Of the line that is being written in pieces.
  /// That of a composition, a trace with a node name of 255 bytes, has some 400 bytes.
  static constexpr u32 longest_line = 1023;
  char text_[longest_line + 2];  ///< With its newline and a NUL.
};

}  // namespace edid_composer
