#include "edid_composer/hdmi2/platform_values.h"

#include <algorithm>
#include <cstddef>
#include <cstring>
#include <iterator>

#include "diagnostics.h"
#include "edid_composer/hdmi2/codec/extended_vics.h"
#include "edid_composer/platform/hdmi2_keys.h"
#include "edid_composer/platform/list_reading.h"

namespace edid_composer {
namespace {

REPORTS_AS(read_hdmi2_values);

using vics_t = i32[HDMI2_MOST_LISTED_VICS];

/// The number as it counts, within its limits.
configuration_outcome_t limited(const platform_key_t &row, i32 number) {
  const configuration_key_t &key = row.key;
  const auto minimum = static_cast<i32>(key.minimum);
  const auto maximum = static_cast<i32>(key.maximum);
  configuration_outcome_t outcome{.found = number, .used = std::clamp(number, minimum, maximum)};
  if (outcome.used != number) {
    const bool is_small = number < minimum;
    outcome.reason = is_small ? CONFIGURATION_TOO_SMALL : CONFIGURATION_TOO_LARGE;
    LOG_WARNING("The value of %s is %s. Setting to %s. Min:%d Val:%d Max:%d", key.name,
                is_small ? "smaller than the minimum value" : "larger than the maximum value",
                is_small ? "minimum" : "maximum", minimum, number, maximum);
  }
  if (row.settle != nullptr) row.settle(&outcome);
  return outcome;
}

configuration_outcome_t number_of(const platform_key_t &row) {
  const configuration_key_t &key = row.key;
  configuration_outcome_t outcome{.reason = CONFIGURATION_ABSENT, .used = static_cast<i32>(key.default_number)};
  u32 node = 0;
  i32 number = 0;
  if (config_node_find(0, key.path, &node) != not_found) {
    if (config_get_int(0, key.path, &number) == 0) {
      outcome = limited(row, number);
    } else {
      LOG_WARNING("The value for platform path:%s is not an integer. Defaulting to:%d", key.path, outcome.used);
    }
  }
  return outcome;
}

/// The VICs of a list, as they are taken.
struct vic_list_t {
  i32 *vics;
  u32 count = 0;

  configuration_outcome_t take(const configuration_key_t &key, i32 vic, const char *node_name) {
    if (timing_of_extended_vic(static_cast<u32>(vic)) == nullptr) {
      LOG_WARNING("%s holds a VIC that is not supported. Expected:65-127,193-219 Received:%d Node:%s", key.name, vic,
                  node_name);
      return {.reason = CONFIGURATION_OUT_OF_RANGE, .found = vic};
    }
    if (count == key.most_entries) {
      LOG_WARNING("%s holds more VICs than are supported. Ignoring VIC:%d Max:%u Node:%s", key.name, vic,
                  key.most_entries, node_name);
      return {.reason = CONFIGURATION_NO_ROOM, .found = vic};
    }
    vics[count++] = vic;
    return {.found = vic, .used = vic};
  }
};

/// True for a node that holds a number or a text, which a list's doesn't.
bool holds_value(u32 node) {
  i32 number = 0;
  char text[entry_text_size] = "";
  return config_node_get_int(node, &number) == 0 || config_node_get_str(node, text, sizeof text) == 0;
}

void read_vics(const platform_key_t &row, hdmi2_values_t *values, const configuration_readings_t &readings) {
  const configuration_key_t &key = row.key;
  u32 node = 0;
  const bool is_there = config_node_find(0, key.path, &node) != not_found;
  if (!is_there || holds_value(node)) {
    if (is_there) LOG_WARNING("The value for platform path:%s is not a list. Defaulting to an empty one.", key.path);
    readings.note_list(key, CONFIGURATION_ABSENT, 0, 0);
    return;
  }
  vic_list_t list{*member_of<vics_t>(values, row)};
  read_list(key, readings,
            [&](const configuration_entry_t &entry) { return list.take(key, entry.number, entry.node_name); });
}

void read_number(const platform_key_t &row, hdmi2_values_t *values, const configuration_readings_t &readings) {
  const configuration_outcome_t outcome = number_of(row);
  LOG_TRACE("Platform config read. Path:%s val:%d", row.key.path, outcome.used);
  *member_of<i32>(values, row) = outcome.used;
  readings.note(row.key, outcome);
}

/// The caller's entries up to its first 0.
void take_vics(const platform_key_t &row, const hdmi2_values_t &known, hdmi2_values_t *values) {
  vic_list_t list{*member_of<vics_t>(values, row)};
  for (const i32 vic : *member_of<vics_t>(&known, row)) {
    if (vic == 0) break;
    static_cast<void>(list.take(row.key, vic, ""));
  }
}

/// Sets all members but the size.
void set_defaults(hdmi2_values_t *values) {
  for (const platform_key_t &row : hdmi2_keys()) {
    if (row.key.kind == CONFIGURATION_EXTENDED_VICS) {
      std::memset(member_of<vics_t>(values, row), 0, sizeof(vics_t));
    } else {
      *member_of<i32>(values, row) = static_cast<i32>(row.key.default_number);
    }
  }
}

const platform_key_t &key_of_enable() {
  return hdmi2_keys().front();
}

std::span<const platform_key_t> other_keys() {
  return hdmi2_keys().subspan(1);
}

/// With empty lists.
hdmi2_values_t enabled_values() {
  hdmi2_values_t values{};
  values.size = sizeof values;
  values.enable = 1;
  return values;
}

constexpr u32 size_with_enable = offsetof(hdmi2_values_t, enable) + sizeof(hdmi2_values_t::enable);

}  // namespace

// Not a word where HDMI 2 is off.
bool is_hdmi2_configured(const configuration_readings_t &readings) {
  const configuration_outcome_t outcome = number_of(key_of_enable());
  readings.note(key_of_enable().key, outcome);
  return outcome.used != 0;
}

void read_hdmi2_values(hdmi2_values_t *values, const configuration_readings_t &readings) {
  *values = enabled_values();
  for (const platform_key_t &row : other_keys()) {
    if (row.key.kind == CONFIGURATION_EXTENDED_VICS) {
      read_vics(row, values, readings);
    } else {
      read_number(row, values, readings);
    }
  }
}

bool has_enable(const hdmi2_values_t &given) {
  if (given.size >= size_with_enable) return true;
  LOG_ERROR("The size of the hdmi2 is too small. Expected at least:%u Received:%u", size_with_enable, given.size);
  return false;
}

bool is_hdmi2_enabled(const hdmi2_values_t &given) {
  return limited(key_of_enable(), given.enable).used != 0;
}

void take_hdmi2_values(const hdmi2_values_t &given, hdmi2_values_t *values) {
  hdmi2_values_t known{};
  set_defaults(&known);
  // Half a member says nothing.
  std::memcpy(&known, &given, std::min<std::size_t>(given.size, sizeof known) / sizeof(i32) * sizeof(i32));
  *values = enabled_values();
  for (const platform_key_t &row : other_keys()) {
    if (row.key.kind == CONFIGURATION_EXTENDED_VICS) {
      take_vics(row, known, values);
    } else {
      *member_of<i32>(values, row) = limited(row, *member_of<i32>(&known, row)).used;
    }
  }
}

}  // namespace edid_composer

using namespace edid_composer;  // NOLINT(google-build-using-namespace): the operation below is the namespace's API

bool hdmi2_values_init(hdmi2_values_t *values) {
  REPORTS_AS(hdmi2_values_init);
  if (values == nullptr) {
    LOG_ERROR("\"values\" parameter is NULL. values:%s", address(values).text);
    return false;
  }
  if (values->size < sizeof *values) {
    LOG_ERROR("The size of the values is too small. Expected at least:%zu Received:%u", sizeof *values, values->size);
    return false;
  }
  set_defaults(values);
  return true;
}
