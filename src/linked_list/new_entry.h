// Creating an entry, filling it and handing it to a list, with the clean-up when a step fails:
//
//   new_entry_t<std_timing_t> timing(HERE, texts);
//   if (!timing) return 0;
//   timing->h_active = ...;
//   if (!timing.add_to_back(&edid->std_timings)) return 0;
//
// or, for an element that is known already, append(). Failures are reported in the name of the given site.
#pragma once

#include "diagnostics.h"
#include "linked_list/element_types.h"

namespace edid_composer {

/// How an operation words the three failures. An entry refers to its texts, which outlive it.
struct new_entry_texts_t {
  char creation_failed[28];
  char addition_failed[46];
  char deletion_failed[30];
};

/// The wording of most operations, also of some that add to the front.
inline constexpr new_entry_texts_t new_entry_texts{
    "Failed creating entry.", "Failed adding entry to the back of the list.", "Failed deleting entry."};

/// An entry that is in no list yet, whatever its element type.
class untyped_new_entry_t {
 public:
  untyped_new_entry_t(const site_t &site, const new_entry_texts_t &texts, i32 size, u32 tag);
  untyped_new_entry_t(const untyped_new_entry_t &) = delete;
  untyped_new_entry_t &operator=(const untyped_new_entry_t &) = delete;

  explicit operator bool() const { return entry_ != nullptr; }

  /// Hands the entry to a list. A list that refuses it leaves nothing behind.
  [[nodiscard]] bool add_to_back(ll_list_t *list) { return settle(ll_add_entry_to_back(list, entry_)); }
  [[nodiscard]] bool add_to_front(ll_list_t *list) { return settle(ll_add_entry_to_front(list, entry_)); }

  /// Deletes the entry instead.
  [[nodiscard]] bool discard();

 protected:
  void *payload() const { return payload_; }

 private:
  bool settle(bool added);

  site_t site_;
  const new_entry_texts_t &texts_;
  ll_entry_t *entry_ = nullptr;
  void *payload_ = nullptr;
};

/// An entry for an element of @p record_t, zero-filled.
template <typename record_t>
class new_entry_t : public untyped_new_entry_t {
 public:
  explicit new_entry_t(const site_t &site, const new_entry_texts_t &texts = new_entry_texts)
      : untyped_new_entry_t(site, texts, static_cast<i32>(sizeof(record_t)), element_tag<record_t>) {}

  record_t &operator*() const { return *static_cast<record_t *>(payload()); }
  record_t *operator->() const { return static_cast<record_t *>(payload()); }
};

/// Appends a copy of @p record to @p list.
template <typename record_t>
[[nodiscard]] bool append(ll_list_t *list, const record_t &record, const site_t &site,
                          const new_entry_texts_t &texts = new_entry_texts) {
  new_entry_t<record_t> entry(site, texts);
  if (!entry) return false;
  *entry = record;
  return entry.add_to_back(list);
}

}  // namespace edid_composer
