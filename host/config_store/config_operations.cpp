// The operations that libedid_composer reads its configuration with.
#include <algorithm>
#include <cstring>
#include <optional>
#include <string_view>

#include "current_tree.h"
#include "edid_composer.h"

namespace edid_config_store {
namespace {

/// Every status but success_status means that nothing was delivered; the library tells only not_found_status from the
/// others.
enum status_t : int { success_status = 0, wrong_kind_status = 1, not_found_status = 2 };

std::optional<node_handle_t> find(u32 root, const char *path) {
  if (root != root_handle || path == nullptr) {
    return std::nullopt;
  }
  return current_tree().find(path);
}

template <typename value_t>
int deliver(const std::optional<value_t> &value, value_t *target, int status_if_absent) {
  if (!value || target == nullptr) {
    return status_if_absent;
  }
  *target = *value;
  return success_status;
}

/// Copies what fits with its NUL; a buffer of no bytes stays untouched.
int deliver(const std::optional<std::string_view> &text, char *buffer, u32 size, int status_if_absent) {
  if (!text || (buffer == nullptr && size > 0)) {
    return status_if_absent;
  }
  if (size > 0) {
    const std::size_t length = std::min<std::size_t>(text->size(), size - 1);
    std::memcpy(buffer, text->data(), length);
    buffer[length] = '\0';
  }
  return success_status;
}

}  // namespace
}  // namespace edid_config_store

using namespace edid_config_store;

int config_get_int(u32 root, const char *path, i32 *value) {
  const auto node = find(root, path);
  return node ? config_node_get_int(*node, value) : not_found_status;
}

int config_get_str(u32 root, const char *path, char *buffer, u32 size) {
  const auto node = find(root, path);
  return node ? config_node_get_str(*node, buffer, size) : not_found_status;
}

int config_node_find(u32 root, const char *path, u32 *node) {
  return deliver(find(root, path), node, not_found_status);
}

int config_node_first_child(u32 node, u32 *child) {
  return deliver(current_tree().first_child(node), child, not_found_status);
}

int config_node_next_sibling(u32 node, u32 *sibling) {
  return deliver(current_tree().next_sibling(node), sibling, not_found_status);
}

int config_node_get_name(u32 node, char *buffer, u32 size) {
  return deliver(current_tree().name(node), buffer, size, not_found_status);
}

int config_node_get_int(u32 node, i32 *value) {
  return deliver(current_tree().integer(node), value, wrong_kind_status);
}

int config_node_get_str(u32 node, char *buffer, u32 size) {
  return deliver(current_tree().text(node), buffer, size, wrong_kind_status);
}
