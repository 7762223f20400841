// What the library reads of the platform configuration that is loaded.
#pragma once

#include <string>
#include <vector>

#include "composition/composition.h"
#include "platform/configuration_node.h"

namespace edid_cli {

/// A composition without a sink of the platform that is loaded, observed: with what was read, and what was decided.
composition_t compose_without_sink(const compose_cfg_t &settings);

/// "week", "60_hz_priority_list[2]", "audio.entry_b".
std::string name_of(const kept_reading_t &reading);

/// What stands there in the configuration; none where nothing does.
std::optional<configuration_node_t> node_of(const kept_reading_t &reading);

}  // namespace edid_cli
