// An explanation as a JSON document (RFC 8259).
#pragma once

#include <string>

#include "explain/answer.h"
#include "explain/explanation.h"

namespace edid_cli {

std::string explanation_json(const explanation_t &explanation);

/// What stands in the way of what is wanted.
std::string answer_json(const std::string &wanted, const answers_t &answers);

}  // namespace edid_cli
