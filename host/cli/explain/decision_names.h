// What a decision is about, as people call it.
#pragma once

#include <string>

#include "explain/explained.h"

namespace edid_cli {

std::string decision_name(const compose_decision_t &decision, const explained_t &explained);

/// Whether what the library took for a timing of the sink are bytes of a block that it doesn't read.
bool is_of_unread_block(const compose_decision_t &decision, const sink_reading_t &reading);

}  // namespace edid_cli
