#include "edid_text/alignment.h"

#include <algorithm>

namespace edid_cli {
namespace {

using list_t = std::vector<std::string>;

/// lengths[i][j]: how much the lists have in common from their entries i and j on.
std::vector<std::vector<std::size_t>> common_lengths(const list_t &left, const list_t &right) {
  std::vector<std::vector<std::size_t>> lengths(left.size() + 1, std::vector<std::size_t>(right.size() + 1));
  for (std::size_t i = left.size(); i-- > 0;) {
    for (std::size_t j = right.size(); j-- > 0;) {
      lengths[i][j] = left[i] == right[j] ? lengths[i + 1][j + 1] + 1 : std::max(lengths[i + 1][j], lengths[i][j + 1]);
    }
  }
  return lengths;
}

/// Both pieces differ from each other in every row.
void add_different(std::vector<aligned_row_t> &rows, const list_t &left, std::size_t left_begin, std::size_t left_end,
                   const list_t &right, std::size_t right_begin, std::size_t right_end) {
  while (left_begin < left_end || right_begin < right_end) {
    aligned_row_t row;
    if (left_begin < left_end) {
      row.left = left[left_begin++];
    }
    if (right_begin < right_end) {
      row.right = right[right_begin++];
    }
    rows.push_back(std::move(row));
  }
}

}  // namespace

std::vector<aligned_row_t> align(const list_t &left, const list_t &right) {
  const auto lengths = common_lengths(left, right);
  std::vector<aligned_row_t> rows;
  std::size_t i = 0;
  std::size_t j = 0;
  std::size_t left_begin = 0;
  std::size_t right_begin = 0;
  while (i < left.size() && j < right.size()) {
    if (left[i] == right[j]) {
      add_different(rows, left, left_begin, i, right, right_begin, j);
      rows.push_back({left[i], right[j]});
      left_begin = ++i;
      right_begin = ++j;
    } else if (lengths[i + 1][j] >= lengths[i][j + 1]) {
      ++i;
    } else {
      ++j;
    }
  }
  add_different(rows, left, left_begin, left.size(), right, right_begin, right.size());
  return rows;
}

}  // namespace edid_cli
