#include "document_limits.h"

#include <algorithm>
#include <vector>

namespace edid_config_store {
namespace {

constexpr std::string_view byte_order_mark = "\xEF\xBB\xBF";

class walk_t {
 public:
  explicit walk_t(std::string_view document) : rest_(document) {
    if (rest_.starts_with(byte_order_mark)) {
      rest_.remove_prefix(byte_order_mark.size());
    }
  }

  std::optional<document_problem_t> run() && {
    while (!rest_.empty() && !problem_) {
      step();
    }
    return std::move(problem_);
  }

 private:
  void step() {
    const char character = rest_.front();
    if (character == '"' || character == '\'') {
      skip_string(character);
    } else if (character == '#') {
      advance(std::min(rest_.find('\n'), rest_.size()));
    } else if (static_cast<unsigned char>(character) >= 0x80) {
      refuse("a character that is not ASCII is outside of strings and comments");
    } else {
      count(character);
      advance(1);
    }
  }

  /// Follows the nesting. A header's names stay in force for the lines after it.
  void count(char character) {
    if (character == '[' && open_.empty() && !is_value_) {
      header_depth_ = is_header_ ? header_depth_ + 1 : 1;
      is_header_ = true;
    } else if (is_header_) {
      header_depth_ += character == '.' ? 1 : 0;
      is_header_ = character != '\n';
    } else {
      count_in_value(character);
    }
    if (header_depth_ + outer_ + names_ > max_depth) {
      refuse("tables and arrays are nested more than 64 deep");
    }
  }

  void count_in_value(char character) {
    const bool ends_line = character == '\n' && open_.empty();
    if (character == '[' || character == '{') {
      open_.push_back(names_);
      outer_ += names_ + 1;
      names_ = 0;
    } else if ((character == ']' || character == '}') && !open_.empty()) {
      names_ = open_.back();
      open_.pop_back();
      outer_ -= names_ + 1;
    } else if (character == '.') {
      ++names_;
    } else if (character == ',' || ends_line) {
      names_ = 0;
    }
    is_value_ = (is_value_ || character == '=') && !ends_line;
  }

  /// A string of one line ends with its line at the latest: the parser refuses it there.
  void skip_string(char quote) {
    const bool is_long = rest_.starts_with(std::string(3, quote));
    const std::size_t width = is_long ? 3 : 1;
    advance(width);
    while (!rest_.empty() && (is_long || rest_.front() != '\n')) {
      if (quote == '"' && rest_.front() == '\\') {
        advance(std::min<std::size_t>(2, rest_.size()));
      } else if (rest_.starts_with(std::string(width, quote))) {
        advance(width);
        // Two more quotes may belong to the string.
        for (int more = 0; is_long && more < 2 && rest_.starts_with(quote); ++more) {
          advance(1);
        }
        return;
      } else {
        advance(1);
      }
    }
  }

  void advance(std::size_t bytes) {
    for (const char character : rest_.substr(0, bytes)) {
      if (character == '\n') {
        ++position_.line;
        position_.column = 1;
      } else if ((static_cast<unsigned char>(character) & 0xC0) != 0x80) {
        ++position_.column;
      }
    }
    rest_.remove_prefix(bytes);
  }

  void refuse(std::string text) { problem_ = document_problem_t{position_, std::move(text)}; }

  std::string_view rest_;
  node_position_t position_{1, 1};
  std::vector<int> open_;   ///< Of each open bracket of a value, the dots of the key before it.
  int outer_ = 0;           ///< Levels of these.
  int names_ = 0;           ///< Dots of the key that is being read.
  int header_depth_ = 0;    ///< Levels of the table that the lines belong to.
  bool is_header_ = false;  ///< Within its line.
  bool is_value_ = false;   ///< After an equals sign.
  std::optional<document_problem_t> problem_;
};

}  // namespace

std::optional<document_problem_t> find_beyond_limits(std::string_view document) {
  return walk_t(document).run();
}

}  // namespace edid_config_store
