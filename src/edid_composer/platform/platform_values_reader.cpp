#include "edid_composer/platform/platform_values_reader.h"

#include <cstring>
#include <iterator>

#include "diagnostics.h"
#include "edid_composer/platform/configuration_keys.h"
#include "edid_composer/platform/mode_lists.h"
#include "linked_list/typed_list.h"

namespace edid_composer {
namespace {

REPORTS_AS(_read_platform_values);

class reader_t {
 public:
  reader_t(platform_values_t *values, entry_arena_t *arena, const configuration_readings_t &readings)
      : values_(values), arena_(arena), readings_(readings) {}

  /// False when the reading can't go on.
  bool read(const platform_key_t &row) {
    const configuration_key_t &key = row.key;
    switch (key.kind) {
      case CONFIGURATION_INTEGER:
        read_number(row, read_configuration_int(key.path, static_cast<i32>(key.minimum), static_cast<i32>(key.maximum),
                                                static_cast<i32>(key.default_number), true));
        return true;
      case CONFIGURATION_UNSIGNED:
        read_number(row, read_configuration_uint(key.path, key.minimum, key.maximum, key.default_number, true));
        return true;
      case CONFIGURATION_TEXT:
        read_text(row);
        return true;
      case CONFIGURATION_VIDEO_MODES:
        // An empty list has been reported by then, and is tolerated.
        _get_platform_list(row, member<ll_list_t>(row), arena_, readings_);
        return true;
      case CONFIGURATION_HDMI_VICS:
        _get_4k_x_2k_modes(key, *member<i32[7]>(row), readings_);
        return true;
      case CONFIGURATION_TIMING_BITS:
        _get_est_timing_list(key, member<u32>(row), readings_);
        return true;
      case CONFIGURATION_STANDARD_TIMINGS:
        _get_std_timing_list(key, member<ll_list_t>(row), arena_, readings_);
        return true;
      default:
        return read_audio_formats(row);
    }
  }

 private:
  template <typename member_t>
  member_t *member(const platform_key_t &row) const {
    return member_of<member_t>(values_, row);
  }

  void read_number(const platform_key_t &row, configuration_outcome_t outcome) {
    if (row.settle != nullptr) row.settle(&outcome);
    std::memcpy(member<i32>(row), &outcome.used, sizeof outcome.used);
    readings_.note(row.key, outcome);
  }

  void read_text(const platform_key_t &row) {
    char *const field = member<char>(row);
    const configuration_outcome_t outcome =
        read_configuration_str(row.key.path, field, row.key.maximum + 1, row.key.default_text, true);
    // Whatever the host has written.
    char text[sizeof values_->monitor_name + 1] = "";
    std::memcpy(text, field, row.key.maximum + 1);
    readings_.note(row.key, outcome, text);
  }

  bool read_audio_formats(const platform_key_t &row) {
    appender_t<i32> entries(member<ll_list_t>(row), arena_, site);
    char path[64];
    const std::size_t length = std::strlen(row.key.path);
    static_assert(sizeof path > sizeof CONFIGURATION_DOMAIN + sizeof "audio.entry_?");
    std::memcpy(path, row.key.path, length + 1);
    i32 count = 0;
    for (i32 letter = 0; letter < 26; ++letter) {
      path[length - 1] = static_cast<char>('a' + letter);
      i32 value = 0;
      if (config_get_int(0, path, &value) != 0) continue;
      if (!entries.append(value)) return false;
      readings_.note_audio_format(row.key, letter, value, count++);
    }
    readings_.note_list(row.key, count == 0 ? CONFIGURATION_ABSENT : CONFIGURATION_TAKEN, count, count);
    return true;
  }

  platform_values_t *values_;
  entry_arena_t *arena_;
  const configuration_readings_t &readings_;
};

}  // namespace

bool _read_platform_values(platform_values_t *values, entry_arena_t *arena, const configuration_readings_t &readings) {
  reader_t reader(values, arena, readings);
  for (const platform_key_t &row : platform_keys()) {
    if (!reader.read(row)) return false;
  }
  return true;
}

}  // namespace edid_composer
