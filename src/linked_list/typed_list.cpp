#include "linked_list/typed_list.h"

namespace edid_composer {

const ll_entry_t *begin_checked_walk(const named_list_t &named, const char *type_name) {
  if (!ll_verify_list_type(named.list, type_name)) log_error(named.site, named.line, "The list types don't match.");
  if (named.list == nullptr) {
    log_bug(named.site, named.line, "The list:%s of type:%s is NULL.", named.expression, type_name);
    return nullptr;
  }
  return named.list->head;
}

untyped_new_entry_t::untyped_new_entry_t(u32 size, u32 tag, const site_t &site, const new_entry_texts_t &texts,
                                         int line)
    : site_(site), texts_(texts), line_(line) {
  if (create_entry(size, &entry_, &payload_, tag)) return;
  log_error(site_, line_, "%s", texts_.creation_failed);
  entry_ = nullptr;
  payload_ = nullptr;
}

bool untyped_new_entry_t::settle(bool added) {
  if (added) return true;
  log_error(site_, line_, "%s", texts_.addition_failed);
  discard();
  return false;
}

}  // namespace edid_composer
