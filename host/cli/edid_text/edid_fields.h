// The named fields of a decoded EDID, as texts to be compared.
#pragma once

#include <span>
#include <string>
#include <vector>

#include "edid_composer.h"

namespace edid_cli {

/// A field has one value, or as many as its list has entries.
struct edid_field_t {
  const char *name;
  std::vector<std::string> (*values)(const edid_t &edid);
};

/// All of them, in the order of an EDID's bytes.
std::span<const edid_field_t> edid_fields();

}  // namespace edid_cli
