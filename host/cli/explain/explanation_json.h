// An explanation as a JSON document (RFC 8259).
#pragma once

#include <string>
#include <vector>

#include "explain/answer.h"

namespace edid_cli {

std::string explanation_json(const explained_t &explained);

/// What stands in the way of what is wanted.
std::string answer_json(const std::string &wanted, const std::vector<answer_t> &answers);

}  // namespace edid_cli
