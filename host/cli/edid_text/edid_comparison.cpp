#include "edid_text/edid_comparison.h"

#include "edid_text/alignment.h"
#include "edid_text/edid_fields.h"

namespace edid_cli {

std::vector<compared_t> comparison_of(const edid_records_t &left, const edid_records_t &right) {
  std::vector<compared_t> rows;
  for (const edid_field_t &field : edid_fields()) {
    for (const aligned_row_t &row : align(field.values(left), field.values(right))) {
      rows.push_back({field.name, row.left.value_or("-"), row.right.value_or("-")});
    }
  }
  return rows;
}

}  // namespace edid_cli
