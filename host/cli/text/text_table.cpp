#include "text/text_table.h"

#include <algorithm>
#include <utility>

#include "text/printable_text.h"

namespace edid_cli {
namespace {

/// In characters: what continues one in UTF-8 does not count.
std::size_t width_of(const std::string &text) {
  return static_cast<std::size_t>(std::count_if(
      text.begin(), text.end(), [](char character) { return (static_cast<unsigned char>(character) & 0xC0) != 0x80; }));
}

}  // namespace

void text_table_t::add(row_t row) {
  for (std::string &cell : row) {
    cell = printable(cell);
  }
  rows_.push_back(std::move(row));
}

std::string text_table_t::text() const {
  std::vector<std::size_t> widths;
  for (const row_t &row : rows_) {
    widths.resize(std::max(widths.size(), row.size()));
    for (std::size_t column = 0; column < row.size(); ++column) {
      widths[column] = std::max(widths[column], width_of(row[column]));
    }
  }
  std::string text;
  for (const row_t &row : rows_) {
    std::string line;
    for (std::size_t column = 0; column < row.size(); ++column) {
      line += row[column] + std::string(widths[column] - width_of(row[column]) + 2, ' ');
    }
    text += line.substr(0, line.find_last_not_of(' ') + 1) + "\n";
  }
  return text;
}

}  // namespace edid_cli
