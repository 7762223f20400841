#include "explain/steps.h"

#include <algorithm>

#include "explain/mode_names.h"
#include "platform/platform_keys.h"
#include "text/hexadecimal.h"

namespace edid_cli {
namespace {

std::string with_remark(const std::string &text, const std::string &remark) {
  return remark.empty() ? text : text + ": " + remark;
}

/// The three bytes of a usual descriptor of a type, as the platform's file holds them: byte 1 lowest.
u32 usual_audio_entry(u32 type) {
  constexpr u32 pcm = 1;
  constexpr u32 last_with_bitrate = 8;
  constexpr u32 first_extension = 16;
  constexpr u32 extension_format = 15;
  constexpr u32 rates_32_to_48 = 0x07;
  const u32 format = std::min(type, extension_format);
  const u32 channels = type == pcm ? 2 : 6;
  u32 detail = 0;
  if (type == pcm) {
    detail = 0x07;  // 16, 20 and 24 bits
  } else if (type <= last_with_bitrate) {
    detail = 640 / 8;  // kbit/s
  } else if (type >= first_extension) {
    detail = (type - extension_format) << 3;
  }
  return detail << 16 | rates_32_to_48 << 8 | format << 3 | (channels - 1);
}

/// A key for one more audio format, after those that are there.
std::string free_audio_key(const std::vector<list_entry_t> &entries) {
  const auto is_used = [&entries](const std::string &key) {
    return std::any_of(entries.begin(), entries.end(), [&key](const auto &entry) { return entry.name == key; });
  };
  const std::string prefix = std::string(audio_table) + "." + audio_entry_prefix;
  const char first = entries.empty() || entries.back().name.back() == 'z' ? 'a' : entries.back().name.back();
  char letter = first;
  while (letter < 'z' && is_used(prefix + letter)) {
    ++letter;
  }
  return prefix + letter;
}

}  // namespace

void steps_t::add_entry(const std::string &list, const std::string &entry, const std::string &remark,
                        std::size_t most) {
  const std::vector<list_entry_t> &entries = explained_.places.entries(list);
  const position_t position = platform_places_t::position_of(list);
  if (position.line == 0) {
    add(with_remark(
            "add " + list + " = [" + entry + "] to the table " + platform_domain + " of " + explained_.places.name(),
            remark),
        list, 0);
  } else if (most != 0 && entries.size() >= most) {
    const list_entry_t &last = entries[most - 1];
    add(with_remark("write " + entry + " in place of " + last.text + " in " + list + " (" +
                        explained_.places.place_of(last.position) + "), which takes " + std::to_string(most) +
                        " entries",
                    remark),
        list, last.position.line);
  } else {
    add(with_remark("add " + entry + " to " + list + " (" + explained_.places.place_of(position) + ")", remark), list,
        position.line);
  }
}

void steps_t::take_entry_out(const std::string &list, const list_entry_t &entry) {
  const bool is_audio = list == platform_list::audio;
  add("take " + (is_audio ? entry.name : "\"" + entry.text + "\"") + " out" + (is_audio ? "" : " of " + list) + " (" +
          explained_.places.place_of(entry.position) + "): there is room for fewer",
      is_audio ? entry.name : list, entry.position.line);
}

void steps_t::set(const std::string &key, const std::string &value, const std::string &remark) {
  const position_t position = platform_places_t::position_of(key);
  const std::string assignment = key + " = " + value;
  add(with_remark(position.line == 0
                      ? "add " + assignment + " to the table " + platform_domain + " of " + explained_.places.name()
                      : "set " + assignment + " (" + explained_.places.place_of(position) + ")",
                  remark),
      key, position.line);
}

void steps_t::announce_extension() {
  if (!explained_.is_extension_announced()) {
    set("monitor_name", "\"Box\"", "or another name of 2 to 13 characters, so that sources read the extension");
  }
}

void steps_t::add_audio_entry(u32 type) {
  const std::vector<list_entry_t> &entries = explained_.places.entries(platform_list::audio);
  const std::string key = free_audio_key(entries);
  const position_t position = entries.empty() ? platform_places_t::position_of(audio_table) : entries.back().position;
  add("add " + key + " = " + hex_number(usual_audio_entry(type), 6) + " (" + audio_type_name(type) +
          (type == 1 ? ", 2" : ", 6") + " channels, 32 to 48 kHz) behind " + explained_.places.place_of(position),
      key, position.line);
}

void steps_t::give_option(const std::string &option, const std::string &value) {
  add("give " + option + " " + value, option, 0);
}

void steps_t::drop_option(const std::string &option) {
  add("leave " + option + " away", option, 0);
}

}  // namespace edid_cli
