// Filling typed lists and looking into them, for tests.
#pragma once

#include <stdexcept>
#include <vector>

#include "edid_composer.h"

namespace test_support {

/// Copies of a list's payloads, front to back. Follows the entries itself: no list operation checks or prints anything.
template <typename record_t>
std::vector<record_t> elements_of(const ll_list_t &list) {
  std::vector<record_t> elements;
  for (const ll_entry_t *entry = list.head; entry != nullptr; entry = entry->next) {
    elements.push_back(*static_cast<const record_t *>(entry->data));
  }
  return elements;
}

/// Appends a copy of @p record to a list that was initialised with @p type_name.
template <typename record_t>
void append_to(ll_list_t &list, const char *type_name, const record_t &record) {
  ll_entry_t *entry = nullptr;
  void *payload = nullptr;
  if (!ll_create_entry(static_cast<i32>(sizeof(record_t)), &entry, &payload, type_name)) {
    throw std::runtime_error("the entry could not be created");
  }
  *static_cast<record_t *>(payload) = record;
  if (ll_add_entry_to_back(&list, entry)) return;
  ll_delete_entry(entry);
  throw std::runtime_error("the entry could not be added");
}

}  // namespace test_support
