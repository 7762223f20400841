#include "linked_list/new_entry.h"

#include "linked_list/linked_list.h"

namespace edid_composer {

untyped_new_entry_t::untyped_new_entry_t(const site_t &site, const new_entry_texts_t &texts, i32 size, u32 tag)
    : site_(site), texts_(texts) {
  if (create_entry(size, &entry_, &payload_, tag)) return;
  log_error(PIECES(site_), "%s", texts_.creation_failed);
  entry_ = nullptr;
  payload_ = nullptr;
}

bool untyped_new_entry_t::discard() {
  if (ll_delete_entry(entry_)) return true;
  log_error(PIECES(site_), "%s", texts_.deletion_failed);
  return false;
}

bool untyped_new_entry_t::settle(bool added) {
  if (added) return true;
  log_error(PIECES(site_), "%s", texts_.addition_failed);
  static_cast<void>(discard());
  return false;
}

}  // namespace edid_composer
