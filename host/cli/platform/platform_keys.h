// The keys that the library reads of a platform configuration, in words. The table itself is the library's.
#pragma once

#include <string>
#include <vector>

#include "edid_composer.h"

namespace edid_cli {

/// The table of the configuration that holds them.
inline constexpr const char *platform_domain = "platform.software.drivers.vorex.edid";
/// The table of the audio formats in it, and how the keys of these begin.
inline constexpr const char *audio_table = "audio";
inline constexpr const char *audio_entry_prefix = "entry_";
/// The table of what HDMI 2 added.
inline constexpr const char *hdmi2_table = "hdmi2";
/// The tables in the domain.
inline constexpr const char *inner_tables[] = {audio_table, hdmi2_table};
/// "audio" of "audio.entry_a"; empty of a key of the domain itself.
std::string inner_table_of(const std::string &key);
bool is_inner_table(const std::string &name);

/// In the order in which they are read.
std::vector<const configuration_key_t *> platform_keys();

/// Where a key stands in the whole configuration.
std::string platform_path(const std::string &key);

/// "audio.entry_a" to "audio.entry_z".
std::vector<std::string> audio_entry_keys();

bool is_list(const configuration_key_t &key);
bool is_number(const configuration_key_t &key);

/// "week", "audio.entry_a to audio.entry_z".
std::string name_text(const configuration_key_t &key);
/// "integer", "list of texts".
std::string type_text(const configuration_key_t &key);
/// "0 to 255", "1 to 4 each, 7 entries", "13 characters".
std::string limits_text(const configuration_key_t &key);
/// "1", "\"YYY\"", "empty", "absent".
std::string default_text(const configuration_key_t &key);

}  // namespace edid_cli
