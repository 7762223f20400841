#include "batch_result.h"

namespace edid_cli {

// Neither a failure's reason nor what the library prints of a text holds a NUL, so it can stand between them.
std::string packed(const batch_result_t &result) {
  return result.failure + '\0' + result.output;
}

batch_result_t unpacked(const std::string &text) {
  const std::size_t end = text.find('\0');
  if (end == std::string::npos) {
    return {text, ""};
  }
  return {text.substr(0, end), text.substr(end + 1)};
}

}  // namespace edid_cli
