// A directory of a test's own, gone when the test is.
#pragma once

#include <filesystem>
#include <string>
#include <vector>

namespace host_test {

class temporary_directory_t {
 public:
  temporary_directory_t();
  ~temporary_directory_t();
  temporary_directory_t(const temporary_directory_t &) = delete;
  temporary_directory_t &operator=(const temporary_directory_t &) = delete;

  /// The path of a name in it.
  std::string path(const std::string &name) const;
  /// Makes a file in it and returns its path.
  std::string write(const std::string &name, const std::string &content) const;
  /// The names of everything in it, sorted.
  std::vector<std::string> names() const;

 private:
  std::filesystem::path directory_;
};

/// The whole content of a file; fails the test when it cannot be read.
std::string content_of(const std::string &path);

}  // namespace host_test
