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

namespace {

/// An entry that is in no list yet.
ll_entry_t *new_entry(const void *record, u32 size, u32 tag, const char *failure, const site_t &site, int line) {
  ll_entry_t *entry = nullptr;
  entry = create_unfilled_entry(size, tag, &entry, &record);
  if (entry == nullptr) {
    log_error(site, line, "%s", failure);
  } else {
    std::memcpy(entry->data, record, size);
  }
  return entry;
}

}  // namespace

bool untyped_appender_t::append(const void *record, u32 size, u32 tag) {
  ll_entry_t *const entry = new_entry(record, size, tag, texts_.creation_failed, site_, line_);
  if (entry == nullptr) return false;
  if (add(entry)) return true;
  log_error(site_, line_, "%s", texts_.addition_failed);
  ll_delete_entry(entry);
  return false;
}

bool untyped_appender_t::add(ll_entry_t *entry) {
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

bool prepend_untyped(ll_list_t *list, const void *record, u32 size, u32 tag, const site_t &site, int line) {
  ll_entry_t *const entry = new_entry(record, size, tag, new_entry_texts.creation_failed, site, line);
  if (entry == nullptr || ll_add_entry_to_front(list, entry)) return entry != nullptr;
  // kept: the words for the back of the list.
  log_error(site, line, "%s", new_entry_texts.addition_failed);
  ll_delete_entry(entry);
  return false;
}

}  // namespace edid_composer
