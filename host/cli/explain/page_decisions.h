// The decisions on the page, as HTML.
#pragma once

#include <string>
#include <vector>

#include "explain/rows.h"

namespace edid_cli {

std::string summary_html(const std::vector<row_t> &rows);
std::string warnings_html(const std::vector<row_t> &rows);
std::string section_options_html();
std::string decisions_html(const std::vector<row_t> &rows);

}  // namespace edid_cli
