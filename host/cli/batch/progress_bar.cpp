#include "batch/progress_bar.h"

#include <unistd.h>

#include <cstdio>
#include <string>

namespace edid_cli {
namespace {

constexpr std::size_t width = 40;
constexpr std::chrono::milliseconds interval(100);

}  // namespace

progress_bar_t::progress_bar_t(std::size_t total) : total_(total), is_watched_(isatty(STDERR_FILENO) == 1) {}

progress_bar_t::~progress_bar_t() {
  clear();
}

void progress_bar_t::show(std::size_t done) {
  const auto now = std::chrono::steady_clock::now();
  if (!is_watched_ || now < next_) {
    return;
  }
  next_ = now + interval;
  is_drawn_ = true;
  std::string bar(width * done / total_, '#');
  bar.resize(width, '.');
  std::fprintf(stderr, "\r[%s] %zu of %zu", bar.c_str(), done, total_);
}

void progress_bar_t::clear() {
  if (is_drawn_) {
    std::fputs("\r\033[K", stderr);
    is_drawn_ = false;
  }
}

}  // namespace edid_cli
