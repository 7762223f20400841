#include "support/temporary_directory.h"

#include <gtest/gtest.h>
#include <stdlib.h>

#include <algorithm>
#include <fstream>
#include <iterator>
#include <stdexcept>

namespace host_test {

temporary_directory_t::temporary_directory_t() {
  std::string path = std::filesystem::temp_directory_path() / "edid_composer_test.XXXXXX";
  if (mkdtemp(path.data()) == nullptr) {
    throw std::runtime_error("cannot make " + path);
  }
  directory_ = path;
}

temporary_directory_t::~temporary_directory_t() {
  std::error_code ignored;
  std::filesystem::remove_all(directory_, ignored);
}

std::string temporary_directory_t::path(const std::string &name) const {
  return directory_ / name;
}

std::string temporary_directory_t::write(const std::string &name, const std::string &content) const {
  std::ofstream(path(name), std::ios::binary) << content;
  return path(name);
}

std::vector<std::string> temporary_directory_t::names() const {
  std::vector<std::string> names;
  for (const auto &entry : std::filesystem::directory_iterator(directory_)) {
    names.push_back(entry.path().filename());
  }
  std::sort(names.begin(), names.end());
  return names;
}

std::string content_of(const std::string &path) {
  std::ifstream file(path, std::ios::binary);
  EXPECT_TRUE(file.is_open()) << path;
  return {std::istreambuf_iterator<char>(file), {}};
}

}  // namespace host_test
