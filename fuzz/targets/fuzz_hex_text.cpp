// Hexadecimal text of any kind: it is refused in one line that names its source, or read; and what was read reads the
// same when it is written plainly.
#include <cstring>
#include <string>
#include <vector>

#include "edid_input/hex_text.h"
#include "fuzz_target.h"
#include "io/bad_input.h"

namespace {

std::string plain_hex(const std::vector<u8> &bytes) {
  std::string text;
  for (const u8 byte : bytes) {
    char digits[4];
    std::snprintf(digits, sizeof digits, "%02x ", unsigned{byte});
    text += digits;
  }
  return text;
}

}  // namespace

int LLVMFuzzerTestOneInput(const u8 *data, std::size_t size) {
  try {
    const auto bytes = edid_cli::parse_hex_text({reinterpret_cast<const char *>(data), size}, "fuzz.txt");
    if (!bytes.empty()) FUZZ_REQUIRE(edid_cli::parse_hex_text(plain_hex(bytes), "plain.txt") == bytes);
  } catch (const edid_cli::bad_input_t &refusal) {
    FUZZ_REQUIRE(std::strncmp(refusal.what(), "fuzz.txt", 8) == 0);
    FUZZ_REQUIRE(std::strchr(refusal.what(), '\n') == nullptr);
  }
  return 0;
}
