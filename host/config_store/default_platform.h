// The documents of the platforms that come with the library, made from platform.toml and platform_hdmi2.toml when it is
// built.
#pragma once

namespace edid_config_store {

extern const char *const default_platform_text;
extern const char *const hdmi2_platform_text;

}  // namespace edid_config_store
