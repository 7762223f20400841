#include "utility/configuration.h"

// The limits of a getter are checked in every build type.
#undef NDEBUG
#include <cassert>
#include <cstdio>
#include <cstring>

#include "diagnostics.h"

namespace edid_composer {
namespace {

/// The full path of a key, cut to 255 characters.
class path_t {
 public:
  explicit path_t(const char *key) {
    constexpr std::size_t domain_length = sizeof CONFIGURATION_DOMAIN - 1;
    if (key == nullptr) key = "(null)";  // as printf has it
    const std::size_t length = strnlen(key, sizeof text_ - domain_length - 1);
    std::memcpy(text_, CONFIGURATION_DOMAIN, domain_length);
    std::memcpy(text_ + domain_length, key, length);
    text_[domain_length + length] = '\0';
  }
  const char *text() const { return text_; }

 private:
  char text_[256];
};

/// What both number getters do once the limits are known to be consistent. An unsigned number is compared as such and
/// printed as a signed one.
template <const site_t &site, typename number_t>
configuration_outcome_t read_number(const char *path, number_t min, number_t max, number_t default_val,
                                    bool print_warnings) {
  configuration_outcome_t outcome;
  auto value = default_val;
  if (config_get_int(0, path, &outcome.found) == 0) {
    value = static_cast<number_t>(outcome.found);
  } else {
    outcome = {.reason = CONFIGURATION_ABSENT};
    if (print_warnings) LOG_WARNING("Unable to find the platform path:%s Defaulting to:%d", path, default_val);
  }

  if (value < min) {
    outcome.reason = CONFIGURATION_TOO_SMALL;
    if (print_warnings) {
      LOG_WARNING(
          "The value for platform path:%s is smaller than the minimum value. Setting to minimum. Min:%d "
          "Val:%d Max:%d",
          path, min, value, max);
    }
    value = min;
  } else if (value > max) {
    outcome.reason = CONFIGURATION_TOO_LARGE;
    if (print_warnings) {
      LOG_WARNING(
          "The value for platform path:%s is larger than the maximum value. Setting to maximum. Min:%d "
          "Val:%d Max:%d",
          path, min, value, max);
    }
    value = max;
  }
  LOG_TRACE("Platform config read. Path:%s val:%d", path, value);
  outcome.used = static_cast<i32>(value);
  return outcome;
}

// The sites of the getters, in whose names their rules report.
namespace integer {
REPORTS_AS(get_pc_int);
}
namespace unsigned_integer {
REPORTS_AS(get_pc_uint);
}

}  // namespace

configuration_outcome_t read_configuration_int(const char *path, i32 min, i32 max, i32 default_val,
                                               bool print_warnings) {
  return read_number<integer::site>(path, min, max, default_val, print_warnings);
}

configuration_outcome_t read_configuration_uint(const char *path, u32 min, u32 max, u32 default_val,
                                                bool print_warnings) {
  return read_number<unsigned_integer::site>(path, min, max, default_val, print_warnings);
}

configuration_outcome_t read_configuration_str(const char *path, char *dst, u32 size, const char *default_val,
                                               bool print_warnings) {
  REPORTS_AS(get_pc_str);
  if (config_get_str(0, path, dst, size) == 0) return {};
  if (print_warnings) {
    LOG_WARNING("Error trying to read \"%s\" from the platform config. Using:%s", path, default_val);
  }
  // kept: no NUL is written after the default.
  for (u32 i = 0; i < size && default_val[i] != '\0'; ++i)
    dst[i] = default_val[i];
  return {.reason = CONFIGURATION_ABSENT};
}

}  // namespace edid_composer

using namespace edid_composer;  // NOLINT(google-build-using-namespace): the operations below are the namespace's API

bool get_pc_str(const char *key, char *dst, u32 size, const char *default_val, bool print_warnings) {
  const path_t path(key);
  return read_configuration_str(path.text(), dst, size, default_val, print_warnings).reason == CONFIGURATION_TAKEN;
}

u32 get_pc_uint(const char *key, u32 min, u32 max, u32 default_val, bool print_warnings) {
  if (!(min <= default_val && default_val <= max)) {
    std::printf("Invalid values for %s: min:%u def:%u max:%u\n", key, min, default_val, max);
    std::fflush(stdout);
    assert(min <= default_val && default_val <= max);
  }
  const path_t path(key);
  return static_cast<u32>(read_configuration_uint(path.text(), min, max, default_val, print_warnings).used);
}

i32 get_pc_int(const char *key, i32 min, i32 max, i32 default_val, bool print_warnings) {
  if (!(min <= default_val && default_val <= max)) {
    std::printf("Invalid values for %s: min:%d def:%d max:%d\n", key, min, default_val, max);
    std::fflush(stdout);
    assert(min <= default_val && default_val <= max);
  }
  const path_t path(key);
  return read_configuration_int(path.text(), min, max, default_val, print_warnings).used;
}
