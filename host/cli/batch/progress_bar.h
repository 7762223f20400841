// How far several compositions have come, for somebody who watches.
#pragma once

#include <chrono>
#include <cstddef>

namespace edid_cli {

/// One line of standard error that is drawn over and gone in the end; nothing at all unless that is a terminal.
class progress_bar_t {
 public:
  explicit progress_bar_t(std::size_t total);
  ~progress_bar_t();
  progress_bar_t(const progress_bar_t &) = delete;
  progress_bar_t &operator=(const progress_bar_t &) = delete;

  void show(std::size_t done);
  /// Makes room for other output; the next show() draws again.
  void clear();

 private:
  std::size_t total_;
  bool is_watched_;
  bool is_drawn_ = false;
  std::chrono::steady_clock::time_point next_;
};

}  // namespace edid_cli
