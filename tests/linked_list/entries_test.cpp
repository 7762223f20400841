// Creating and deleting entries, and putting them into lists and taking them out by position.
#include <array>
#include <climits>
#include <cstring>

#include "linked_list/list_fixture.h"
#include "support/failing_allocation.h"

namespace linked_list_tests {
namespace {

using test_support::failing_allocation_t;
using test_support::output_of;

TEST(LinkedListCreateEntry, GivesAZeroFilledEntryAndPayloadInNoList) {
  ll_entry_t *entry = nullptr;
  void *payload = nullptr;
  EXPECT_EQ(output_of([&] { EXPECT_TRUE(ll_create_entry(100, &entry, &payload, "int")); }), "");
  ASSERT_NE(entry, nullptr);
  EXPECT_EQ(entry->data, payload);
  EXPECT_EQ(entry->next, nullptr);
  EXPECT_EQ(entry->list, nullptr);
  EXPECT_EQ(entry->type, 0x00746E69u);
  const std::array<u8, 100> zeroes{};
  EXPECT_EQ(std::memcmp(payload, zeroes.data(), zeroes.size()), 0);
  EXPECT_EQ(output_of([&] { EXPECT_TRUE(ll_delete_entry(entry)); }), "");
}

TEST(LinkedListCreateEntry, TakesTheEmptyName) {
  const free_entry_t entry(1, "");
  EXPECT_EQ(entry.get()->type, 0u);
}

TEST(LinkedListCreateEntry, RefusesSizesBelowOne) {
  ll_entry_t *entry = nullptr;
  void *payload = nullptr;
  EXPECT_EQ(output_of([&] {
              EXPECT_FALSE(ll_create_entry(0, &entry, &payload, "int"));
              EXPECT_FALSE(ll_create_entry(INT_MIN, &entry, &payload, "int"));
            }),
            error("ll_create_entry", "Create entry called with an invalid size. size:0") +
                error("ll_create_entry", "Create entry called with an invalid size. size:-2147483648"));
}

TEST(LinkedListCreateEntry, ChecksSizeThenEntryThenPayloadThenType) {
  ll_entry_t *entry = nullptr;
  void *payload = nullptr;
  EXPECT_EQ(output_of([&] {
              EXPECT_FALSE(ll_create_entry(0, nullptr, nullptr, nullptr));
              EXPECT_FALSE(ll_create_entry(1, nullptr, nullptr, nullptr));
              EXPECT_FALSE(ll_create_entry(1, &entry, nullptr, nullptr));
              EXPECT_FALSE(ll_create_entry(1, &entry, &payload, nullptr));
            }),
            error("ll_create_entry", "Create entry called with an invalid size. size:0") +
                error("ll_create_entry", "\"entry\" pointer is NULL. entry:(nil)") +
                error("ll_create_entry", "\"data\" pointer is NULL. data:(nil)") +
                error("ll_create_entry", "\"type\" pointer is NULL. type:(nil)"));
}

TEST(LinkedListCreateEntry, ReportsAFailedAllocationOfTheEntry) {
  ll_entry_t *entry = nullptr;
  void *payload = nullptr;
  const std::string output = output_of([&] {
    const failing_allocation_t failing(1);
    EXPECT_FALSE(ll_create_entry(4, &entry, &payload, "int"));
    EXPECT_TRUE(failing.happened());
  });
  EXPECT_EQ(output, bug("ll_create_entry", "calloc failed to allocate memory for the entry. ptr:PTR"));
}

TEST(LinkedListCreateEntry, ReportsAFailedAllocationOfThePayloadAndLeaksNothing) {
  ll_entry_t *entry = nullptr;
  void *payload = nullptr;
  const std::string output = output_of([&] {
    const failing_allocation_t failing(2);
    EXPECT_FALSE(ll_create_entry(4, &entry, &payload, "int"));
    EXPECT_TRUE(failing.happened());
  });
  EXPECT_EQ(output, bug("ll_create_entry", "calloc failed to allocate memory for the data storage. ptr:PTR"));
}

TEST(LinkedListDeleteEntry, ReportsNull) {
  EXPECT_EQ(output_of([] { EXPECT_FALSE(ll_delete_entry(nullptr)); }),
            error("ll_delete_entry", "\"delete_entry\" parameter is NULL. delete_entry:(nil)"));
}

/// Appending and prepending make the same checks.
struct addition_t {
  const char *name;
  bool (*add)(ll_list_t *list, ll_entry_t *entry);
  const char *mismatch;
};

std::ostream &operator<<(std::ostream &out, const addition_t &addition) {
  return out << addition.name;
}

class LinkedListAdd : public testing::TestWithParam<addition_t> {};

TEST_P(LinkedListAdd, TakesAnEntryIntoAnEmptyList) {
  list_of_int_t list;
  free_entry_t entry(5);
  EXPECT_EQ(output_of([&] { EXPECT_TRUE(GetParam().add(list.get(), entry.get())); }), "");
  EXPECT_EQ(list->head, entry.get());
  EXPECT_EQ(entry.get()->list, list.get());
  EXPECT_EQ(entry.get()->next, nullptr);
  EXPECT_EQ(list->size, 1u);
  entry.release();
}

TEST_P(LinkedListAdd, RefusesAnEntryOfAnotherTypeWhichStaysTheCallers) {
  list_of_int_t list{1};
  const head_copy_t before(*list.get());
  const free_entry_t entry(5, "short_video_desc_t");
  EXPECT_EQ(entry.get()->type, 0x27054358u);
  EXPECT_EQ(output_of([&] { EXPECT_FALSE(GetParam().add(list.get(), entry.get())); }),
            bug(GetParam().name, std::string(GetParam().mismatch) + " List:0x00746E69 Entry:0x27054358"));
  EXPECT_EQ(head_copy_t(*list.get()), before);
  EXPECT_EQ(list.numbers(), (std::vector<i32>{1}));
  EXPECT_EQ(entry.get()->list, nullptr);
}

TEST_P(LinkedListAdd, ReportsANullListBeforeANullEntry) {
  EXPECT_EQ(output_of([] { EXPECT_FALSE(GetParam().add(nullptr, nullptr)); }),
            error(GetParam().name, "\"list\" parameter is NULL. list:(nil)"));
}

TEST_P(LinkedListAdd, ReportsACorruptListBeforeANullEntry) {
  list_of_int_t list;
  list->size = 1;
  EXPECT_EQ(output_of([&] { EXPECT_FALSE(GetParam().add(list.get(), nullptr)); }),
            error("ll_verify_integrity", "Corrupt List: The list's head is NULL, but the size isn't zero. Size:1") +
                bug(GetParam().name, "List failed integrity test."));
}

TEST_P(LinkedListAdd, ReportsANullEntry) {
  list_of_int_t list{1};
  EXPECT_EQ(output_of([&] { EXPECT_FALSE(GetParam().add(list.get(), nullptr)); }),
            error(GetParam().name, "\"new_entry\" parameter is NULL. new_entry:(nil)"));
  EXPECT_EQ(list.numbers(), (std::vector<i32>{1}));
}

INSTANTIATE_TEST_SUITE_P(
    BackAndFront, LinkedListAdd,
    testing::Values(addition_t{"ll_add_entry_to_back", ll_add_entry_to_back,
                               "This entry represents a different type and cannot be added to this list."},
                    addition_t{"ll_add_entry_to_front", ll_add_entry_to_front,
                               "This entry represents a different type and cannot be added tothis list."}),
    [](const testing::TestParamInfo<addition_t> &tested) { return std::string(tested.param.name); });

TEST(LinkedListAddToBack, KeepsTheOrderOfAdding) {
  list_of_int_t list;
  for (const i32 number : {3, 1, 2}) {
    free_entry_t entry(number);
    ASSERT_TRUE(ll_add_entry_to_back(list.get(), entry.get()));
    entry.release();
  }
  EXPECT_EQ(list.numbers(), (std::vector<i32>{3, 1, 2}));
  EXPECT_EQ(ll_size(list.get()), 3);
}

TEST(LinkedListAddToFront, ReversesTheOrderOfAdding) {
  list_of_int_t list;
  for (const i32 number : {3, 1, 2}) {
    free_entry_t entry(number);
    ASSERT_TRUE(ll_add_entry_to_front(list.get(), entry.get()));
    entry.release();
  }
  EXPECT_EQ(list.numbers(), (std::vector<i32>{2, 1, 3}));
  EXPECT_EQ(ll_size(list.get()), 3);
}

TEST(LinkedListAddToBack, NeitherTouchesTheEntrysNextNorChecksAfterwards) {
  list_of_int_t list{1};
  free_entry_t first(2);
  free_entry_t second(3);
  first.get()->next = second.get();
  EXPECT_EQ(output_of([&] { EXPECT_TRUE(ll_add_entry_to_back(list.get(), first.get())); }), "");
  EXPECT_EQ(first.get()->next, second.get());
  EXPECT_EQ(list->size, 2u);
  first.release();
  second.release();
}

TEST(LinkedListAddToFront, OverwritesTheEntrysNext) {
  list_of_int_t list{1};
  free_entry_t first(2);
  const free_entry_t second(3);
  first.get()->next = second.get();
  EXPECT_EQ(output_of([&] { EXPECT_TRUE(ll_add_entry_to_front(list.get(), first.get())); }), "");
  first.release();
  EXPECT_EQ(list.numbers(), (std::vector<i32>{2, 1}));
}

TEST(LinkedListEntryAt, LendsThePayloadAtEachPosition) {
  list_of_int_t list{10, 11, 12};
  for (i32 index = 0; index < 3; ++index) {
    void *payload = nullptr;
    EXPECT_EQ(output_of([&] { EXPECT_TRUE(ll_entry_at(list.get(), index, &payload)); }), "");
    ASSERT_NE(payload, nullptr);
    EXPECT_EQ(*static_cast<i32 *>(payload), 10 + index);
    *static_cast<i32 *>(payload) += 10;
  }
  EXPECT_EQ(list.numbers(), (std::vector<i32>{20, 21, 22}));
}

TEST(LinkedListEntryAt, RefusesPositionsOutsideTheListAndClearsTheOutput) {
  list_of_int_t list{10, 11};
  for (const i32 index : {-1, 2, INT_MAX, INT_MIN}) {
    i32 other = 0;
    void *payload = &other;
    EXPECT_EQ(output_of([&] { EXPECT_FALSE(ll_entry_at(list.get(), index, &payload)); }),
              error("ll_entry_at", "Index Out of Range: Requesting a value outside the range of the list. Index:" +
                                       std::to_string(index) + " Size:2"));
    EXPECT_EQ(payload, nullptr);
  }
}

TEST(LinkedListEntryAt, HasNoPositionZeroInAnEmptyList) {
  list_of_int_t list;
  void *payload = nullptr;
  EXPECT_EQ(
      output_of([&] { EXPECT_FALSE(ll_entry_at(list.get(), 0, &payload)); }),
      error("ll_entry_at", "Index Out of Range: Requesting a value outside the range of the list. Index:0 Size:0"));
}

TEST(LinkedListEntryAt, ChecksTheOutputFirst) {
  EXPECT_EQ(output_of([] { EXPECT_FALSE(ll_entry_at(nullptr, -1, nullptr)); }),
            error("ll_entry_at", "\"entry_data\" parameter is NULL. entry_data:(nil)"));
}

TEST(LinkedListEntryAt, ClearsTheOutputBeforeItChecksTheList) {
  i32 other = 0;
  void *payload = &other;
  EXPECT_EQ(output_of([&] { EXPECT_FALSE(ll_entry_at(nullptr, -1, &payload)); }),
            error("ll_entry_at", "\"list\" parameter is NULL. list:(nil)"));
  EXPECT_EQ(payload, nullptr);
}

TEST(LinkedListEntryAt, ChecksTheIntegrityBeforeTheRange) {
  list_of_int_t list{10};
  list->size = 2;
  i32 other = 0;
  void *payload = &other;
  EXPECT_EQ(output_of([&] { EXPECT_FALSE(ll_entry_at(list.get(), 5, &payload)); }),
            error("ll_verify_integrity",
                  "Corrupt List: Either the list's size doesn't match the number of entries. ListSize:1 Counted:2") +
                bug("ll_entry_at", "List failed integrity test."));
  EXPECT_EQ(payload, nullptr);
}

TEST(LinkedListDeleteEntryAt, UnlinksFirstMiddleAndLast) {
  list_of_int_t list{1, 2, 3, 4, 5};
  EXPECT_EQ(output_of([&] {
              EXPECT_TRUE(ll_delete_entry_at(list.get(), 0));
              EXPECT_EQ(list.numbers(), (std::vector<i32>{2, 3, 4, 5}));
              EXPECT_TRUE(ll_delete_entry_at(list.get(), 1));
              EXPECT_EQ(list.numbers(), (std::vector<i32>{2, 4, 5}));
              EXPECT_TRUE(ll_delete_entry_at(list.get(), 2));
              EXPECT_EQ(list.numbers(), (std::vector<i32>{2, 4}));
              EXPECT_EQ(ll_size(list.get()), 2);
            }),
            "");
}

TEST(LinkedListDeleteEntryAt, LeavesAnEmptyInitialisedListBehindTheOnlyEntry) {
  list_of_int_t list{1};
  EXPECT_TRUE(ll_delete_entry_at(list.get(), 0));
  EXPECT_EQ(list->head, nullptr);
  EXPECT_EQ(ll_size(list.get()), 0);
  EXPECT_TRUE(ll_is_initialized(list.get()));
}

TEST(LinkedListDeleteEntryAt, TakesMinusOneAsAHugePosition) {
  list_of_int_t list{1, 2};
  EXPECT_EQ(output_of([&] { EXPECT_FALSE(ll_delete_entry_at(list.get(), static_cast<u32>(-1))); }),
            error("ll_delete_entry_at",
                  "Index Out of Range: Requesting a value outside the range of the list. Index:-1 Size:2"));
  EXPECT_EQ(list.numbers(), (std::vector<i32>{1, 2}));
}

TEST(LinkedListDeleteEntryAt, RefusesThePositionBehindTheLast) {
  list_of_int_t list{1, 2};
  EXPECT_EQ(output_of([&] { EXPECT_FALSE(ll_delete_entry_at(list.get(), 2)); }),
            error("ll_delete_entry_at",
                  "Index Out of Range: Requesting a value outside the range of the list. Index:2 Size:2"));
}

TEST(LinkedListDeleteEntryAt, ReportsNull) {
  EXPECT_EQ(output_of([] { EXPECT_FALSE(ll_delete_entry_at(nullptr, 5)); }),
            error("ll_delete_entry_at", "\"list\" parameter is NULL. list:(nil)"));
}

TEST(LinkedListDeleteEntryAt, ChecksTheIntegrityBeforeTheRange) {
  list_of_int_t list{1};
  list->size = 2;
  EXPECT_EQ(output_of([&] { EXPECT_FALSE(ll_delete_entry_at(list.get(), 7)); }),
            error("ll_verify_integrity",
                  "Corrupt List: Either the list's size doesn't match the number of entries. ListSize:1 Counted:2") +
                bug("ll_delete_entry_at", "List failed integrity test."));
  EXPECT_EQ(list.numbers(), (std::vector<i32>{1}));
}

}  // namespace
}  // namespace linked_list_tests
