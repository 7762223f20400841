#include "current_tree.h"

#include <utility>

namespace edid_config_store {

constinit const config_tree_t *g_loaded_tree = nullptr;

const config_tree_t &empty_tree() {
  static const config_tree_t tree;
  return tree;
}

void replace_current_tree(config_tree_t &&tree) {
  static config_tree_t loaded;
  loaded = std::move(tree);
  g_loaded_tree = &loaded;
}

}  // namespace edid_config_store
