// An explanation as text.
#pragma once

#include <string>

#include "explain/answer.h"
#include "explain/explanation.h"

namespace edid_cli {

enum class table_width_t {
  narrow,  ///< Fits 100 columns: no sources, and long cells are wrapped.
  wide     ///< Everything, a line each row.
};

/// What matters, then a table for each section.
std::string explanation_text(const explanation_t &explanation, table_width_t width);

/// What stands in the way of what is wanted.
std::string answer_text(const answers_t &answers);

}  // namespace edid_cli
