// The sink, the platform and the new EDID on the page, as HTML.
#pragma once

#include <string>

#include "explain/explanation.h"

namespace edid_cli {

std::string facts_html(const std::vector<fact_t> &facts);
std::string comparison_html(const std::vector<compared_t> &rows);
std::string keys_html(const platform_check_t &check);
std::string findings_html(const platform_check_t &check);

}  // namespace edid_cli
