// Two decoded EDIDs side by side, field by field.
#pragma once

#include <string>
#include <vector>

#include "edid_text/edid_field.h"

namespace edid_cli {

/// A field of both EDIDs; "-" where one hasn't it.
struct compared_t {
  std::string field;
  std::string left;
  std::string right;
};

/// The fields in the order of an EDID's bytes; of those with many values, a row for each.
std::vector<compared_t> comparison_of(const edid_records_t &left, const edid_records_t &right);

}  // namespace edid_cli
