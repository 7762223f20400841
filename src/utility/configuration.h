// Single values of the host's configuration tree, under the domain of the library's keys.
#pragma once

#include "edid_composer.h"

#define CONFIGURATION_DOMAIN "platform.software.drivers.vorex.edid."

namespace edid_composer {

/// What became of a value of the configuration. Numbers that are read unsigned keep their bits.
struct configuration_outcome_t {
  configuration_reason reason = CONFIGURATION_TAKEN;
  i32 found = 0;  ///< What stands there; 0 where nothing does.
  i32 used = 0;   ///< What counts instead, or the same.
};

// The rules of the public getters, for a whole path and with their outcome. They report in the getters' names.

configuration_outcome_t read_configuration_int(const char *path, i32 min, i32 max, i32 default_val,
                                               bool print_warnings);
configuration_outcome_t read_configuration_uint(const char *path, u32 min, u32 max, u32 default_val,
                                                bool print_warnings);
configuration_outcome_t read_configuration_str(const char *path, char *dst, u32 size, const char *default_val,
                                               bool print_warnings);

}  // namespace edid_composer
