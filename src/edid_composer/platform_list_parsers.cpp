// The grammars of list entries. What an entry of a list means to the new EDID is told in platform_values_t.
#include <strings.h>

#include <cctype>
#include <cstdlib>
#include <cstring>

#include "diagnostics.h"
#include "edid_composer/platform_mode_lists.h"
#include "linked_list/new_entry.h"

namespace edid_composer {
namespace {

constexpr u32 most_modes_4k_x_2k = 7;

/// A run of digits, or what scanf made of one, kept to its low 32 bits.
constexpr i32 low_32_bits(long number) {
  return static_cast<i32>(static_cast<u32>(number));
}

/// Products wrap to 32 bits before they are divided.
constexpr i32 scaled(i32 number, u32 factor, i32 divisor) {
  return static_cast<i32>(static_cast<u32>(number) * factor) / divisor;
}

struct flag_3d_t {
  char name[8];
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

/// Cuts numbers out of the list_value_size bytes of a standard timing: each a run of digits, with exactly one character
/// behind it.
class number_cutter_t {
 public:
  explicit number_cutter_t(const char *text) { std::memcpy(text_, text, list_value_size); }

  /// The next number; 0 for an empty run, also behind the end of the buffer.
  i32 next() {
    if (position_ >= list_value_size) return 0;
    char *const run = text_ + position_;
    const std::size_t length = std::strspn(run, "0123456789");
    run[length] = '\0';
    position_ += length + 1;
    return low_32_bits(std::strtol(run, nullptr, 10));
  }

 private:
  char text_[list_value_size];
  std::size_t position_ = 0;
};

}  // namespace

// scanf itself took a quarter of the time in which a configuration is read.
int _scan_video_mode(const char *text, video_mode_words_t *words) {
  const auto is_blank = [](char character) { return std::isspace(static_cast<unsigned char>(character)) != 0; };
  char *rest = nullptr;
  words->number = std::strtol(text, &rest, 10);
  if (rest == text) return 0;
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

// A VIC and up to three 3D flags, as in "16 FP TBH".
bool _get_vic_list_callback(const char *node_name, const char *list_name, i32 int_value, char *string_value,
                            u32 string_size, void *context) {
  static_cast<void>(int_value);
  static_cast<void>(string_size);
  constexpr i32 first_vic = 1;
  constexpr i32 last_vic = 64;
  if (context == nullptr) {
    LOG_BUG("user_ptr is NULL\n");
    return false;
  }
  LOG_TRACE("Reading from list:%s Node:%s => %s", list_name, node_name, string_value);

  video_mode_words_t words{};
  const int fields = _scan_video_mode(string_value, &words);
  const auto &flags = words.flags;
  const i32 vic = low_32_bits(words.number);
  if (fields <= 0) {
    LOG_WARNING("Invalid string \"%s\" in %s", string_value, list_name);
    return false;
  }
  if (vic < first_vic || vic > last_vic) {
    LOG_WARNING(
        "Read a vic value from the platform config file that has an unexpected value:%d. Range:(%d-%d) Ignoring and "
        "continuing.",
        vic, first_vic, last_vic);
    return false;
  }
  u32 stereo = 0;
  for (int i = fields - 2; i >= 0; --i) {
    const u32 bit = stereo_of_flag(flags[i]);
    if (bit == 0) {
      LOG_WARNING("Invalid 3D flag \"%s\" in %s", flags[i], list_name);
      LOG_WARNING("Invalid string \"%s\" in %s", string_value, list_name);
      return false;
    }
    stereo |= bit;
  }
  const short_video_desc_t video{.native = 0, .vic = static_cast<u32>(vic), .stereo = stereo};
  if (!append(static_cast<list_context_t *>(context)->list, video, HERE)) return false;
  LOG_TRACE("\tFound list entry: %s = \"%d %s %s %s\"", node_name, vic, flags[0], flags[1], flags[2]);
  return true;
}

bool _get_4k_x_2k_mode_callback(const char *node_name, const char *list_name, i32 int_value, char *string_value,
                                u32 string_size, void *context) {
  static_cast<void>(list_name);
  static_cast<void>(string_value);
  static_cast<void>(string_size);
  constexpr i32 first_mode = 1;
  constexpr i32 last_mode = 4;
  if (context == nullptr) {
    LOG_BUG("user_ptr is NULL\n");
    return false;
  }
  if (int_value < first_mode || int_value > last_mode) {
    LOG_WARNING("Detected a 4k x 2k mode that is not supported. Max:%d Received:%d Node:%s", last_mode, int_value,
                node_name);
    return false;
  }
  auto *const read = static_cast<modes_4k_x_2k_context_t *>(context);
  if (read->count == most_modes_4k_x_2k) return false;
  read->modes[read->count++] = int_value;
  LOG_TRACE("Read 4k x 2k mode:%d", int_value);
  return true;
}

bool _get_est_timing_callback(const char *node_name, const char *list_name, i32 int_value, char *string_value,
                              u32 string_size, void *context) {
  static_cast<void>(string_value);
  static_cast<void>(string_size);
  constexpr i32 last_bit = 7;
  if (context == nullptr) {
    LOG_BUG("user_ptr is NULL\n");
    return false;
  }
  if (int_value < 0 || int_value > last_bit) {
    LOG_WARNING("Mode value is not 0 to 7. Val:%d Node:%s", int_value, node_name);
    return false;
  }
  *static_cast<u32 *>(context) |= 1U << int_value;
  LOG_TRACE("Added timing val:%d for list:%s", int_value, list_name);
  return true;
}

// Width, height, refresh rate and, where there is one, its fraction, as in "1920 1080 60" or "1280x1024x59.94".
bool _get_std_timing_callback(const char *node_name, const char *list_name, i32 int_value, char *string_value,
                              u32 string_size, void *context) {
  static_cast<void>(list_name);
  static_cast<void>(int_value);
  static_cast<void>(string_size);
  constexpr i32 width_unit = 8;
  constexpr i32 lowest_refresh = 60;
  constexpr i32 highest_refresh = 123;
  if (context == nullptr) {
    LOG_BUG("user_ptr is NULL\n");
    return false;
  }
  string_value[list_value_size - 1] = '\0';
  number_cutter_t numbers(string_value);
  const i32 width = numbers.next();
  const i32 height = numbers.next();
  i32 refresh = numbers.next();
  const i32 fraction = numbers.next();

  if (width % width_unit != 0) {
    LOG_WARNING("Standard timing width(%d) must be a factor of 8. Entry:%s = \"%s\"", width, node_name, string_value);
    return false;
  }
  u32 ratio = 0;
  if (convert_geo_to_ratio(static_cast<u32>(width), static_cast<u32>(height), &ratio) != 1) {
    // kept: the last two heights are the width times the ratio, not divided by it.
    LOG_WARNING(
        "Height(%d) is not in a proper ratio to width(%d). Accepted heights 1:1=>%d 4:3=>%d 5:4=>%d 16:9=>%d "
        "Entry:%s\n",
        height, width, width, scaled(width, 3, 4), scaled(width, 5, 4), scaled(width, 16, 9), string_value);
    return false;
  }
  if (fraction != 0) {
    LOG_WARNING(
        "Only whole refresh rates(%d.%d) are supported, ie 60 not 59.94. Incrementing refresh rate and continuing. "
        "Entry:%s\n",
        refresh, fraction, string_value);
    refresh = static_cast<i32>(static_cast<u32>(refresh) + 1);
  }
  if (refresh < lowest_refresh || refresh > highest_refresh) {
    LOG_WARNING("Invalid Refresh rate(%d). Must be 60 to 123. Entry:%s\n", refresh, string_value);
    return false;
  }
  const std_timing_t timing{
      .h_active = static_cast<u32>(width), .aspect_ratio = ratio, .refresh_rate = static_cast<u32>(refresh)};
  return append(static_cast<list_context_t *>(context)->list, timing, HERE);
}

}  // namespace edid_composer
