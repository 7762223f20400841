#include "edid_composer/platform/video_mode_entry.h"

#include <strings.h>

#include "edid_composer/platform/decimal_number.h"

namespace edid_composer {
namespace {

struct flag_3d_t {
  const char *name;
  u32 stereo;
};
constexpr flag_3d_t flags_3d[] = {
    {"FP", STEREO_FRAME_PACKING}, {"TBH", STEREO_TOP_AND_BOTTOM}, {"SBSH", STEREO_SIDE_BY_SIDE_HALF}};

/// The bit that a 3D flag stands for, in any letter case; 0 for a word that is none.
u32 stereo_of_flag(const char *word) {
  for (const auto &flag : flags_3d) {
    if (strcasecmp(word, flag.name) == 0) return flag.stereo;
  }
  return 0;
}

}  // namespace

// scanf itself took a quarter of the time in which a configuration is read.
int _scan_video_mode(const char *text, video_mode_words_t *words) {
  const decimal_number_t number = read_decimal_number(text);
  const char *rest = number.rest;
  if (rest == text) return 0;
  words->number = number.value;
  int fields = 1;
  for (auto &flag : words->flags) {
    while (is_blank(*rest))
      ++rest;
    std::size_t length = 0;
    while (length < sizeof flag - 1 && *rest != '\0' && !is_blank(*rest))
      flag[length++] = *rest++;
    if (length == 0) break;
    flag[length] = '\0';
    ++fields;
  }
  return fields;
}

configuration_outcome_t _get_vic_list_callback(const configuration_entry_t &entry,
                                               appender_t<short_video_desc_t> *modes) {
  REPORTS_AS(_get_vic_list_callback);
  const configuration_key_t &key = *entry.key;
  LOG_TRACE("Reading from list:%s Node:%s => %s", key.name, entry.node_name, entry.text);

  video_mode_words_t words{};
  const int fields = _scan_video_mode(entry.text, &words);
  const auto &flags = words.flags;
  const i32 vic = low_32_bits(words.number);
  if (fields <= 0) {
    LOG_WARNING("Invalid string \"%s\" in %s", entry.text, key.name);
    return {.reason = CONFIGURATION_NOT_A_NUMBER};
  }
  if (vic < static_cast<i32>(key.minimum) || vic > static_cast<i32>(key.maximum)) {
    LOG_WARNING(
        "Read a vic value from the platform config file that has an unexpected value:%d. Range:(%d-%d) Ignoring and "
        "continuing.",
        vic, key.minimum, key.maximum);
    return {.reason = CONFIGURATION_OUT_OF_RANGE, .found = vic};
  }
  u32 stereo = 0;
  for (int i = fields - 2; i >= 0; --i) {
    const u32 bit = stereo_of_flag(flags[i]);
    if (bit == 0) {
      LOG_WARNING("Invalid 3D flag \"%s\" in %s", flags[i], key.name);
      LOG_WARNING("Invalid string \"%s\" in %s", entry.text, key.name);
      return {.reason = CONFIGURATION_3D_UNKNOWN, .found = vic};
    }
    stereo |= bit;
  }
  if (!modes->append({.native = 0, .vic = static_cast<u32>(vic), .stereo = stereo})) {
    return {.reason = CONFIGURATION_OUT_OF_MEMORY, .found = vic};
  }
  LOG_TRACE("\tFound list entry: %s = \"%d %s %s %s\"", entry.node_name, vic, flags[0], flags[1], flags[2]);
  return {.found = vic, .used = vic};
}

appender_t<short_video_desc_t> video_mode_appender(ll_list_t *modes, entry_arena_t *arena) {
  REPORTS_AS(_get_vic_list_callback);
  return appender_t<short_video_desc_t>(modes, arena, site);
}

}  // namespace edid_composer
