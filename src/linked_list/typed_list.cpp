#include "linked_list/typed_list.h"

namespace edid_composer {

const ll_entry_t *begin_checked_walk(const named_list_t &named, const char *type_name) {
  if (!ll_verify_list_type(named.list, type_name)) log_error(named.site, named.line, "The list types don't match.");
  if (named.list == nullptr) {
    log_bug(named.site, named.line, "The list:%s of type:%s is NULL.", named.label, type_name);
    return nullptr;
  }
  return named.list->head;
}

bool untyped_appender_t::add_first(ll_entry_t *entry) {
  if (!ll_add_entry_to_back(list_, entry)) return refuse(entry);
  last_ = entry;
  return true;
}

bool untyped_appender_t::add_to_front(ll_entry_t *entry) {
  return ll_add_entry_to_front(list_, entry) || refuse(entry);
}

bool untyped_appender_t::refuse(ll_entry_t *entry) const {
  log_error(site_, line_, "%s", texts_.addition_failed);
  discard_entry(entry, arena_);
  return false;
}

}  // namespace edid_composer
