// Where the library's keys stand in the host's configuration tree.
#pragma once

#define CONFIGURATION_DOMAIN "platform.software.drivers.vorex.edid."
