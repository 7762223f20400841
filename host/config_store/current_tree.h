// The one tree of the process: the load operations replace it, the config_* operations read it.
#pragma once

#include "config_tree.h"

namespace edid_config_store {

/// The tree that was loaded last; null before any was.
extern const config_tree_t *g_loaded_tree;

const config_tree_t &empty_tree();
void replace_current_tree(config_tree_t &&tree);

inline const config_tree_t &current_tree() {
  return g_loaded_tree != nullptr ? *g_loaded_tree : empty_tree();
}

}  // namespace edid_config_store
