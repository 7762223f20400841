// The keys that the library reads of a platform configuration.
#pragma once

#include <cstdint>
#include <span>
#include <string>
#include <vector>

namespace edid_cli {

/// The table of the configuration that holds them.
inline constexpr const char *platform_domain = "platform.software.drivers.vorex.edid";

enum class key_kind_t { signed_number, unsigned_number, text, text_list, number_list };

/// Numbers inside the limits that count as another one all the same; none while @ref last is 0.
struct number_gap_t {
  std::int64_t first = 0;
  std::int64_t last = 0;
  std::int64_t counts_as = 0;
};

struct platform_key_t {
  const char *name;
  key_kind_t kind;
  std::int64_t min;  ///< Of a number or a list's numbers. Of a text: with fewer characters, what is @ref short_effect.
  std::int64_t max;  ///< Of a text or a list's texts: characters.
  std::int64_t default_number = 0;
  const char *default_text = "";
  number_gap_t gap{};
  std::size_t most_entries = 0;        ///< Of a list: more have no effect. 0: no such limit.
  bool may_be_empty = true;            ///< Of a list.
  const char *short_effect = nullptr;  ///< Of a text.
};

std::span<const platform_key_t> platform_keys();

/// Where a key stands in the whole configuration.
std::string platform_path(const std::string &key);

/// The audio formats: "audio.entry_a" to "audio.entry_z", numbers of 24 bits that may all be absent.
std::vector<std::string> audio_entry_keys();
inline constexpr const char *audio_table = "audio";
inline constexpr const char *audio_entry_prefix = "entry_";
inline constexpr std::uint32_t largest_audio_entry = 0xFFFFFF;
inline constexpr std::size_t most_audio_entries = 10;

}  // namespace edid_cli
