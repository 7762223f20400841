#include "linked_list/walk.h"

namespace edid_composer {

const ll_entry_t *begin_checked_walk(const named_list_t &named, const char *type_name) {
  if (!ll_verify_list_type(named.list, type_name)) log_error(PIECES(named.site), "The list types don't match.%s", "");
  if (named.list == nullptr) {
    log_bug(PIECES(named.site), "The list:%s of type:%s is NULL.", named.expression, type_name);
    return nullptr;
  }
  return named.list->head;
}

}  // namespace edid_composer
