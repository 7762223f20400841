// The forms in which an explanation is written.
#pragma once

#include <string>

#include "explain/answer.h"
#include "explain/rows.h"

namespace edid_cli {

/// A table for each section.
std::string explanation_text(const explained_t &explained);
/// One JSON document.
std::string explanation_json(const explained_t &explained);
/// One HTML page that needs nothing else.
std::string explanation_page(const explained_t &explained);

/// What stands in the way of what is wanted, as text and as JSON.
std::string answer_text(const std::vector<answer_t> &answers);
std::string answer_json(const std::string &wanted, const std::vector<answer_t> &answers);

}  // namespace edid_cli
