// The default platform's document, made from platform.toml when the library is built.
#pragma once

namespace edid_config_store {

extern const char *const default_platform_text;

}  // namespace edid_config_store
