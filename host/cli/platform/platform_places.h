// Where what the library has read stands in the platform's file.
#pragma once

#include <map>
#include <string>
#include <vector>

#include "platform/configuration_node.h"

namespace edid_cli {

/// An entry of a list that counts.
struct list_entry_t {
  std::string name;  ///< As "60_hz_priority_list[2]", or "audio.entry_b".
  std::string text;  ///< As written, a text without its quotes.
  position_t position;
};

/// The keys of the lists; "audio" stands for the audio formats.
namespace platform_list {
inline constexpr const char *priority_4k = "4k_x_2k_priority_list";
inline constexpr const char *addition_4k = "4k_x_2k_addition_list";
inline constexpr const char *priority_extended = "hdmi2.vic_priority_list";
inline constexpr const char *addition_extended = "hdmi2.vic_addition_list";
inline constexpr const char *audio = "audio";
std::string priority(u32 family);
std::string addition(u32 family);
}  // namespace platform_list

class platform_places_t {
 public:
  /// Reads the platform that is loaded. @p name is what its file is called in texts.
  explicit platform_places_t(std::string name);

  /// The entries of a list that count, in order. Those that the library skips are not among them.
  const std::vector<list_entry_t> &entries(const std::string &list) const;
  /// The entry at a place among those; nullptr when there is none.
  const list_entry_t *entry(const std::string &list, i32 place) const;

  /// "box.toml:40"; "box.toml" when the key is not there.
  std::string place_of(const std::string &key) const;
  std::string place_of(const position_t &position) const;
  /// Line 0 when the key is not there.
  static position_t position_of(const std::string &key);
  /// The integer at a key; @p otherwise when there is none.
  static i32 number_at(const std::string &key, i32 otherwise);
  /// What a key holds, as it is written in the file; empty when it is not there.
  static std::string value_at(const std::string &key);

  const std::string &name() const { return name_; }

 private:
  std::string name_;
  std::map<std::string, std::vector<list_entry_t>> lists_;
};

}  // namespace edid_cli
