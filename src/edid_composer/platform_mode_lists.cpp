#include "edid_composer/platform_mode_lists.h"

#include <iterator>

#include "diagnostics.h"
#include "utility/configuration.h"

namespace edid_composer {
namespace {

constexpr int not_found = 2;
constexpr u32 node_name_size = 256;

/// Hands one entry of a list to its parser.
void parse_entry(const site_t &site, u32 node, const char *list_name, bool is_int, char (&value)[list_value_size],
                 void *context, platform_list_callback callback) {
  char node_name[node_name_size] = "";
  config_node_get_name(node, node_name, sizeof node_name);
  // Of lists of texts the integer is always -1.
  i32 int_value = -1;
  if (is_int) {
    if (config_node_get_int(node, &int_value) != 0) {
      LOG_ERROR_AS(site, "Invalid platform configuration entry. Expected an integer. Entry name:%s", node_name);
      return;
    }
  } else if (config_node_get_str(node, value, list_value_size - 1) != 0) {
    LOG_ERROR_AS(site, "Invalid platform configuration entry. Expected a string. Entry name:%s\n", node_name);
    return;
  }
  callback(node_name, list_name, int_value, value, list_value_size, context);
}

}  // namespace

bool _get_generic_platform_list(const char *list_name, bool is_int, void *context, platform_list_callback callback) {
  if (list_name == nullptr || *list_name == '\0') {
    LOG_BUG("Timing List name is NULL.");
    return true;
  }
  if (callback == nullptr) {
    LOG_BUG("Callback function pointer is NULL. list_name:%s", list_name);
    return true;
  }
  const configuration_path_t<128> path(list_name);
  u32 list = 0;
  if (config_node_find(0, path.text(), &list) == not_found) {
    LOG_ERROR("Unabled to find the platform node:%s.\n", path.text());
    return true;
  }
  print_platform_node(list, "\tRoot Node");
  u32 node = 0;
  if (config_node_first_child(list, &node) == not_found) return true;

  // Cleared once: behind the NUL of a text, what is left of a longer one before it can still be read.
  char value[list_value_size] = "";
  print_platform_node(node, "\tFirst Child Node");
  u32 next = node;
  do {
    node = next;
    print_platform_node(node, "\tNext Node");
    parse_entry(HERE, node, list_name, is_int, value, context, callback);
  } while (config_node_next_sibling(node, &next) == 0);
  return true;
}

bool _get_platform_list(u32 type, ll_list_t *list) {
  struct video_list_t {
    u32 rate;
    bool priority;
    char name[24];
  };
  constexpr video_list_t video_lists[] = {
      {50, true, "50_hz_priority_list"},
      {60, true, "60_hz_priority_list"},
      {50, false, "50_hz_addition_list"},
      {60, false, "60_hz_addition_list"},
  };
  if (type >= std::size(video_lists)) {
    LOG_ERROR("\"type\" parameter is an invalid value. type:%d range:(%d-%d)", type, 0,
              static_cast<int>(std::size(video_lists)) - 1);
    return false;
  }
  const video_list_t &row = video_lists[type];
  if (row.priority) {
    LOG_TRACE("Reading %dHz priority list from platform config.", row.rate);
  } else {
    LOG_TRACE("Reading %dHz additional list from platform config.", row.rate);
  }
  list_context_t context{list};
  if (!_get_generic_platform_list(row.name, false, &context, _get_vic_list_callback)) {
    LOG_WARNING("Failed reading platform list for domain:%s", row.name);
    return false;
  }
  if (list != nullptr && ll_size(list) == 0) {
    LOG_ERROR(
        "A mode list (%d) is empty. Please verify that all of the video mode lists are properly populated with 3D mode "
        "formated strings.\n",
        type);
    return false;
  }
  return true;
}

void _get_4k_x_2k_modes(const char *list_name, i32 *modes) {
  modes_4k_x_2k_context_t context{.modes = modes, .count = 0};
  _get_generic_platform_list(list_name, true, &context, _get_4k_x_2k_mode_callback);
}

void _get_est_timing_list(const char *list_name, u32 *mask) {
  _get_generic_platform_list(list_name, true, mask, _get_est_timing_callback);
}

void _get_std_timing_list(ll_list_t *list) {
  list_context_t context{list};
  _get_generic_platform_list("standard_timings", false, &context, _get_std_timing_callback);
}

}  // namespace edid_composer

void print_platform_node(u32 node, const char *label) {
  if (!debug_enabled()) return;
  char name[edid_composer::node_name_size] = "";
  if (config_node_get_name(node, name, sizeof name) == 0) {
    LOG_TRACE("%s:Name of node is:%s", label, name);
  } else {
    LOG_TRACE("%s:Failed trying to get name", label);
  }
}
