// The decisions on the page, as HTML.
#pragma once

#include <string>
#include <vector>

#include "explain/explanation.h"

namespace edid_cli {

std::string summary_html(const explanation_t &explanation);
std::string warnings_html(const explanation_t &explanation);
std::string section_options_html(const std::vector<row_t> &rows);
std::string decisions_html(const std::vector<row_t> &rows);

}  // namespace edid_cli
