// An explanation as an HTML page.
#pragma once

#include <string>

#include "explain/explanation.h"

namespace edid_cli {

/// One page that needs nothing else.
std::string explanation_page(const explanation_t &explanation);

}  // namespace edid_cli
