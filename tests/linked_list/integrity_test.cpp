// What the list notices when heads and entries are moved, overwritten or wrongly chained.
#include <functional>

#include "linked_list/list_fixture.h"

namespace linked_list_tests {
namespace {

using test_support::output_of;

std::string integrity_error(const std::string &message) {
  return error("ll_verify_integrity", message);
}

std::string integrity_bug(const std::string &message) {
  return bug("ll_verify_integrity", message);
}

/// Expects that the list is refused with exactly this line.
void expect_corrupt(ll_list_t *list, const std::string &line) {
  EXPECT_EQ(output_of([&] { EXPECT_FALSE(ll_verify_integrity(list)); }), line);
}

TEST(LinkedListIntegrity, HoldsForEmptyAndFilledListsSilently) {
  list_of_int_t empty;
  list_of_int_t filled{1, 2, 3};
  EXPECT_EQ(output_of([&] {
              EXPECT_TRUE(ll_verify_integrity(empty.get()));
              EXPECT_TRUE(ll_verify_integrity(filled.get()));
            }),
            "");
}

TEST(LinkedListIntegrity, ReportsNull) {
  expect_corrupt(nullptr, integrity_error("\"list\" parameter is NULL. list:(nil)"));
}

TEST(LinkedListIntegrity, ReportsTheStoredMagicAsExpectedAndTheExpectedAsMagic) {
  ll_list_t list{1234, 0, 56, nullptr};
  expect_corrupt(&list, integrity_error("Corrupt List: List not initialized. Ptr:PTR ExpectedMagic:1234 Magic:" +
                                        printed_magic(&list) + " Size:56 Head:(nil) "));
}

TEST(LinkedListIntegrity, FindsAHeadThatWasCopiedToAnotherAddress) {
  list_of_int_t list{1};
  ll_list_t moved = *list.get();
  const std::string not_initialised =
      integrity_error("Corrupt List: List not initialized. Ptr:PTR ExpectedMagic:" + printed_magic(list.get()) +
                      " Magic:" + printed_magic(&moved) + " Size:1 Head:PTR ");
  EXPECT_EQ(output_of([&] { EXPECT_FALSE(ll_is_initialized(&moved)); }), "");
  expect_corrupt(&moved, not_initialised);

  const free_entry_t entry(2);
  void *payload = nullptr;
  list_of_int_t other;
  const std::vector<std::pair<std::function<bool()>, std::string>> operations{
      {[&] { return ll_size(&moved) != 0; }, bug("ll_size", "Failed integrity test. list:PTR")},
      {[&] { return ll_add_entry_to_back(&moved, entry.get()); },
       bug("ll_add_entry_to_back", "List failed integrity test.")},
      {[&] { return ll_add_entry_to_front(&moved, entry.get()); },
       bug("ll_add_entry_to_front", "List failed integrity test.")},
      {[&] { return ll_entry_at(&moved, 0, &payload); }, bug("ll_entry_at", "List failed integrity test.")},
      {[&] { return ll_delete_entry_at(&moved, 0); }, bug("ll_delete_entry_at", "List failed integrity test.")},
      {[&] { return ll_delete_list(&moved); },
       bug("ll_delete_list", "Failed verifying integrity of the list. list:PTR")},
      {[&] { return ll_copy_list(&moved, other.get(), sizeof(i32)); },
       bug("ll_copy_list", "Source list failed integrity test.")},
      {[&] { return ll_copy_list(other.get(), &moved, sizeof(i32)); },
       bug("ll_copy_list", "Destination list failed integrity test.")},
  };
  for (const auto &[operation, line] : operations) {
    EXPECT_EQ(output_of([&, &refused = operation] { EXPECT_FALSE(refused()); }), not_initialised + line);
  }
  EXPECT_EQ(list.numbers(), (std::vector<i32>{1}));
  EXPECT_TRUE(ll_verify_integrity(list.get()));
}

TEST(LinkedListIntegrity, FindsASizeWithoutEntries) {
  list_of_int_t list;
  list->size = 3;
  expect_corrupt(list.get(), integrity_error("Corrupt List: The list's head is NULL, but the size isn't zero. Size:3"));
}

TEST(LinkedListIntegrity, FindsEntriesWithoutASize) {
  list_of_int_t list{1};
  list->size = 0;
  expect_corrupt(list.get(),
                 integrity_error("Corrupt List: The list's size is zero, but the head isn't NULL. HeadPtr:PTR"));
}

TEST(LinkedListIntegrity, FindsAnEntryInNoListAndPrintsItsNullListField) {
  list_of_int_t list{1, 2, 3};
  list->head->next->list = nullptr;
  expect_corrupt(list.get(), integrity_bug("Corrupt List: An entry's list attribute is set to NULL. Ptr:(nil)"));
}

TEST(LinkedListIntegrity, AcceptsAnEntryThatPointsAtAnotherList) {
  list_of_int_t list{1, 2};
  list_of_int_t other;
  list->head->list = other.get();
  EXPECT_EQ(output_of([&] { EXPECT_TRUE(ll_verify_integrity(list.get())); }), "");
}

TEST(LinkedListIntegrity, FindsAnEntryOfAnotherTypeAndPrintsItsPosition) {
  list_of_int_t list{1, 2, 3};
  list->head->next->next->type = 5;
  expect_corrupt(list.get(), integrity_bug("Corrupt List: An entry's type does not match the lists. Count:2"));
  list->head->type = 5;
  expect_corrupt(list.get(), integrity_bug("Corrupt List: An entry's type does not match the lists. Count:0"));
}

TEST(LinkedListIntegrity, FindsAnOverwrittenTypeInTheHead) {
  list_of_int_t list{1};
  list->type = 0;
  expect_corrupt(list.get(), integrity_bug("Corrupt List: An entry's type does not match the lists. Count:0"));
}

TEST(LinkedListIntegrity, ReportsAnEntrysNullListBeforeItsType) {
  list_of_int_t list{1};
  list->head->list = nullptr;
  list->head->type = 0;
  expect_corrupt(list.get(), integrity_bug("Corrupt List: An entry's list attribute is set to NULL. Ptr:(nil)"));
}

TEST(LinkedListIntegrity, PrintsTheCountedEntriesAsSizeAndTheSizeAsCounted) {
  list_of_int_t list{1, 2};
  list->size = 5;
  expect_corrupt(list.get(),
                 integrity_error(
                     "Corrupt List: Either the list's size doesn't match the number of entries. ListSize:2 Counted:5"));
}

TEST(LinkedListIntegrity, FindsMoreEntriesThanTheSizeSays) {
  list_of_int_t list{1, 2, 3};
  list->size = 2;
  expect_corrupt(list.get(),
                 integrity_error("Corrupt List: Either the list is the wrong size or the final entry is not "
                                 "NULL. Counted=2 Len=2 NextPtr=PTR"));
}

TEST(LinkedListIntegrity, StopsInAListThatBitesItsTail) {
  list_of_int_t list{1, 2};
  ll_entry_t *const last = list->head->next;
  last->next = list->head;
  expect_corrupt(list.get(),
                 integrity_error("Corrupt List: Either the list is the wrong size or the final entry is not "
                                 "NULL. Counted=2 Len=2 NextPtr=PTR"));
  last->next = nullptr;
}

TEST(LinkedListIntegrity, ComparesTheSizeAsASignedNumber) {
  list_of_int_t one{1};
  one->size = 0x80000000;
  expect_corrupt(one.get(), integrity_error("Corrupt List: Either the list's size doesn't match the number of entries. "
                                            "ListSize:1 Counted:-2147483648"));
  list_of_int_t two{1, 2};
  two->size = 0xFFFFFFFF;
  expect_corrupt(two.get(), integrity_error("Corrupt List: Either the list is the wrong size or the final entry is not "
                                            "NULL. Counted=1 Len=-1 NextPtr=PTR"));
}

TEST(LinkedListIntegrity, DoesNotLookAtEntriesBehindTheSize) {
  list_of_int_t list{1, 2};
  list->size = 1;
  list->head->next->list = nullptr;
  list->head->next->type = 0;
  expect_corrupt(list.get(),
                 integrity_error("Corrupt List: Either the list is the wrong size or the final entry is not "
                                 "NULL. Counted=1 Len=1 NextPtr=PTR"));
}

}  // namespace
}  // namespace linked_list_tests
