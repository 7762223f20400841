// The entries of a list of the platform configuration, one after the other:
//
//   for (const configuration_entry_t &entry : _get_generic_platform_list("standard_timings", entry_kind_t::text)) ...
#pragma once

#include "edid_composer.h"

namespace edid_composer {

/// Size of the buffer that holds the text of an entry.
inline constexpr u32 entry_text_size = 30;

struct configuration_entry_t {
  const char *list_name;  ///< Relative to the configuration domain.
  char node_name[256];
  i32 number;                  ///< -1 in lists of texts.
  char text[entry_text_size];  ///< Ends with a NUL. What a longer text before it left after its own NUL is still there.
};

enum class entry_kind_t { text, number };

class configuration_list_t {
 public:
  configuration_list_t(const char *list_name, entry_kind_t kind);

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
  void find(const char *list_name);
  void move_to_next();
  bool read_entry();

  configuration_entry_t entry_;
  entry_kind_t kind_;
  u32 node_ = 0;
  bool ended_ = true;
};

/// The entries of a list, relative to the configuration domain. One that isn't there has none, and an entry of another
/// kind is passed over; both are reported.
configuration_list_t _get_generic_platform_list(const char *list_name, entry_kind_t kind);

}  // namespace edid_composer
