// An in-memory configuration tree behind the eight config_* operations.
#pragma once

#include <cstdint>
#include <string>
#include <vector>

namespace test_support {

/// The tree that the config_* operations read is the most recently constructed one that still lives; without one,
/// nothing is found. Keys are relative to the library's domain, "platform.software.drivers.vorex.edid.".
class configuration_tree_t {
 public:
  configuration_tree_t();
  ~configuration_tree_t();
  configuration_tree_t(const configuration_tree_t &) = delete;
  configuration_tree_t &operator=(const configuration_tree_t &) = delete;

  /// Sets the value of a (possibly dotted) key.
  void set(const std::string &key, std::int64_t value);
  void set(const std::string &key, const std::string &value);

  /// Appends an entry to the list @p key. Without a name it is called "entry_<position>".
  void add(const std::string &key, std::int64_t value, const std::string &name = "");
  void add(const std::string &key, const std::string &value, const std::string &name = "");
  /// Appends an entry that holds neither an integer nor a string.
  void add_empty(const std::string &key, const std::string &name = "");

  /// Makes the node of a list without entries.
  void add_list(const std::string &key);

  void remove(const std::string &key);
  void clear();

  /// Gives every scalar key a value within its limits that is not the default, four video lists, 4Kx2K lists, timings and
  /// audio entries: a configuration whose reading prints nothing but traces.
  void fill_completely();

  /// How often the library called each config_* operation while this tree was current.
  int lookups() const;

 private:
  struct node_t;
  struct state_t;
  state_t *state_;
};

}  // namespace test_support
