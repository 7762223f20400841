// Lists by the type of their elements: initialising, walking, looking up and appending, each checked once.
//
// The walk over a list compares the list's tag with the element type's and the pointer with NULL, reports what is wrong
// in the name of the scope's operation, and goes through the elements from front to back:
//
//   for (const auto &timing : walk<const detailed_timing_t>(LIST(&edid->dtd_list))) ...
//
// An element that is at hand is appended as a copy, one that has to be filled step by step as a new entry:
//
//   if (!append(&edid->std_timings, timing, site)) return false;
//
//   new_entry_t<detailed_timing_t> timing(site);
//   if (!timing) return false;
//   timing->h_active = ...;
//   if (!timing.add_to_back(&edid->dtd_list)) return false;
#pragma once

#include <type_traits>

#include "diagnostics.h"
#include "linked_list/linked_list.h"

namespace edid_composer {

/// The name under which an element type is kept in lists.
template <typename record_t>
inline constexpr const char *element_type_name = nullptr;
template <>
inline constexpr const char *element_type_name<i32> = "int";
template <>
inline constexpr const char *element_type_name<short_video_desc_t> = "short_video_desc_t";
template <>
inline constexpr const char *element_type_name<std_timing_t> = "std_timing_t";
template <>
inline constexpr const char *element_type_name<detailed_timing_t> = "detailed_timing_t";
template <>
inline constexpr const char *element_type_name<short_audio_desc_t> = "short_audio_desc_t";

/// The tag that lists and entries make of the name, known to the compiler.
template <typename record_t>
inline constexpr u32 element_tag = _calculate_str_checksum(element_type_name<record_t>);

template <typename record_t>
[[nodiscard]] bool init_list(ll_list_t *list) {
  return ll_init(list, element_type_name<record_t>);
}

/// True, without a line, when a walk over the list has nothing to report.
template <typename record_t>
bool is_walkable(const ll_list_t &list) {
  return ll_is_initialized(&list) && list.type == element_tag<record_t>;
}

/// The element at @p index; null, with the lines of ll_entry_at, when there is none.
template <typename record_t>
record_t *entry_at(const ll_list_t *list, i32 index) {
  void *payload = nullptr;
  ll_entry_at(list, index, &payload);
  return static_cast<record_t *>(payload);
}

/// A list as a walk is given it: with the text of the expression that stands for it, and the operation that walks.
struct named_list_t {
  const ll_list_t *list;
  const char *expression;
  const site_t &site;
  int line;
};
#define LIST(list) (::edid_composer::named_list_t{(list), #list, site, __LINE__})

/// Makes the two checks and reports; returns the first entry, or null when there is none.
[[gnu::cold]] const ll_entry_t *begin_checked_walk(const named_list_t &named, const char *type_name);

/// The elements of a list that is known to be sound, as after ll_size has counted some.
template <typename record_t>
class elements {
 public:
  explicit elements(const ll_entry_t *first) : first_(first) {}

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

template <typename record_t>
class walk : public elements<record_t> {
  using element_t = std::remove_const_t<record_t>;

 public:
  explicit walk(const named_list_t &named)
      : elements<record_t>(named.list != nullptr && named.list->type == element_tag<element_t>
                               ? named.list->head
                               : begin_checked_walk(named, element_type_name<element_t>)) {}
};

/// The elements of a list after ll_size has counted them: none, with its lines, when the list is not sound.
template <typename record_t>
elements<record_t> counted_elements(const ll_list_t &list) {
  return elements<record_t>(ll_size(&list) > 0 ? list.head : nullptr);
}

/// How an operation words the two failures of an addition.
struct new_entry_texts_t {
  const char *creation_failed;
  const char *addition_failed;
};

/// The wording of most operations, also of some that add to the front.
inline constexpr new_entry_texts_t new_entry_texts{"Failed creating entry.",
                                                   "Failed adding entry to the back of the list."};

/// An entry that is in no list yet, whatever its element type.
class untyped_new_entry_t {
 public:
  untyped_new_entry_t(u32 size, u32 tag, const site_t &site, const new_entry_texts_t &texts, int line);
  untyped_new_entry_t(const untyped_new_entry_t &) = delete;
  untyped_new_entry_t &operator=(const untyped_new_entry_t &) = delete;

  explicit operator bool() const { return entry_ != nullptr; }

  /// Hands the entry to a list. An entry that the list refuses is deleted.
  [[nodiscard]] bool add_to_back(ll_list_t *list) { return settle(ll_add_entry_to_back(list, entry_)); }
  [[nodiscard]] bool add_to_front(ll_list_t *list) { return settle(ll_add_entry_to_front(list, entry_)); }

  /// Hands the entry to a verified list whose end is known.
  bool link(ll_list_t *list, ll_entry_t **end) const {
    *end = entry_;
    entry_->list = list;
    ++list->size;
    return true;
  }
  /// The link after the entry, once a list holds it.
  ll_entry_t **next() const { return &entry_->next; }

  /// Deletes the entry instead.
  void discard() { ll_delete_entry(entry_); }

 protected:
  void *payload() const { return payload_; }

 private:
  bool settle(bool added);

  const site_t &site_;
  const new_entry_texts_t &texts_;
  int line_;
  ll_entry_t *entry_ = nullptr;
  void *payload_ = nullptr;
};

/// An entry for an element of @p record_t, zero-filled. Failures are reported in the name of @p site.
template <typename record_t>
class new_entry_t : public untyped_new_entry_t {
 public:
  explicit new_entry_t(const site_t &site, const new_entry_texts_t &texts = new_entry_texts,
                       int line = __builtin_LINE())
      : untyped_new_entry_t(sizeof(record_t), element_tag<record_t>, site, texts, line) {}

  record_t &operator*() const { return *static_cast<record_t *>(payload()); }
  record_t *operator->() const { return static_cast<record_t *>(payload()); }
};

/// Appends records to one list. The first addition verifies the list; the following ones know its end, so nobody else
/// may change the list in between. Failures are reported in the name of @p site.
template <typename record_t>
class appender_t {
 public:
  explicit appender_t(ll_list_t *list, const site_t &site, const new_entry_texts_t &texts = new_entry_texts,
                      int line = __builtin_LINE())
      : list_(list), site_(site), texts_(texts), line_(line) {}

  [[nodiscard]] bool append(const record_t &record) {
    new_entry_t<record_t> entry(site_, texts_, line_);
    if (!entry) return false;
    *entry = record;
    if (end_ == nullptr ? !entry.add_to_back(list_) : !entry.link(list_, end_)) return false;
    end_ = entry.next();
    return true;
  }

 private:
  ll_list_t *list_;
  const site_t &site_;
  const new_entry_texts_t &texts_;
  int line_;
  ll_entry_t **end_ = nullptr;  ///< The link that ends the list, once it is known.
};

/// Appends a copy of @p record to @p list. Failures are reported in the name of @p site.
template <typename record_t>
[[nodiscard]] bool append(ll_list_t *list, const record_t &record, const site_t &site,
                          const new_entry_texts_t &texts = new_entry_texts, int line = __builtin_LINE()) {
  return appender_t<record_t>(list, site, texts, line).append(record);
}

}  // namespace edid_composer
