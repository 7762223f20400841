#include "linked_list/integrity.h"

#include <cstdint>

#include "diagnostics.h"
#include "linked_list/linked_list.h"

namespace edid_composer {

u32 _get_magic_number(const ll_list_t *list) {
  REPORTS_AS(_get_magic_number);
  constexpr u32 key = 0xA0A06060;
  if (list == nullptr) {
    LOG_ERROR("list ptr is NULL.");
    return 0;
  }
  const auto bits = reinterpret_cast<std::uintptr_t>(list);
  return static_cast<u32>(bits & 0xFFFFFFFF) ^ key;
}

namespace {

/// Follows the entries from the head as far as the size says and compares both.
bool verify_entries(const ll_list_t &list) {
  REPORTS_AS(ll_verify_integrity);
  const auto size = static_cast<i32>(list.size);
  i32 counter = 0;
  const ll_entry_t *entry = list.head;
  do {
    if (entry->list == nullptr) {
      LOG_BUG("Corrupt List: An entry's list attribute is set to NULL. Ptr:%s", address(entry->list).text);
      return false;
    }
    if (entry->type != list.type) {
      LOG_BUG("Corrupt List: An entry's type does not match the lists. Count:%d", counter);
      return false;
    }
    ++counter;
    entry = entry->next;
  } while (counter < size && entry != nullptr);

  if (entry != nullptr) {
    LOG_ERROR(
        "Corrupt List: Either the list is the wrong size or the final entry is not NULL. Counted=%d Len=%d NextPtr=%s",
        counter, size, address(entry).text);
    return false;
  }
  if (counter != size) {
    // kept: the label ListSize has the counted number.
    LOG_ERROR("Corrupt List: Either the list's size doesn't match the number of entries. ListSize:%d Counted:%d",
              counter, size);
    return false;
  }
  return true;
}

}  // namespace

bool verify_integrity(const ll_list_t *list) {
  REPORTS_AS(ll_verify_integrity);
  if (list == nullptr) {
    LOG_ERROR("\"list\" parameter is NULL. list:%s", address(list).text);
    return false;
  }
  if (const u32 magic = _get_magic_number(list); list->magic != magic) {
    // kept: the label ExpectedMagic has the stored number.
    LOG_ERROR("Corrupt List: List not initialized. Ptr:%s ExpectedMagic:%d Magic:%d Size:%d Head:%s ",
              address(list).text, list->magic, magic, list->size, address(list->head).text);
    return false;
  }
  if (list->head == nullptr) {
    if (list->size == 0) return true;
    LOG_ERROR("Corrupt List: The list's head is NULL, but the size isn't zero. Size:%d", list->size);
    return false;
  }
  if (list->size == 0) {
    LOG_ERROR("Corrupt List: The list's size is zero, but the head isn't NULL. HeadPtr:%s", address(list->head).text);
    return false;
  }
  return verify_entries(*list);
}

}  // namespace edid_composer

using namespace edid_composer;  // NOLINT(google-build-using-namespace): the operations below are the namespace's API

bool ll_is_initialized(const ll_list_t *list) {
  REPORTS_AS(ll_is_initialized);
  if (list == nullptr) {
    LOG_ERROR("list ptr is NULL.");
    return false;
  }
  return list->magic == _get_magic_number(list);
}

bool ll_verify_list_type(const ll_list_t *list, const char *type) {
  REPORTS_AS(ll_verify_list_type);
  if (list == nullptr) {
    LOG_ERROR("list ptr is NULL.");
    return false;
  }
  if (type == nullptr) {
    LOG_ERROR("\"type\" ptr is NULL. type=%s", address(type).text);
    return false;
  }
  return list->type == _calculate_str_checksum(type);
}

bool ll_verify_integrity(const ll_list_t *list) {
  return verify_integrity(list);
}

i32 ll_size(const ll_list_t *list) {
  REPORTS_AS(ll_size);
  if (list == nullptr) {
    LOG_ERROR("list ptr is NULL.");
    return 0;
  }
  if (!verify_integrity(list)) {
    LOG_BUG("Failed integrity test. list:%s", address(list).text);
    return 0;
  }
  return static_cast<i32>(list->size);
}
