// Tables of text on standard output.
#pragma once

#include <cstddef>
#include <limits>
#include <string>
#include <vector>

namespace edid_cli {

/// Rows of cells in columns as wide as their widest cell, two blanks apart. Cells are made printable.
class text_table_t {
 public:
  using row_t = std::vector<std::string>;
  static constexpr std::size_t any_width = std::numeric_limits<std::size_t>::max();

  void add(row_t row);
  bool empty() const { return rows_.empty(); }
  /// The whole table, without blanks at the ends of lines. In a table wider than @p most_columns the last cells go on
  /// in further lines, broken between words.
  std::string text(std::size_t most_columns = any_width) const;

 private:
  std::vector<std::size_t> widths() const;

  std::vector<row_t> rows_;
};

}  // namespace edid_cli
