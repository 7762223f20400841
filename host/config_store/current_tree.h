// The one tree of the process: the load operations replace it, the config_* operations read it.
#pragma once

#include "config_tree.h"

namespace edid_config_store {

const config_tree_t &current_tree();
void replace_current_tree(config_tree_t &&tree);

}  // namespace edid_config_store
