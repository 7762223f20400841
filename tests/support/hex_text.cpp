#include "support/hex_text.h"

#include <array>
#include <cstdio>
#include <fstream>
#include <sstream>
#include <stdexcept>

namespace test_support {

std::vector<u8> bytes_of_hex_text(const std::string &text) {
  std::vector<u8> bytes;
  std::istringstream lines(text);
  for (std::string line; std::getline(lines, line);) {
    std::istringstream words(line.substr(0, line.find('#')));
    for (std::string word; words >> word;) {
      if (word.size() != 2 || word.find_first_not_of("0123456789ABCDEFabcdef") != std::string::npos) {
        throw std::invalid_argument("not a byte: " + word);
      }
      bytes.push_back(static_cast<u8>(std::stoul(word, nullptr, 16)));
    }
  }
  return bytes;
}

std::vector<u8> bytes_of_hex_file(const std::string &path) {
  std::ifstream file(path);
  std::ostringstream text;
  text << file.rdbuf();
  if (!file) throw std::runtime_error("cannot read " + path);
  return bytes_of_hex_text(text.str());
}

std::string hex_lines(const std::vector<u8> &bytes) {
  std::string text;
  std::array<char, 24> digits{};
  for (std::size_t i = 0; i < bytes.size(); ++i) {
    if (i % 16 == 0) {
      std::snprintf(digits.data(), digits.size(), "%s%03zu:", i == 0 ? "" : "\n", i);
      text += digits.data();
    }
    std::snprintf(digits.data(), digits.size(), " %02X", bytes[i]);
    text += digits.data();
  }
  return text + "\n";
}

}  // namespace test_support
