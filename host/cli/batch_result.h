// What came of one of several compositions, on its way from the process that did it.
#pragma once

#include <string>

namespace edid_cli {

struct batch_result_t {
  std::string failure;  ///< Why there is no EDID; empty when there is one.
  std::string output;   ///< What the library printed: all of it with tracing on, else what tells of something wrong.
};

std::string packed(const batch_result_t &result);
batch_result_t unpacked(const std::string &text);

}  // namespace edid_cli
