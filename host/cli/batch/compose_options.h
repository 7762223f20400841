// What is composed, and where it goes.
#pragma once

#include <string>

#include "composition/composition_options.h"
#include "edid_text/edid_output.h"

namespace edid_cli {

struct compose_options_t {
  composition_options_t composition;
  std::string output;  ///< A file or standard_stream ("-"); a folder or a pattern where several are composed.
  edid_format_t format = edid_format_t::raw;
  u32 jobs = 0;  ///< 0: as many as the machine has processors.
  bool log = false;
};

}  // namespace edid_cli
