// Turns a TOML document into a configuration tree.
#pragma once

#include <string>
#include <string_view>
#include <variant>

#include "config_tree.h"

namespace edid_config_store {

/// Why a document was refused, in one line that begins with its name.
struct refusal_t {
  std::string message;
};

/// Reads a whole document or refuses it whole. @p name is what the refusal calls it.
std::variant<config_tree_t, refusal_t> read_toml(std::string_view document, std::string_view name);

}  // namespace edid_config_store
