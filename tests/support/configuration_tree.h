// An in-memory configuration tree behind the eight config_* operations.
#pragma once

#include <cstdint>
#include <memory>
#include <string>
#include <vector>

#include "edid_composer.h"

namespace test_support {

enum class config_operation_t {
  get_int,
  get_str,
  node_find,
  node_first_child,
  node_next_sibling,
  node_get_name,
  node_get_int,
  node_get_str,
};

/// One call of a config_* operation by the library.
struct config_call_t {
  config_operation_t operation;
  u32 handle;        ///< The root or node it was given.
  std::string path;  ///< Of the three operations that take one.
  u32 size;          ///< Of the buffer, for the three operations that take one.
};

/// The tree that the config_* operations read is the most recently constructed one that still lives; without one,
/// nothing is found. Keys are relative to the library's domain, "platform.software.drivers.vorex.edid.".
class configuration_tree_t {
 public:
  configuration_tree_t();
  ~configuration_tree_t();
  configuration_tree_t(const configuration_tree_t &) = delete;
  configuration_tree_t &operator=(const configuration_tree_t &) = delete;

  /// Sets the value of a (possibly dotted) key. Of a number the low 32 bits are kept.
  void set(const std::string &key, std::int64_t value);
  void set(const std::string &key, const std::string &value);

  /// Appends an entry to the list @p key. Without a name it is called "entry_<position>", counted from 0.
  void add(const std::string &key, std::int64_t value, const std::string &name = "");
  void add(const std::string &key, const std::string &value, const std::string &name = "");
  /// Appends an entry that holds neither an integer nor a string.
  void add_empty(const std::string &key, const std::string &name = "");

  /// Makes the node of a list without entries.
  void add_list(const std::string &key);

  void remove(const std::string &key);
  void clear();

  /// Gives every scalar key a value within its limits that is not the default, four video lists, 4Kx2K lists, timings
  /// and audio entries: a configuration whose reading prints nothing but traces.
  void fill_completely();

  /// Makes an operation do its work and answer @p status all the same; for node_get_name etc. a failure as the contract
  /// allows it, for node_find and node_first_child a status other than 2.
  void answer(config_operation_t operation, int status);

  /// How often the library called any config_* operation while this tree was current.
  int lookups() const;

  /// Those calls, in order.
  std::vector<config_call_t> calls() const;

  /// Forgets the calls for a path, and returns how many there were. Of the current tree; without one there are none.
  static int forget_calls(const std::string &path);
  /// Whether there is a current tree.
  static bool is_there();

  struct state_t;

 private:
  std::unique_ptr<state_t> state_;
};

}  // namespace test_support
