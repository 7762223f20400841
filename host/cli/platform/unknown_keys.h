// Keys of the platform configuration that nobody reads.
#pragma once

#include "platform/finding.h"

namespace edid_cli {

/// Those in the library's table, with the key that may be meant, and those that stand in a table around it and have the
/// name of one that belongs inside.
findings_t find_unknown_keys();

/// When the library's table is not there at all: that, with the name that may be meant by another one.
findings_t find_missing_table();

}  // namespace edid_cli
