#include "edid_composer/platform/standard_timing_entry.h"

#include <cstring>

#include "edid_composer/platform/decimal_number.h"
#include "linked_list/typed_list.h"

namespace edid_composer {
namespace {

/// Products wrap to 32 bits before they are divided.
constexpr i32 scaled(i32 number, u32 factor, i32 divisor) {
  return static_cast<i32>(static_cast<u32>(number) * factor) / divisor;
}

/// Cuts numbers out of the entry_text_size bytes of a standard timing: each a run of digits, with exactly one character
/// after it.
class number_cutter_t {
 public:
  explicit number_cutter_t(const char *text) { std::memcpy(text_, text, entry_text_size); }

  /// The next number; 0 for an empty run, also after the end of the buffer.
  i32 next() {
    if (position_ >= entry_text_size) return 0;
    char *const run = text_ + position_;
    const std::size_t length = std::strspn(run, "0123456789");
    run[length] = '\0';
    position_ += length + 1;
    return low_32_bits(read_decimal_number(run).value);
  }

 private:
  char text_[entry_text_size];
  std::size_t position_ = 0;
};

/// What a standard timing can hold (EDID 1.3, section 3.9): a byte that is not 0.
constexpr i32 width_unit = 8;
constexpr i32 units_left_out = 31;
constexpr i32 narrowest = (units_left_out + 1) * width_unit;
constexpr i32 widest = (units_left_out + 0xFF) * width_unit;

/// The width that a reader finds: the byte holds the low bits of what it can't hold.
constexpr i32 encoded_width(i32 width) {
  return (((width / width_unit - units_left_out) & 0xFF) + units_left_out) * width_unit;
}

}  // namespace

configuration_outcome_t _get_std_timing_callback(const configuration_entry_t &entry, ll_list_t *timings,
                                                 entry_arena_t *arena) {
  REPORTS_AS(_get_std_timing_callback);
  number_cutter_t numbers(entry.text);
  const i32 width = numbers.next();
  const i32 height = numbers.next();
  const i32 written_refresh = numbers.next();
  i32 refresh = written_refresh;
  const i32 fraction = numbers.next();

  if (width % width_unit != 0) {
    LOG_WARNING("Standard timing width(%d) must be a factor of 8. Entry:%s = \"%s\"", width, entry.node_name,
                entry.text);
    return {.reason = CONFIGURATION_WIDTH_NOT_IN_EIGHTS, .found = width};
  }
  u32 ratio = 0;
  if (convert_geo_to_ratio(static_cast<u32>(width), static_cast<u32>(height), &ratio) != 1) {
    // kept: the last two heights are the width times the ratio, not divided by it.
    LOG_WARNING(
        "Height(%d) is not in a proper ratio to width(%d). Accepted heights 1:1=>%d 4:3=>%d 5:4=>%d 16:9=>%d "
        "Entry:%s\n",
        height, width, width, scaled(width, 3, 4), scaled(width, 5, 4), scaled(width, 16, 9), entry.text);
    return {.reason = CONFIGURATION_HEIGHT_UNKNOWN, .found = height};
  }
  if (fraction != 0) {
    LOG_WARNING(
        "Only whole refresh rates(%d.%d) are supported, ie 60 not 59.94. Incrementing refresh rate and continuing. "
        "Entry:%s\n",
        refresh, fraction, entry.text);
    refresh = static_cast<i32>(static_cast<u32>(refresh) + 1);
  }
  if (refresh < static_cast<i32>(entry.key->minimum) || refresh > static_cast<i32>(entry.key->maximum)) {
    LOG_WARNING("Invalid Refresh rate(%d). Must be 60 to 123. Entry:%s\n", refresh, entry.text);
    return {.reason = CONFIGURATION_OUT_OF_RANGE, .found = refresh};
  }
  const std_timing_t timing{
      .h_active = static_cast<u32>(width), .aspect_ratio = ratio, .refresh_rate = static_cast<u32>(refresh)};
  if (!appender_t<std_timing_t>(timings, arena, site).append(timing)) return {.reason = CONFIGURATION_OUT_OF_MEMORY};
  if (width < narrowest || width > widest) {
    return {.reason = CONFIGURATION_WIDTH_NOT_ENCODABLE, .found = width, .used = encoded_width(width)};
  }
  return {.reason = fraction != 0 ? CONFIGURATION_RATE_ROUNDED_UP : CONFIGURATION_TAKEN,
          .found = written_refresh,
          .used = refresh};
}

}  // namespace edid_composer
