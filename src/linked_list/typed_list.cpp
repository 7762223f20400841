#include "linked_list/typed_list.h"

#include <cstring>

namespace edid_composer {

const ll_entry_t *begin_checked_walk(const named_list_t &named, const char *type_name) {
  if (!ll_verify_list_type(named.list, type_name)) log_error(named.site, named.line, "The list types don't match.");
  if (named.list == nullptr) {
    log_bug(named.site, named.line, "The list:%s of type:%s is NULL.", named.expression, type_name);
    return nullptr;
  }
  return named.list->head;
}

bool untyped_appender_t::append(const void *record, u32 size, u32 tag) {
  ll_entry_t *const entry = new_entry(record, size, tag);
  return entry != nullptr && settle(add_to_back(entry), entry);
}

bool untyped_appender_t::prepend(const void *record, u32 size, u32 tag) {
  ll_entry_t *const entry = new_entry(record, size, tag);
  return entry != nullptr && settle(ll_add_entry_to_front(list_, entry), entry);
}

ll_entry_t *untyped_appender_t::new_entry(const void *record, u32 size, u32 tag) const {
  ll_entry_t *const entry = create_unfilled_entry(size, tag, arena_);
  if (entry == nullptr) {
    log_error(site_, line_, "%s", texts_.creation_failed);
  } else {
    std::memcpy(entry->data, record, size);
  }
  return entry;
}

bool untyped_appender_t::settle(bool added, ll_entry_t *entry) const {
  if (added) return true;
  log_error(site_, line_, "%s", texts_.addition_failed);
  discard_entry(entry, arena_);
  return false;
}

bool untyped_appender_t::add_to_back(ll_entry_t *entry) {
  if (last_ == nullptr) {
    if (!ll_add_entry_to_back(list_, entry)) return false;
  } else {
    last_->next = entry;
    entry->list = list_;
    ++list_->size;
  }
  last_ = entry;
  return true;
}

}  // namespace edid_composer
