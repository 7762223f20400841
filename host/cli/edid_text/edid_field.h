// A named field of a decoded EDID, as texts to be compared.
#pragma once

#include <string>
#include <vector>

#include "edid_composer.h"

namespace edid_cli {

/// An EDID's records.
struct edid_records_t {
  const edid_t &edid;
  const hdmi2_t &hdmi2;
};

/// A field has one value, or as many as its list has entries; none where the data block that it is in is not there.
struct edid_field_t {
  const char *name;
  std::vector<std::string> (*values)(const edid_records_t &records);
};

}  // namespace edid_cli
