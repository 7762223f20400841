// A node of the configuration that is loaded.
#pragma once

#include <optional>
#include <string>
#include <vector>

#include "edid_composer.h"

namespace edid_cli {

struct position_t {
  unsigned line = 0;  ///< 0: nowhere in the file.
  unsigned column = 0;
};

class configuration_node_t {
 public:
  /// None when there is nothing at a path.
  static std::optional<configuration_node_t> find(const std::string &path);

  std::string name() const;
  position_t position() const;
  std::vector<configuration_node_t> children() const;
  std::optional<i32> integer() const;
  std::optional<std::string> text() const;
  /// Neither an integer nor a text: a table or a list, perhaps an empty one.
  bool is_branch() const { return !integer() && !text(); }
  /// "an integer", "a text" or "a table or list".
  const char *kind() const;

 private:
  explicit configuration_node_t(u32 handle) : handle_(handle) {}

  u32 handle_;
};

}  // namespace edid_cli
