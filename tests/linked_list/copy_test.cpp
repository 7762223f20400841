// Copying the entries of one list to the back of another.
#include "linked_list/list_fixture.h"
#include "support/failing_allocation.h"

namespace linked_list_tests {
namespace {

using test_support::failing_allocation_t;
using test_support::output_of;

constexpr u32 payload_size = sizeof(i32);

TEST(LinkedListCopy, AppendsCopiesInOrderBehindWhatIsThere) {
  list_of_int_t source{0x01020304, -2, 3};
  list_of_int_t destination{9, 8};
  EXPECT_EQ(output_of([&] { EXPECT_TRUE(ll_copy_list(source.get(), destination.get(), payload_size)); }), "");
  EXPECT_EQ(destination.numbers(), (std::vector<i32>{9, 8, 0x01020304, -2, 3}));
  EXPECT_EQ(ll_size(destination.get()), 5);
  EXPECT_EQ(source.numbers(), (std::vector<i32>{0x01020304, -2, 3}));
  EXPECT_EQ(ll_size(source.get()), 3);
}

TEST(LinkedListCopy, MakesCopiesThatDoNotChangeWithTheSource) {
  list_of_int_t source{1, 2};
  list_of_int_t destination;
  ASSERT_TRUE(ll_copy_list(source.get(), destination.get(), payload_size));
  *static_cast<i32 *>(source->head->data) = 77;
  ASSERT_TRUE(ll_delete_entry_at(source.get(), 1));
  EXPECT_EQ(destination.numbers(), (std::vector<i32>{1, 2}));
  EXPECT_NE(destination->head->data, source->head->data);
  EXPECT_EQ(destination->head->list, destination.get());
}

TEST(LinkedListCopy, OfAnEmptyListLeavesTheDestinationAlone) {
  list_of_int_t source;
  list_of_int_t destination{1};
  const head_copy_t before(*destination.get());
  EXPECT_EQ(output_of([&] {
              EXPECT_TRUE(ll_copy_list(source.get(), destination.get(), payload_size));
              EXPECT_TRUE(ll_copy_list(source.get(), destination.get(), 0));
            }),
            "");
  EXPECT_EQ(head_copy_t(*destination.get()), before);
  EXPECT_EQ(destination.numbers(), (std::vector<i32>{1}));
}

TEST(LinkedListCopy, CopiesExactlyTheGivenNumberOfBytes) {
  list_of_int_t source{0x04030201};
  list_of_int_t destination;
  ASSERT_TRUE(ll_copy_list(source.get(), destination.get(), 2));
  const auto *bytes = static_cast<const u8 *>(destination->head->data);
  EXPECT_EQ(bytes[0], 1);
  EXPECT_EQ(bytes[1], 2);
}

TEST(LinkedListCopy, OntoItselfEndsAndDoublesTheList) {
  list_of_int_t list{1, 2, 3};
  EXPECT_EQ(output_of([&] { EXPECT_TRUE(ll_copy_list(list.get(), list.get(), payload_size)); }), "");
  EXPECT_EQ(list.numbers(), (std::vector<i32>{1, 2, 3, 1, 2, 3}));
  EXPECT_EQ(ll_size(list.get()), 6);
}

TEST(LinkedListCopy, IntoAListOfAnotherTypeFailsAtTheFirstEntry) {
  list_of_int_t source{1, 2};
  ll_list_t destination{};
  ASSERT_TRUE(ll_init(&destination, "abcd"));
  EXPECT_EQ(output_of([&] { EXPECT_FALSE(ll_copy_list(source.get(), &destination, payload_size)); }),
            bug("ll_add_entry_to_back",
                "This entry represents a different type and cannot be added to this list. List:0x64636261 "
                "Entry:0x00746E69") +
                bug("ll_copy_list", "Failed adding entry to back of the destination list."));
  EXPECT_EQ(destination.size, 0u);
  EXPECT_TRUE(ll_delete_list(&destination));
}

TEST(LinkedListCopy, FailsWithASizeThatNoEntryCanHave) {
  list_of_int_t source{1};
  list_of_int_t destination;
  EXPECT_EQ(output_of([&] {
              EXPECT_FALSE(ll_copy_list(source.get(), destination.get(), 0));
              EXPECT_FALSE(ll_copy_list(source.get(), destination.get(), 0x80000000));
            }),
            error("ll_create_entry", "Create entry called with an invalid size. size:0") +
                bug("ll_copy_list", "Failed creating entry for the destination list.") +
                error("ll_create_entry", "Create entry called with an invalid size. size:-2147483648") +
                bug("ll_copy_list", "Failed creating entry for the destination list."));
  EXPECT_EQ(destination->size, 0u);
}

TEST(LinkedListCopy, KeepsTheCopiesMadeBeforeAFailure) {
  list_of_int_t source{1, 2, 3};
  list_of_int_t destination{9};
  const std::string output = output_of([&] {
    const failing_allocation_t failing(4);  // The payload of the second copy.
    EXPECT_FALSE(ll_copy_list(source.get(), destination.get(), payload_size));
    EXPECT_TRUE(failing.happened());
  });
  EXPECT_EQ(output, bug("ll_create_entry", "calloc failed to allocate memory for the data storage. ptr:PTR") +
                        bug("ll_copy_list", "Failed creating entry for the destination list."));
  EXPECT_EQ(destination.numbers(), (std::vector<i32>{9, 1}));
  EXPECT_EQ(ll_size(destination.get()), 2);
}

TEST(LinkedListCopy, ChecksTheSourcePointerThenTheDestinationPointer) {
  list_of_int_t source{1};
  source->size = 2;
  EXPECT_EQ(output_of([&] {
              EXPECT_FALSE(ll_copy_list(nullptr, nullptr, 0));
              EXPECT_FALSE(ll_copy_list(source.get(), nullptr, 0));
            }),
            error("ll_copy_list", "\"src_list\" parameter is NULL. src_list:(nil)") +
                error("ll_copy_list", "\"dst_list\" parameter is NULL. dst_list:(nil)"));
}

TEST(LinkedListCopy, ChecksTheSourceThenTheDestination) {
  list_of_int_t good{1};
  list_of_int_t corrupt;
  corrupt->size = 1;
  const std::string corruption =
      error("ll_verify_integrity", "Corrupt List: The list's head is NULL, but the size isn't zero. Size:1");
  EXPECT_EQ(output_of([&] { EXPECT_FALSE(ll_copy_list(corrupt.get(), corrupt.get(), payload_size)); }),
            corruption + bug("ll_copy_list", "Source list failed integrity test."));
  EXPECT_EQ(output_of([&] { EXPECT_FALSE(ll_copy_list(good.get(), corrupt.get(), payload_size)); }),
            corruption + bug("ll_copy_list", "Destination list failed integrity test."));
}

}  // namespace
}  // namespace linked_list_tests
