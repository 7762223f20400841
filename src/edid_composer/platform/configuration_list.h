// The entries of a list of the platform configuration, one after the other:
//
//   for (const configuration_entry_t &entry : _get_generic_platform_list(key)) ...
#pragma once

#include "edid_composer.h"

namespace edid_composer {

/// What the host's node operations return where nothing is found; any other status counts as found.
inline constexpr int not_found = 2;

/// Size of the buffer that holds the text of an entry.
inline constexpr u32 entry_text_size = 30;

enum class entry_kind_t { text, number, other };

struct configuration_entry_t {
  const configuration_key_t *key;  ///< Of the list.
  i32 index;                       ///< Its place in the list, from 0.
  entry_kind_t kind;               ///< The list's kind, or another one, which has been reported.
  char node_name[256];
  i32 number;                  ///< -1 in lists of texts.
  char text[entry_text_size];  ///< Ends with a NUL. What a longer text before it left after its own NUL is still there.
};

class configuration_list_t {
 public:
  explicit configuration_list_t(const configuration_key_t &key);

  /// False, which has been reported, when the configuration has no such list.
  bool is_there() const { return is_there_; }

  struct end_t {};
  class iterator {
   public:
    explicit iterator(configuration_list_t *list) : list_(list) {}
    const configuration_entry_t &operator*() const { return list_->entry_; }
    iterator &operator++() {
      list_->move_to_next();
      return *this;
    }
    bool operator!=(end_t) const { return !list_->ended_; }

   private:
    configuration_list_t *list_;
  };

  iterator begin() { return iterator(this); }
  end_t end() const { return {}; }

 private:
  void find(const char *path);
  void move_to_next();
  void read_entry();

  configuration_entry_t entry_;
  u32 node_ = 0;
  bool is_there_ = false;
  bool ended_ = true;
};

/// The entries of a list. One that isn't there has none; that, and an entry of another kind, are reported.
configuration_list_t _get_generic_platform_list(const configuration_key_t &key);

}  // namespace edid_composer
