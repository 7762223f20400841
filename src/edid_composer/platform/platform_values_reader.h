// Reading the platform configuration into one record.
#pragma once

#include "edid_composer/platform/configuration_readings.h"
#include "linked_list/entry_arena.h"

namespace edid_composer {

/// Fills an initialised record from the configuration tree. Its list entries come from the heap without an @p arena.
/// False when an audio entry could not be kept.
bool _read_platform_values(platform_values_t *values, entry_arena_t *arena,
                           const configuration_readings_t &readings = {});

}  // namespace edid_composer
