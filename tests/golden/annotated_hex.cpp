#include "annotated_hex.h"

#include <algorithm>

#include "text_format.h"

namespace golden {
namespace {

/// As many as a descriptor has.
constexpr std::size_t bytes_in_a_line = 18;
constexpr std::size_t comment_column = 3 * bytes_in_a_line;

}  // namespace

u8 annotated_hex_t::next(std::size_t offset) const {
  const std::size_t at = position_ + offset;
  return at < bytes_.size() ? bytes_[at] : u8{0};
}

void annotated_hex_t::remark(const std::string &text) {
  text_ += "# " + text + "\n";
}

void annotated_hex_t::field(std::size_t count, const std::string &comment) {
  const std::size_t end = position_ + std::min(count, remaining());
  for (bool first = true; position_ < end; first = false) {
    const std::size_t line_end = std::min(end, position_ + bytes_in_a_line);
    std::string line;
    for (; position_ < line_end; ++position_)
      line += format("%s%02X", line.empty() ? "" : " ", bytes_[position_]);
    if (first) {
      line.resize(comment_column, ' ');
      line += "# " + comment;
    }
    text_ += line + "\n";
  }
}

}  // namespace golden
