// Reading the platform configuration into one record.
#pragma once

#include "edid_composer.h"

namespace edid_composer {

/// Fills an initialised record from the configuration tree. False when an audio entry could not be kept.
bool _read_platform_values(platform_values_t *values);

}  // namespace edid_composer
