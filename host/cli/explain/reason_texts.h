// The sentences that say why.
#pragma once

#include <string>

#include "explain/explained.h"

namespace edid_cli {

/// The sentence of a decision.
std::string reason_sentence(const compose_decision_t &decision, const explained_t &explained);

/// Whether a decision rests on a part of the sink's EDID that was not read.
bool rests_on_unread(const compose_decision_t &decision, const explained_t &explained);

/// The VIC that the sink means: not always the one that the library reads.
u32 sink_vic(const compose_decision_t &decision, const explained_t &explained);

}  // namespace edid_cli
