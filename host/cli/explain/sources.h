// Where decisions come from.
#pragma once

#include "explain/rows.h"

namespace edid_cli {

std::vector<source_t> sources_of(const compose_decision_t &decision, const explained_t &explained);

}  // namespace edid_cli
