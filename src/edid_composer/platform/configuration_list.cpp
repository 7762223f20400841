#include "edid_composer/platform/configuration_list.h"

#include "diagnostics.h"

namespace edid_composer {
namespace {

REPORTS_AS(_get_generic_platform_list);

constexpr bool holds_numbers(const configuration_key_t &key) {
  return key.kind == CONFIGURATION_HDMI_VICS || key.kind == CONFIGURATION_TIMING_BITS ||
         key.kind == CONFIGURATION_EXTENDED_VICS;
}

}  // namespace

configuration_list_t _get_generic_platform_list(const configuration_key_t &key) {
  return configuration_list_t(key);
}

configuration_list_t::configuration_list_t(const configuration_key_t &key) {
  entry_.key = &key;
  find(key.path);
  if (ended_) return;
  entry_.index = 0;
  // kept: cleared once for the list, so that after the NUL of an entry there can be the end of a longer one before it.
  for (char &character : entry_.text)
    character = '\0';
  print_platform_node(node_, "\tFirst Child Node");
  read_entry();
}

/// Moves to the first node of the list.
void configuration_list_t::find(const char *path) {
  u32 list = 0;
  if (config_node_find(0, path, &list) == not_found) {
    LOG_ERROR("Unabled to find the platform node:%s.\n", path);
    return;
  }
  is_there_ = true;
  print_platform_node(list, "\tRoot Node");
  ended_ = config_node_first_child(list, &node_) == not_found;
}

void configuration_list_t::move_to_next() {
  u32 next = node_;
  ended_ = config_node_next_sibling(node_, &next) != 0;
  node_ = next;
  ++entry_.index;
  if (!ended_) read_entry();
}

/// Reads the node; one of another kind is reported.
void configuration_list_t::read_entry() {
  print_platform_node(node_, "\tNext Node");
  entry_.node_name[0] = '\0';
  config_node_get_name(node_, entry_.node_name, sizeof entry_.node_name);
  entry_.number = -1;
  entry_.kind = entry_kind_t::other;
  if (holds_numbers(*entry_.key)) {
    if (config_node_get_int(node_, &entry_.number) == 0) {
      entry_.kind = entry_kind_t::number;
    } else {
      LOG_ERROR("Invalid platform configuration entry. Expected an integer. Entry name:%s", entry_.node_name);
    }
  } else {
    // The last byte stays 0, whatever the host writes.
    if (config_node_get_str(node_, entry_.text, sizeof entry_.text - 1) == 0) {
      entry_.kind = entry_kind_t::text;
    } else {
      LOG_ERROR("Invalid platform configuration entry. Expected a string. Entry name:%s\n", entry_.node_name);
    }
  }
}

}  // namespace edid_composer

void print_platform_node(u32 node, const char *label) {
  REPORTS_AS(print_platform_node);
  if (!edid_composer::is_tracing()) return;
  char name[sizeof edid_composer::configuration_entry_t::node_name] = "";
  if (config_node_get_name(node, name, sizeof name) == 0) {
    LOG_TRACE("%s:Name of node is:%s", label, name);
  } else {
    LOG_TRACE("%s:Failed trying to get name", label);
  }
}
