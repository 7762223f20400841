// Everything that the list says.
#include <cstring>

#include "diagnostics_walk.h"
#include "support/records.h"

namespace diagnostics_walk {
namespace {

using test_support::append;
using test_support::scoped_list_t;

row_t list_error(const char *function, const char *message, std::function<void()> provoke) {
  return error("linked_list", function, message, std::move(provoke));
}

row_t list_bug(const char *function, const char *message, std::function<void()> provoke) {
  return bug("linked_list", function, message, std::move(provoke));
}

/// A head that was never initialised.
ll_list_t nothing() {
  return {};
}

/// Hands a list of two numbers over, and puts right afterwards what was done to its head and its last entry.
void with_two_numbers(const std::function<void(ll_list_t *)> &action) {
  scoped_list_t<i32> list;
  append(*list, i32{1});
  append(*list, i32{2});
  ll_list_t &head = *list.get();
  const ll_list_t head_before = head;
  ll_entry_t *const last = head.head->next;
  const ll_entry_t last_before = *last;
  action(&head);
  head = head_before;
  head.head->next = last;
  *last = last_before;
}

/// Hands an entry of a list of detailed timings over, which no list of numbers accepts.
void with_foreign_entry(const std::function<void(ll_entry_t *)> &action) {
  ll_entry_t *entry = nullptr;
  void *payload = nullptr;
  if (!ll_create_entry(4, &entry, &payload, "detailed_timing_t")) return;
  action(entry);
  ll_delete_entry(entry);
}

std::vector<row_t> null_pointers() {
  const char *const no_list = "list ptr is NULL.";
  const char *const no_parameter = "\"list\" parameter is NULL. list:(nil)";
  const char *const no_type = "\"type\" ptr is NULL. type=(nil)";
  return {
      list_error("ll_init", no_list, [] { ll_init(nullptr, "int"); }),
      list_error("ll_is_initialized", no_list, [] { ll_is_initialized(nullptr); }),
      list_error("ll_verify_list_type", no_list, [] { ll_verify_list_type(nullptr, "int"); }),
      list_error("ll_size", no_list, [] { ll_size(nullptr); }),
      list_error("ll_delete_list", no_list, [] { ll_delete_list(nullptr); }),
      list_error("ll_init", no_type,
                 [] {
                   ll_list_t list = nothing();
                   ll_init(&list, nullptr);
                 }),
      list_error("ll_verify_list_type", no_type, [] { ll_verify_list_type(scoped_list_t<i32>().get(), nullptr); }),
      list_error("ll_verify_integrity", no_parameter, [] { ll_verify_integrity(nullptr); }),
      list_error("ll_delete_entry_at", no_parameter, [] { ll_delete_entry_at(nullptr, 0); }),
      list_error("ll_add_entry_to_back", no_parameter, [] { ll_add_entry_to_back(nullptr, nullptr); }),
      list_error("ll_add_entry_to_front", no_parameter, [] { ll_add_entry_to_front(nullptr, nullptr); }),
      list_error("ll_entry_at", no_parameter,
                 [] {
                   void *payload = nullptr;
                   ll_entry_at(nullptr, 0, &payload);
                 }),
      list_error("ll_entry_at", "\"entry_data\" parameter is NULL. entry_data:(nil)",
                 [] { ll_entry_at(nullptr, 0, nullptr); }),
      list_error("ll_add_entry_to_back", "\"new_entry\" parameter is NULL. new_entry:(nil)",
                 [] { ll_add_entry_to_back(scoped_list_t<i32>().get(), nullptr); }),
      list_error("ll_add_entry_to_front", "\"new_entry\" parameter is NULL. new_entry:(nil)",
                 [] { ll_add_entry_to_front(scoped_list_t<i32>().get(), nullptr); }),
      list_error("ll_delete_entry", "\"delete_entry\" parameter is NULL. delete_entry:(nil)",
                 [] { ll_delete_entry(nullptr); }),
      list_error("ll_copy_list", "\"src_list\" parameter is NULL. src_list:(nil)",
                 [] { ll_copy_list(nullptr, nullptr, 4); }),
      list_error("ll_copy_list", "\"dst_list\" parameter is NULL. dst_list:(nil)",
                 [] { ll_copy_list(scoped_list_t<i32>().get(), nullptr, 4); }),
  };
}

std::vector<row_t> creations() {
  static ll_entry_t *entry = nullptr;
  static void *payload = nullptr;
  return {
      list_error("ll_create_entry", "Create entry called with an invalid size. size:0",
                 [] { ll_create_entry(0, &entry, &payload, "int"); }),
      list_error("ll_create_entry", "Create entry called with an invalid size. size:-1",
                 [] { ll_create_entry(-1, nullptr, nullptr, nullptr); }),
      list_error("ll_create_entry", "\"entry\" pointer is NULL. entry:(nil)",
                 [] { ll_create_entry(4, nullptr, nullptr, nullptr); }),
      list_error("ll_create_entry", "\"data\" pointer is NULL. data:(nil)",
                 [] { ll_create_entry(4, &entry, nullptr, nullptr); }),
      list_error("ll_create_entry", "\"type\" pointer is NULL. type:(nil)",
                 [] { ll_create_entry(4, &entry, &payload, nullptr); }),
  };
}

std::vector<row_t> uninitialised_lists() {
  const char *const failed = "List failed integrity test.";
  return {
      list_error("ll_init", "List Corruption: This list has already been initialized. Ptr:PTR MagicNum:*",
                 [] { ll_init(scoped_list_t<i32>().get(), "int"); }),
      list_error("ll_verify_integrity", "Corrupt List: List not initialized. Ptr:PTR ExpectedMagic:0 Magic:*",
                 [] {
                   const ll_list_t list = nothing();
                   ll_verify_integrity(&list);
                 }),
      list_bug("ll_size", "Failed integrity test. list:PTR",
               [] {
                 const ll_list_t list = nothing();
                 ll_size(&list);
               }),
      list_bug("ll_delete_list", "Failed verifying integrity of the list. list:PTR",
               [] {
                 ll_list_t list = nothing();
                 ll_delete_list(&list);
               }),
      list_bug("ll_delete_entry_at", failed,
               [] {
                 ll_list_t list = nothing();
                 ll_delete_entry_at(&list, 0);
               }),
      list_bug("ll_add_entry_to_back", failed,
               [] {
                 ll_list_t list = nothing();
                 ll_add_entry_to_back(&list, nullptr);
               }),
      list_bug("ll_add_entry_to_front", failed,
               [] {
                 ll_list_t list = nothing();
                 ll_add_entry_to_front(&list, nullptr);
               }),
      list_bug("ll_entry_at", failed,
               [] {
                 const ll_list_t list = nothing();
                 void *payload = nullptr;
                 ll_entry_at(&list, 0, &payload);
               }),
      list_bug("ll_copy_list", "Source list failed integrity test.",
               [] {
                 const ll_list_t list = nothing();
                 ll_copy_list(&list, scoped_list_t<i32>().get(), 4);
               }),
      list_bug("ll_copy_list", "Destination list failed integrity test.",
               [] {
                 ll_list_t list = nothing();
                 ll_copy_list(scoped_list_t<i32>().get(), &list, 4);
               }),
  };
}

std::vector<row_t> corrupt_lists() {
  const auto verify_after = [](const std::function<void(ll_list_t *)> &damage) {
    return [damage] {
      with_two_numbers([&](ll_list_t *list) {
        damage(list);
        ll_verify_integrity(list);
      });
    };
  };
  return {
      list_error("ll_verify_integrity", "Corrupt List: The list's head is NULL, but the size isn't zero. Size:2",
                 verify_after([](ll_list_t *list) { list->head = nullptr; })),
      list_error("ll_verify_integrity", "Corrupt List: The list's size is zero, but the head isn't NULL. HeadPtr:PTR",
                 verify_after([](ll_list_t *list) { list->size = 0; })),
      list_bug("ll_verify_integrity", "Corrupt List: An entry's list attribute is set to NULL. Ptr:(nil)",
               verify_after([](ll_list_t *list) { list->head->next->list = nullptr; })),
      list_bug("ll_verify_integrity", "Corrupt List: An entry's type does not match the lists. Count:1",
               verify_after([](ll_list_t *list) { list->head->next->type = 0; })),
      list_error("ll_verify_integrity",
                 "Corrupt List: Either the list's size doesn't match the number of entries. ListSize:2 Counted:3",
                 verify_after([](ll_list_t *list) { list->size = 3; })),
      list_error("ll_verify_integrity",
                 "Corrupt List: Either the list is the wrong size or the final entry is not NULL. Counted=1 Len=1 "
                 "NextPtr=PTR",
                 verify_after([](ll_list_t *list) { list->size = 1; })),
  };
}

std::vector<row_t> refusals() {
  const char *const range = "Index Out of Range: Requesting a value outside the range of the list. Index:";
  // "int" is 0x00746E69; "detailed_timing_t" folds to the word that the library prints.
  const std::string mismatch = " list. List:0x00746E69 Entry:0x*";
  return {
      list_error("ll_entry_at", (std::string(range) + "2 Size:2").c_str(),
                 [] {
                   void *payload = nullptr;
                   with_two_numbers([&](ll_list_t *list) { ll_entry_at(list, 2, &payload); });
                 }),
      list_error("ll_entry_at", (std::string(range) + "-1 Size:2").c_str(),
                 [] {
                   void *payload = nullptr;
                   with_two_numbers([&](ll_list_t *list) { ll_entry_at(list, -1, &payload); });
                 }),
      list_error("ll_delete_entry_at", (std::string(range) + "-1 Size:2").c_str(),
                 [] { with_two_numbers([](ll_list_t *list) { ll_delete_entry_at(list, 0xFFFFFFFF); }); }),
      list_bug("ll_add_entry_to_back",
               ("This entry represents a different type and cannot be added to this" + mismatch).c_str(),
               [] {
                 with_foreign_entry([](ll_entry_t *entry) { ll_add_entry_to_back(scoped_list_t<i32>().get(), entry); });
               }),
      list_bug("ll_add_entry_to_front",
               ("This entry represents a different type and cannot be added tothis" + mismatch).c_str(),
               [] {
                 with_foreign_entry(
                     [](ll_entry_t *entry) { ll_add_entry_to_front(scoped_list_t<i32>().get(), entry); });
               }),
      list_bug("ll_copy_list", "Failed creating entry for the destination list.",
               [] { with_two_numbers([](ll_list_t *list) { ll_copy_list(list, scoped_list_t<i32>().get(), 0); }); }),
      list_bug("ll_copy_list", "Failed adding entry to back of the destination list.",
               [] {
                 with_two_numbers([](ll_list_t *list) { ll_copy_list(list, scoped_list_t<std_timing_t>().get(), 4); });
               }),
  };
}

WALK(ListNullPointers, null_pointers());
WALK(ListCreations, creations());
WALK(ListsNotInitialised, uninitialised_lists());
WALK(ListsCorrupt, corrupt_lists());
WALK(ListRefusals, refusals());

}  // namespace
}  // namespace diagnostics_walk
