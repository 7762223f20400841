// Lists by the type of their elements: initialising, walking, looking up and appending, each checked once.
//
// The walk over a list compares the list's tag with the element type's and the pointer with NULL, reports what is wrong
// in the name of the scope's operation, and goes through the elements from front to back:
//
//   for (const auto &timing : walk<const detailed_timing_t>(LIST(&edid->dtd_list, "&edid->dtd_list"))) ...
//
// Elements are appended as copies, one or several:
//
//   appender_t<short_video_desc_t> modes(&edid->video_list, arena, site);
//   for (...) if (!modes.append(mode)) return false;
//
// Entries of a caller's record come from the heap, those of a composition's own lists from its arena.
#pragma once

#include <type_traits>

#include "diagnostics.h"
#include "linked_list/entry_arena.h"
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
  return init_list(list, element_tag<record_t>);
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

/// A list as a walk is given it: with its label in the log, and the operation that walks.
struct named_list_t {
  const ll_list_t *list;
  const char *label;
  const site_t &site;
  int line;
};
#define LIST(list, label) (::edid_composer::named_list_t{(list), (label), site, __LINE__})

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

/// Unlinks the elements of a sound list whose entries belong to an arena, from the one at @p first on, for which
/// @p is_removed returns true. It is called with the place of each element and the element.
template <typename record_t, typename predicate_t>
void unlink_elements(ll_list_t *list, i32 first, predicate_t is_removed) {
  ll_entry_t **link = &list->head;
  for (i32 place = 0; *link != nullptr; ++place) {
    ll_entry_t *const entry = *link;
    if (place < first || !is_removed(place, *static_cast<const record_t *>(entry->data))) {
      link = &entry->next;
      continue;
    }
    *link = entry->next;
    --list->size;
  }
}

/// How an operation words the two failures of an addition.
struct new_entry_texts_t {
  const char *creation_failed;
  const char *addition_failed;
};

/// The wording of most operations.
inline constexpr new_entry_texts_t new_entry_texts{"Failed creating entry.",
                                                   "Failed adding entry to the back of the list."};

/// Appends records to one list. The first addition verifies the list; the following ones know its end, so nobody else
/// may change the list in between. Failures are reported in the name of @p site. Without an @p arena the entries come
/// from the heap.
class untyped_appender_t {
 public:
  untyped_appender_t(ll_list_t *list, entry_arena_t *arena, const site_t &site, const new_entry_texts_t &texts,
                     int line)
      : list_(list), arena_(arena), site_(site), texts_(texts), line_(line) {}

  const ll_list_t &list() const { return *list_; }
  /// As ll_size, which verifies a list that nothing was appended to.
  i32 size() const { return last_ != nullptr ? static_cast<i32>(list_->size) : ll_size(list_); }

 protected:
  /// An entry that is in no list yet; null, reported, when there is no memory for it.
  ll_entry_t *new_entry(u32 size, u32 tag) const {
    ll_entry_t *const entry = create_unfilled_entry(size, tag, arena_);
    if (entry == nullptr) log_error(site_, line_, "%s", texts_.creation_failed);
    return entry;
  }
  [[nodiscard]] bool add_to_back(ll_entry_t *entry) {
    if (last_ == nullptr) return add_first(entry);
    last_->next = entry;
    entry->list = list_;
    ++list_->size;
    last_ = entry;
    return true;
  }
  [[nodiscard]] bool add_to_front(ll_entry_t *entry);

 private:
  bool add_first(ll_entry_t *entry);
  bool refuse(ll_entry_t *entry) const;

  ll_list_t *list_;
  entry_arena_t *arena_;
  const site_t &site_;
  const new_entry_texts_t &texts_;
  int line_;
  ll_entry_t *last_ = nullptr;  ///< Once the list is verified.
};

template <typename record_t>
class appender_t : public untyped_appender_t {
 public:
  appender_t(ll_list_t *list, entry_arena_t *arena, const site_t &site,
             const new_entry_texts_t &texts = new_entry_texts, int line = __builtin_LINE())
      : untyped_appender_t(list, arena, site, texts, line) {}

  [[nodiscard]] bool append(const record_t &record) {
    ll_entry_t *const entry = filled_entry(record);
    return entry != nullptr && add_to_back(entry);
  }
  /// Puts the record before the others. kept: a failure is reported in the words for the back of the list.
  [[nodiscard]] bool prepend(const record_t &record) {
    ll_entry_t *const entry = filled_entry(record);
    return entry != nullptr && add_to_front(entry);
  }

 private:
  ll_entry_t *filled_entry(const record_t &record) const {
    ll_entry_t *const entry = new_entry(sizeof record, element_tag<record_t>);
    if (entry != nullptr) *static_cast<record_t *>(entry->data) = record;
    return entry;
  }
};

}  // namespace edid_composer
