// Tables of text on standard output.
#pragma once

#include <string>
#include <vector>

namespace edid_cli {

/// Rows of cells in columns as wide as their widest cell, two blanks apart. Cells are made printable.
class text_table_t {
 public:
  using row_t = std::vector<std::string>;

  void add(row_t row);
  bool empty() const { return rows_.empty(); }
  /// The whole table, a line each row, without blanks at their ends.
  std::string text() const;

 private:
  std::vector<row_t> rows_;
};

}  // namespace edid_cli
