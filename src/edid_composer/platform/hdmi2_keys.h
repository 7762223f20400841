// The keys of the configuration's table "hdmi2".
#pragma once

#include "edid_composer/platform/configuration_keys.h"

namespace edid_composer {

/// In the order in which they are read, after platform_keys(). Their fields are members of hdmi2_values_t. The first,
/// "enable", decides whether the others are read.
std::span<const platform_key_t> hdmi2_keys();

}  // namespace edid_composer
