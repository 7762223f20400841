#include "cli/cli_fixture.h"

#include <cstdio>
#include <cstdlib>

namespace host_test {

std::string cli_program() {
  const char *const other = std::getenv("EDID_COMPOSER");
  return other == nullptr ? EDID_COMPOSER_PROGRAM : other;
}

process_result_t run_cli(const std::vector<std::string> &arguments, const std::string &input) {
  return process_t{cli_program(), arguments, input}.run();
}

std::string sample_sink(const std::string &name) {
  return std::string(SAMPLE_SINKS_DIRECTORY) + "/" + name + ".txt";
}

std::string sample_bytes(const std::string &name) {
  std::string bytes;
  std::string digits;
  bool in_comment = false;
  for (const char character : content_of(sample_sink(name))) {
    in_comment = character == '#' || (in_comment && character != '\n');
    if (in_comment || std::string(" \n").find(character) != std::string::npos) {
      continue;
    }
    digits += character;
    if (digits.size() == 2) {
      bytes += static_cast<char>(std::stoi(digits, nullptr, 16));
      digits.clear();
    }
  }
  return bytes;
}

std::string hex_of(const std::string &bytes, const std::string &separator) {
  std::string text;
  for (const char byte : bytes) {
    char digits[3];
    std::snprintf(digits, sizeof digits, "%02x", static_cast<unsigned>(static_cast<unsigned char>(byte)));
    text += (text.empty() ? "" : separator) + digits;
  }
  return text;
}

bool holds_diagnostics(const std::string &output) {
  for (const char *kind : {"() ERROR: ", "() WARNING: ", "() BUG: "}) {
    if (output.find(kind) != std::string::npos) {
      return true;
    }
  }
  return false;
}

std::string cli_fixture_t::composed(const std::vector<std::string> &arguments, const std::string &input) {
  const std::string file = directory_.path("composed.bin");
  std::vector<std::string> all{"compose", "-o", file};
  all.insert(all.end(), arguments.begin(), arguments.end());
  const process_result_t result = run_cli(all, input);
  EXPECT_EQ(result.status, 0) << result.error;
  EXPECT_EQ(result.error, "");
  output_ = result.output;
  return content_of(file);
}

void expect_bad_input(const process_result_t &result, const std::string &error_line) {
  EXPECT_EQ(result.status, 2);
  EXPECT_EQ(result.output, "");
  EXPECT_EQ(result.error, "edid-composer: " + error_line + "\n");
}

}  // namespace host_test
