#include "current_tree.h"

#include <utility>

namespace edid_config_store {
namespace {

config_tree_t &instance() {
  static config_tree_t tree;
  return tree;
}

}  // namespace

const config_tree_t &current_tree() {
  return instance();
}

void replace_current_tree(config_tree_t &&tree) {
  instance() = std::move(tree);
}

}  // namespace edid_config_store
