#include "config_store/store_fixture.h"

namespace host_test {
namespace {

constexpr u32 text_size = 256;

std::string name_of(u32 node) {
  char name[text_size] = "";
  EXPECT_EQ(config_node_get_name(node, name, text_size), 0);
  return name;
}

}  // namespace

bool load(const std::string &document) {
  return config_store_load_text(document.data(), document.size(), document_name);
}

std::string refusal_of(const std::string &document) {
  EXPECT_FALSE(load(document)) << document;
  return config_store_error();
}

std::optional<i32> integer_at(const std::string &path) {
  i32 value = 0;
  if (config_get_int(0, path.c_str(), &value) != 0) {
    return std::nullopt;
  }
  return value;
}

std::optional<std::string> text_at(const std::string &path) {
  char text[text_size] = "";
  if (config_get_str(0, path.c_str(), text, text_size) != 0) {
    return std::nullopt;
  }
  return text;
}

std::vector<std::string> children_of(const std::string &path) {
  std::vector<std::string> names;
  u32 node = 0;
  u32 child = 0;
  if (config_node_find(0, path.c_str(), &node) == 2 || config_node_first_child(node, &child) == 2) {
    return names;
  }
  do {
    names.push_back(name_of(child));
  } while (config_node_next_sibling(child, &child) == 0);
  return names;
}

}  // namespace host_test
