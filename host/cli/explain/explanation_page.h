// An explanation as an HTML page.
#pragma once

#include <string>

#include "explain/explained.h"

namespace edid_cli {

/// One page that needs nothing else.
std::string explanation_page(const explained_t &explained);

}  // namespace edid_cli
