#include "utility/configuration.h"

// The limits of a getter are checked in every build type.
#undef NDEBUG
#include <cassert>
#include <cstdio>

#include "diagnostics.h"

namespace edid_composer {
namespace {

using path_t = configuration_path_t<256>;

/// What both number getters do once the limits are known to be consistent. An unsigned number is compared as such and
/// printed as a signed one.
template <const site_t &site, typename number_t>
number_t read_number(const char *key, number_t min, number_t max, number_t default_val, bool print_warnings) {
  const path_t path(key);
  i32 stored = 0;
  auto value = default_val;
  if (config_get_int(0, path.text(), &stored) == 0) {
    value = static_cast<number_t>(stored);
  } else if (print_warnings) {
    LOG_WARNING("Unable to find the platform path:%s Defaulting to:%d", path.text(), default_val);
  }

  if (value < min) {
    if (print_warnings) {
      LOG_WARNING(
          "The value for platform path:%s is smaller than the minimum value. Setting to minimum. Min:%d "
          "Val:%d Max:%d",
          path.text(), min, value, max);
    }
    value = min;
  } else if (value > max) {
    if (print_warnings) {
      LOG_WARNING(
          "The value for platform path:%s is larger than the maximum value. Setting to maximum. Min:%d "
          "Val:%d Max:%d",
          path.text(), min, value, max);
    }
    value = max;
  }
  LOG_TRACE("Platform config read. Path:%s val:%d", path.text(), value);
  return value;
}

}  // namespace
}  // namespace edid_composer

using edid_composer::path_t;
using edid_composer::read_number;

bool get_pc_str(const char *key, char *dst, u32 size, const char *default_val, bool print_warnings) {
  REPORTS_AS(get_pc_str);
  const path_t path(key);
  if (config_get_str(0, path.text(), dst, size) == 0) return true;
  if (print_warnings) {
    LOG_WARNING("Error trying to read \"%s\" from the platform config. Using:%s", path.text(), default_val);
  }
  // kept: no NUL is written after the default.
  for (u32 i = 0; i < size && default_val[i] != '\0'; ++i)
    dst[i] = default_val[i];
  return false;
}

u32 get_pc_uint(const char *key, u32 min, u32 max, u32 default_val, bool print_warnings) {
  REPORTS_AS(get_pc_uint);
  if (!(min <= default_val && default_val <= max)) {
    std::printf("Invalid values for %s: min:%u def:%u max:%u\n", key, min, default_val, max);
    std::fflush(stdout);
    assert(min <= default_val && default_val <= max);
  }
  return read_number<site>(key, min, max, default_val, print_warnings);
}

i32 get_pc_int(const char *key, i32 min, i32 max, i32 default_val, bool print_warnings) {
  REPORTS_AS(get_pc_int);
  if (!(min <= default_val && default_val <= max)) {
    std::printf("Invalid values for %s: min:%d def:%d max:%d\n", key, min, default_val, max);
    std::fflush(stdout);
    assert(min <= default_val && default_val <= max);
  }
  return read_number<site>(key, min, max, default_val, print_warnings);
}
