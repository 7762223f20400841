#include "platform/platform_keys.h"

#include <algorithm>
#include <iterator>

namespace edid_cli {
namespace {

constexpr const char *first_audio_entry = "audio.entry_a";
constexpr const char *last_audio_entry = "audio.entry_z";

std::string range_text(const configuration_key_t &key) {
  return std::to_string(key.minimum) + " to " + std::to_string(key.maximum);
}

}  // namespace

std::vector<const configuration_key_t *> platform_keys() {
  std::vector<const configuration_key_t *> keys;
  for (u32 index = 0; const configuration_key_t *key = configuration_key(index); ++index) {
    keys.push_back(key);
  }
  return keys;
}

std::string platform_path(const std::string &key) {
  return std::string(platform_domain) + "." + key;
}

std::string inner_table_of(const std::string &key) {
  const std::size_t dot = key.find('.');
  return dot == std::string::npos ? "" : key.substr(0, dot);
}

bool is_inner_table(const std::string &name) {
  return std::find(std::begin(inner_tables), std::end(inner_tables), name) != std::end(inner_tables);
}

std::vector<std::string> audio_entry_keys() {
  std::vector<std::string> entries;
  for (char letter = 'a'; letter <= 'z'; ++letter) {
    entries.push_back(std::string(audio_table) + "." + audio_entry_prefix + letter);
  }
  return entries;
}

bool is_list(const configuration_key_t &key) {
  return key.kind == CONFIGURATION_VIDEO_MODES || key.kind == CONFIGURATION_HDMI_VICS ||
         key.kind == CONFIGURATION_TIMING_BITS || key.kind == CONFIGURATION_STANDARD_TIMINGS ||
         key.kind == CONFIGURATION_EXTENDED_VICS;
}

bool is_number(const configuration_key_t &key) {
  return key.kind == CONFIGURATION_INTEGER || key.kind == CONFIGURATION_UNSIGNED;
}

std::string name_text(const configuration_key_t &key) {
  return key.kind == CONFIGURATION_AUDIO_FORMATS ? std::string(first_audio_entry) + " to " + last_audio_entry
                                                 : key.name;
}

std::string type_text(const configuration_key_t &key) {
  if (is_list(key)) {
    return key.entry_characters != 0 ? "list of texts" : "list of integers";
  }
  return key.kind == CONFIGURATION_TEXT ? "text" : "integer";
}

std::string limits_text(const configuration_key_t &key) {
  if (key.kind == CONFIGURATION_AUDIO_FORMATS) {
    return "24 bits";
  }
  if (key.kind == CONFIGURATION_TEXT) {
    return std::to_string(key.maximum) + " characters";
  }
  if (is_number(key)) {
    return range_text(key);
  }
  if (key.entry_characters != 0) {
    return std::to_string(key.entry_characters) + " characters each";
  }
  // What lies between is not defined.
  const std::string range = key.kind == CONFIGURATION_EXTENDED_VICS ? "65 to 127 and 193 to 219" : range_text(key);
  return range + " each" + (key.most_entries != 0 ? ", " + std::to_string(key.most_entries) + " entries" : "");
}

std::string default_text(const configuration_key_t &key) {
  if (key.kind == CONFIGURATION_AUDIO_FORMATS) {
    return "absent";
  }
  if (is_list(key)) {
    return "empty";
  }
  return is_number(key) ? std::to_string(key.default_number) : "\"" + std::string(key.default_text) + "\"";
}

}  // namespace edid_cli
