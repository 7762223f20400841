// The sentences that say why.
#pragma once

#include <string>

#include "explain/explained.h"

namespace edid_cli {

/// The sentence of a decision.
std::string reason_sentence(const compose_decision_t &decision, const explained_t &explained);

}  // namespace edid_cli
