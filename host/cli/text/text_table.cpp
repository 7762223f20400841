#include "text/text_table.h"

#include <algorithm>
#include <utility>

#include "text/printable_text.h"

namespace edid_cli {
namespace {

constexpr std::size_t gap = 2;
/// Of a last column that the others leave no room for.
constexpr std::size_t least_width = 20;

/// In characters: what continues one in UTF-8 does not count.
std::size_t width_of(const std::string &text) {
  return static_cast<std::size_t>(std::count_if(
      text.begin(), text.end(), [](char character) { return (static_cast<unsigned char>(character) & 0xC0) != 0x80; }));
}

/// The text in lines of so many characters, broken between words. A longer word is not broken.
std::vector<std::string> wrapped(const std::string &text, std::size_t width) {
  if (width_of(text) <= width) {
    return {text};
  }
  std::vector<std::string> lines(1);
  for (std::size_t begin = 0; begin < text.size();) {
    const std::size_t end = std::min(text.find(' ', begin), text.size());
    const std::string word = text.substr(begin, end - begin);
    if (!lines.back().empty() && width_of(lines.back()) + 1 + width_of(word) > width) {
      lines.emplace_back(word);
    } else {
      lines.back() += (lines.back().empty() ? "" : " ") + word;
    }
    begin = std::min(text.find_first_not_of(' ', end), text.size());
  }
  return lines;
}

}  // namespace

void text_table_t::add(row_t row) {
  for (std::string &cell : row) {
    cell = printable(cell);
  }
  rows_.push_back(std::move(row));
}

std::vector<std::size_t> text_table_t::widths() const {
  std::vector<std::size_t> widths;
  for (const row_t &row : rows_) {
    widths.resize(std::max(widths.size(), row.size()));
    for (std::size_t column = 0; column < row.size(); ++column) {
      widths[column] = std::max(widths[column], width_of(row[column]));
    }
  }
  return widths;
}

std::string text_table_t::text(std::size_t most_columns) const {
  const std::vector<std::size_t> columns = widths();
  std::size_t before_last = 0;
  for (std::size_t column = 0; column + 1 < columns.size(); ++column) {
    before_last += columns[column] + gap;
  }
  const std::size_t last_width = std::max(most_columns - std::min(most_columns, before_last), least_width);
  std::string text;
  for (const row_t &row : rows_) {
    std::string line;
    for (std::size_t column = 0; column + 1 < row.size(); ++column) {
      line += row[column] + std::string(columns[column] - width_of(row[column]) + gap, ' ');
    }
    const bool is_last = row.size() == columns.size();
    for (const std::string &part : wrapped(row.empty() ? "" : row.back(), is_last ? last_width : any_width)) {
      line += part;
      text += line.substr(0, line.find_last_not_of(' ') + 1) + "\n";
      line.assign(before_last, ' ');
    }
  }
  return text;
}

}  // namespace edid_cli
