// The checked walk over a typed list:
//
//   for (auto &timing : walk<const detailed_timing_t>(LIST(&edid->dtd_list))) ...
//
// compares the list's type tag with the element type's name and the pointer with NULL, reports what is wrong in the
// name of the walking function, and goes through the entries from front to back.
#pragma once

#include <type_traits>

#include "diagnostics.h"
#include "linked_list/element_types.h"

namespace edid_composer {

/// A list as a walk is given it, with the text of the expression that stands for it at the call.
struct named_list_t {
  const ll_list_t *list;
  const char *expression;
  site_t site;
};

/// Names a list for a walk by the function that it stands in, or by @p site for which that function works.
#define LIST(list) (::edid_composer::named_list_t{(list), #list, HERE})
#define LIST_AS(site, list) (::edid_composer::named_list_t{(list), #list, HERE_AS(site)})

/// Makes the two checks and reports; answers the first entry, or null when there is none. Cold: a walk over a list that
/// passes both finds its first entry without a call.
[[gnu::cold]] const ll_entry_t *begin_checked_walk(const named_list_t &named, const char *type_name);

template <typename record_t>
class walk {
  using element_t = std::remove_const_t<record_t>;

 public:
  explicit walk(const named_list_t &named)
      : first_(named.list != nullptr && named.list->type == element_tag<element_t>
                   ? named.list->head
                   : begin_checked_walk(named, element_type_name<element_t>)) {}

  class iterator {
   public:
    explicit iterator(const ll_entry_t *entry) : entry_(entry) {}
    record_t &operator*() const { return *static_cast<record_t *>(entry_->data); }
    iterator &operator++() {
      entry_ = entry_->next;
      return *this;
    }
    bool operator!=(const iterator &other) const { return entry_ != other.entry_; }

   private:
    const ll_entry_t *entry_;
  };

  iterator begin() const { return iterator(first_); }
  iterator end() const { return iterator(nullptr); }

 private:
  const ll_entry_t *first_;
};

}  // namespace edid_composer
