// What is composed, and where it goes.
#pragma once

#include <string>

#include "composition/composition.h"
#include "edid_text/edid_output.h"

namespace edid_cli {

struct compose_options_t {
  composition_options_t composition;
  std::string output;  ///< A file or standard_stream ("-"); a folder or a pattern where several are composed.
  edid_format_t format = edid_format_t::raw;
  u32 jobs = 0;  ///< 0: as many as the machine has processors.
  bool log = false;
  bool strict = false;  ///< No EDID from a sink that is not read to its end, and none that a source cannot use.
};

/// Whether a composition has to be observed.
decisions_t decisions_of(const compose_options_t &options);

/// Why there is no EDID, or none that may be written; empty when there is one.
std::string failure_of(const composition_t &composition, const compose_options_t &options);

}  // namespace edid_cli
