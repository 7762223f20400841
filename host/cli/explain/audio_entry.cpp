#include "explain/audio_entry.h"

#include <algorithm>
#include <iterator>

#include "config_store.h"
#include "edid_text/edid_value_texts.h"
#include "explain/platform_draft.h"
#include "platform/platform_keys.h"

namespace edid_cli {
namespace {

constexpr u32 extension_format = 15;

struct usual_entry_t {
  u32 type;
  u32 value;
};

/// As televisions and receivers declare them most often.
constexpr usual_entry_t usual_entries[] = {
    {9, 0x00024D},   // DSD, 6 channels, 44.1 kHz
    {11, 0x017E5F},  // DTS-HD, 8 channels, 44.1 to 192 kHz
    {12, 0x005467},  // MLP and TrueHD, 8 channels, 48, 96 and 192 kHz
};

/// For the others: 2 or more channels at 32 to 48 kHz, with 640 kbit/s where the format tells it.
u32 usual_value(u32 type, u32 channels) {
  constexpr u32 last_with_bitrate = 8;
  constexpr u32 rates_32_to_48 = 0x07;
  constexpr u32 all_sizes = 0x07;
  const u32 format = std::min(type, extension_format);
  const u32 detail = type == pcm_type            ? all_sizes
                     : type <= last_with_bitrate ? 640 / 8
                     : type > extension_format   ? (type - extension_format) << 3
                                                 : 0;
  return detail << 16 | rates_32_to_48 << 8 | format << 3 | (channels - 1);
}

u32 usual_entry(const wanted_t &wanted) {
  const auto *const found = std::find_if(std::begin(usual_entries), std::end(usual_entries),
                                         [&wanted](const auto &entry) { return entry.type == wanted.code; });
  return found != std::end(usual_entries) ? found->value : usual_value(wanted.code, std::max(wanted.channels, 2U));
}

bool is_wanted(const wanted_t &wanted, const short_audio_desc_t &format) {
  return format.type == wanted.code && format.channels >= wanted.channels;
}

/// The entry of the default platform; 0 when it has none.
u32 default_entry(const wanted_t &wanted) {
  if (!config_store_load_default()) {
    return 0;
  }
  const platform_draft_t platform;
  for (const std::string &key : audio_entry_keys()) {
    const auto value = static_cast<u32>(platform.number(key, 0));
    const auto format = decoded_audio_entry(value);
    if (format && is_wanted(wanted, *format)) {
      return value;
    }
  }
  return 0;
}

audio_entry_t described_entry(u32 value, const std::string &whose) {
  const auto format = decoded_audio_entry(value);
  return {value, whose + (format ? ": " + audio_format_text(*format) : "")};
}

}  // namespace

std::optional<short_audio_desc_t> decoded_audio_entry(u32 value) {
  short_audio_desc_t format{};
  const bool has_format = (value >> 3 & 15U) != 0;
  const bool is_decoded = has_format && decode_edid_short_audio(static_cast<u8>(value), static_cast<u8>(value >> 8),
                                                                static_cast<u8>(value >> 16), &format) != 0;
  return is_decoded ? std::optional(format) : std::nullopt;
}

std::optional<u32> sink_audio_entry(const wanted_t &wanted, const explained_t &explained) {
  std::optional<u32> best;
  for (const u32 value : explained.reading.short_audio) {
    const auto format = decoded_audio_entry(value);
    const bool is_better = format && is_wanted(wanted, *format) && (!best || (value & 7U) > (*best & 7U));
    best = is_better ? std::optional(value) : best;
  }
  return best;
}

audio_entry_t proposed_audio_entry(const wanted_t &wanted, const explained_t &explained) {
  if (const auto entry = sink_audio_entry(wanted, explained)) {
    return described_entry(*entry, "the sink's own");
  }
  if (const u32 entry = default_entry(wanted)) {
    return described_entry(entry, "the sink has none; this is the default platform's");
  }
  return described_entry(usual_entry(wanted), "the sink has none; this is a usual one");
}

}  // namespace edid_cli
