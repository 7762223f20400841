// An explanation as text.
#pragma once

#include <string>
#include <vector>

#include "explain/answer.h"

namespace edid_cli {

/// A table for each section.
std::string explanation_text(const explained_t &explained);

/// What stands in the way of what is wanted.
std::string answer_text(const std::vector<answer_t> &answers);

}  // namespace edid_cli
