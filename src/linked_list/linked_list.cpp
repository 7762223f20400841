#include "linked_list/linked_list.h"

#include <cstdlib>
#include <cstring>

#include "diagnostics.h"
#include "linked_list/entry_arena.h"
#include "linked_list/integrity.h"

namespace edid_composer {

bool init_list(ll_list_t *list, u32 tag) {
  REPORTS_AS(ll_init);
  const u32 magic = _get_magic_number(list);
  if (list->magic == magic) {
    LOG_ERROR("List Corruption: This list has already been initialized. Ptr:%s MagicNum:%d", address(list).text, magic);
    return false;
  }
  *list = {.magic = magic, .type = tag, .size = 0, .head = nullptr};
  return true;
}

namespace {

// Not calloc: the thread's cache of free blocks, which malloc uses, halves the time that an entry takes.
inline ll_entry_t *entry_of_heap(u32 size, u32 tag, const void *entry_output, const void *data_output) {
  REPORTS_AS(ll_create_entry);
  auto *const entry = static_cast<ll_entry_t *>(std::malloc(sizeof(ll_entry_t)));
  if (entry == nullptr) {
    LOG_BUG("calloc failed to allocate memory for the entry. ptr:%s", address(entry_output).text);
    return nullptr;
  }
  void *const data = std::malloc(size);
  if (data == nullptr) {
    LOG_BUG("calloc failed to allocate memory for the data storage. ptr:%s", address(data_output).text);
    std::free(entry);
    return nullptr;
  }
  *entry = {.data = data, .next = nullptr, .list = nullptr, .type = tag};
  return entry;
}

inline ll_entry_t *entry_of_arena(u32 size, u32 tag, entry_arena_t *arena) {
  auto *const entry = static_cast<ll_entry_t *>(arena->allocate(static_cast<u32>(sizeof(ll_entry_t)) + size));
  if (entry != nullptr) *entry = {.data = entry + 1, .next = nullptr, .list = nullptr, .type = tag};
  return entry;
}

}  // namespace

ll_entry_t *create_unfilled_entry(u32 size, u32 tag, entry_arena_t *arena) {
  return arena != nullptr ? entry_of_arena(size, tag, arena) : entry_of_heap(size, tag, &size, &size);
}

void discard_entry(ll_entry_t *entry, const entry_arena_t *arena) {
  if (arena == nullptr) ll_delete_entry(entry);
}

namespace {

/// The link to the entry at @p index of a verified list; at its size: the link that ends it.
ll_entry_t **link_at(ll_list_t *list, u32 index) {
  ll_entry_t **link = &list->head;
  for (; index > 0; --index)
    link = &(*link)->next;
  return link;
}

// What several operations check alike; each reports in its own name.

template <const site_t &site>
bool is_sound(const ll_list_t *list) {
  if (list == nullptr) {
    LOG_ERROR("\"list\" parameter is NULL. list:%s", address(list).text);
    return false;
  }
  if (verify_integrity(list)) return true;
  LOG_BUG("List failed integrity test.");
  return false;
}

template <const site_t &site>
bool accepts_entries(const ll_list_t *list, const ll_entry_t *new_entry) {
  if (!is_sound<site>(list)) return false;
  if (new_entry != nullptr) return true;
  LOG_ERROR("\"new_entry\" parameter is NULL. new_entry:%s", address(new_entry).text);
  return false;
}

template <const site_t &site>
bool is_within(const ll_list_t &list, i32 index) {
  if (index >= 0 && static_cast<u32>(index) < list.size) return true;
  LOG_ERROR("Index Out of Range: Requesting a value outside the range of the list. Index:%d Size:%d", index, list.size);
  return false;
}

/// A copy that is in no list yet; null when there is no memory for it, or it has no size.
ll_entry_t *copy_of(const ll_entry_t &source, u32 size, entry_arena_t *arena) {
  ll_entry_t *copy = nullptr;
  void *payload = nullptr;
  if (arena != nullptr) {
    copy = create_unfilled_entry(size, source.type, arena);
  } else {
    ll_create_entry(static_cast<i32>(size), &copy, &payload, "");
  }
  if (copy == nullptr) return nullptr;
  copy->type = source.type;
  std::memcpy(copy->data, source.data, size);
  return copy;
}

}  // namespace

bool copy_list(const ll_list_t *src_list, ll_list_t *dst_list, u32 size, entry_arena_t *arena) {
  REPORTS_AS(ll_copy_list);
  if (src_list == nullptr) {
    LOG_ERROR("\"src_list\" parameter is NULL. src_list:%s", address(src_list).text);
    return false;
  }
  if (dst_list == nullptr) {
    LOG_ERROR("\"dst_list\" parameter is NULL. dst_list:%s", address(dst_list).text);
    return false;
  }
  if (!verify_integrity(src_list)) {
    LOG_BUG("Source list failed integrity test.");
    return false;
  }
  if (!verify_integrity(dst_list)) {
    LOG_BUG("Destination list failed integrity test.");
    return false;
  }
  // Counted, not followed to the end: a list that is copied onto itself grows while it is read.
  const ll_entry_t *source = src_list->head;
  for (u32 remaining = src_list->size; remaining > 0; --remaining, source = source->next) {
    ll_entry_t *const copy = copy_of(*source, size, arena);
    if (copy == nullptr) {
      LOG_BUG("Failed creating entry for the destination list.");
      return false;
    }
    if (!ll_add_entry_to_back(dst_list, copy)) {
      discard_entry(copy, arena);
      LOG_BUG("Failed adding entry to back of the destination list.");
      return false;
    }
  }
  return true;
}

}  // namespace edid_composer

using namespace edid_composer;  // NOLINT(google-build-using-namespace): the operations below are the namespace's API

bool ll_init(ll_list_t *list, const char *type) {
  REPORTS_AS(ll_init);
  if (list == nullptr) {
    LOG_ERROR("list ptr is NULL.");
    return false;
  }
  if (type == nullptr) {
    LOG_ERROR("\"type\" ptr is NULL. type=%s", address(type).text);
    return false;
  }
  return init_list(list, _calculate_str_checksum(type));
}

bool ll_create_entry(i32 size, ll_entry_t **entry, void **data, const char *type) {
  REPORTS_AS(ll_create_entry);
  if (size < 1) {
    LOG_ERROR("Create entry called with an invalid size. size:%d", size);
    return false;
  }
  if (entry == nullptr) {
    LOG_ERROR("\"entry\" pointer is NULL. entry:%s", address(entry).text);
    return false;
  }
  if (data == nullptr) {
    LOG_ERROR("\"data\" pointer is NULL. data:%s", address(data).text);
    return false;
  }
  if (type == nullptr) {
    LOG_ERROR("\"type\" pointer is NULL. type:%s", address(type).text);
    return false;
  }
  const auto bytes = static_cast<u32>(size);
  *data = nullptr;
  *entry = entry_of_heap(bytes, _calculate_str_checksum(type), entry, data);
  if (*entry != nullptr) *data = std::memset((*entry)->data, 0, bytes);
  return *entry != nullptr;
}

bool ll_delete_entry(ll_entry_t *delete_entry) {
  REPORTS_AS(ll_delete_entry);
  if (delete_entry == nullptr) {
    LOG_ERROR("\"delete_entry\" parameter is NULL. delete_entry:%s", address(delete_entry).text);
    return false;
  }
  std::free(delete_entry->data);
  delete_entry->data = nullptr;
  delete_entry->next = nullptr;
  delete_entry->list = nullptr;
  std::free(delete_entry);
  return true;
}

bool ll_delete_entry_at(ll_list_t *list, u32 index) {
  REPORTS_AS(ll_delete_entry_at);
  if (!is_sound<site>(list) || !is_within<site>(*list, static_cast<i32>(index))) return false;
  ll_entry_t **const link = link_at(list, index);
  ll_entry_t *const victim = *link;
  *link = victim->next;
  victim->list = nullptr;
  ll_delete_entry(victim);
  --list->size;
  return true;
}

bool ll_add_entry_to_back(ll_list_t *list, ll_entry_t *new_entry) {
  REPORTS_AS(ll_add_entry_to_back);
  if (!accepts_entries<site>(list, new_entry)) return false;
  if (list->type != new_entry->type) {
    LOG_BUG("This entry represents a different type and cannot be added to this list. List:0x%08X Entry:0x%08X",
            list->type, new_entry->type);
    return false;
  }
  *link_at(list, list->size) = new_entry;
  new_entry->list = list;
  ++list->size;
  return true;
}

bool ll_add_entry_to_front(ll_list_t *list, ll_entry_t *new_entry) {
  REPORTS_AS(ll_add_entry_to_front);
  if (!accepts_entries<site>(list, new_entry)) return false;
  if (list->type != new_entry->type) {
    // kept: "tothis" without a blank.
    LOG_BUG("This entry represents a different type and cannot be added tothis list. List:0x%08X Entry:0x%08X",
            list->type, new_entry->type);
    return false;
  }
  new_entry->next = list->head;
  list->head = new_entry;
  new_entry->list = list;
  ++list->size;
  return true;
}

bool ll_entry_at(const ll_list_t *list, i32 index, void **entry_data) {
  REPORTS_AS(ll_entry_at);
  if (entry_data == nullptr) {
    LOG_ERROR("\"entry_data\" parameter is NULL. entry_data:%s", address(entry_data).text);
    return false;
  }
  *entry_data = nullptr;
  if (!is_sound<site>(list) || !is_within<site>(*list, index)) return false;
  const ll_entry_t *entry = list->head;
  for (; index > 0; --index)
    entry = entry->next;
  *entry_data = entry->data;
  return true;
}

bool ll_delete_list(ll_list_t *list) {
  REPORTS_AS(ll_delete_list);
  if (list == nullptr) {
    LOG_ERROR("list ptr is NULL.");
    return false;
  }
  if (!verify_integrity(list)) {
    LOG_BUG("Failed verifying integrity of the list. list:%s", address(list).text);
    return false;
  }
  for (ll_entry_t *entry = list->head; entry != nullptr;) {
    ll_entry_t *const next = entry->next;
    ll_delete_entry(entry);
    entry = next;
  }
  list->size = 0;
  list->head = nullptr;
  list->magic = 0;
  return true;
}

bool ll_copy_list(const ll_list_t *src_list, ll_list_t *dst_list, u32 size) {
  return copy_list(src_list, dst_list, size, nullptr);
}
