#include "platform/configuration_node.h"

#include "config_store.h"

namespace edid_cli {
namespace {

constexpr u32 root = 0;
/// A path has at most 255 characters.
constexpr u32 name_size = 256;
/// More than any text that the library reads, and enough to show that one is too long.
constexpr u32 text_size = 4096;

}  // namespace

std::optional<configuration_node_t> configuration_node_t::find(const std::string &path) {
  u32 handle = 0;
  if (config_node_find(root, path.c_str(), &handle) != 0) {
    return std::nullopt;
  }
  return configuration_node_t(handle);
}

std::string configuration_node_t::name() const {
  char name[name_size] = "";
  config_node_get_name(handle_, name, sizeof name);
  return name;
}

position_t configuration_node_t::position() const {
  position_t position;
  config_store_node_position(handle_, &position.line, &position.column);
  return position;
}

std::vector<configuration_node_t> configuration_node_t::children() const {
  std::vector<configuration_node_t> children;
  u32 handle = 0;
  int status = config_node_first_child(handle_, &handle);
  while (status == 0) {
    children.push_back(configuration_node_t(handle));
    status = config_node_next_sibling(handle, &handle);
  }
  return children;
}

std::optional<i32> configuration_node_t::integer() const {
  i32 value = 0;
  return config_node_get_int(handle_, &value) == 0 ? std::optional(value) : std::nullopt;
}

std::optional<std::string> configuration_node_t::text() const {
  char text[text_size] = "";
  return config_node_get_str(handle_, text, sizeof text) == 0 ? std::optional<std::string>(text) : std::nullopt;
}

const char *configuration_node_t::kind() const {
  return integer() ? "an integer" : text() ? "a text" : "a table or list";
}

}  // namespace edid_cli
