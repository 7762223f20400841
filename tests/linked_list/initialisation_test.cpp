// Heads: initialising, recognising and deleting them, and the tags and magic numbers that they carry.
#include <array>
#include <cstring>

#include "linked_list/integrity.h"
#include "linked_list/linked_list.h"
#include "linked_list/list_fixture.h"
#include "support/patterns.h"

namespace linked_list_tests {
namespace {

using edid_composer::_calculate_str_checksum;
using edid_composer::_get_magic_number;
using test_support::output_of;

TEST(LinkedListInit, MakesAnEmptyListWithMagicAndTag) {
  ll_list_t list{};
  EXPECT_EQ(output_of([&] { EXPECT_TRUE(ll_init(&list, "int")); }), "");
  EXPECT_EQ(std::to_string(static_cast<i32>(list.magic)), printed_magic(&list));
  EXPECT_EQ(list.type, 0x00746E69u);
  EXPECT_EQ(list.size, 0u);
  EXPECT_EQ(list.head, nullptr);
  EXPECT_EQ(ll_size(&list), 0);
}

TEST(LinkedListInit, RefusesSecondInitialisationAndKeepsEntries) {
  list_of_int_t list{7, 8};
  const head_copy_t before(*list.get());
  EXPECT_EQ(output_of([&] { EXPECT_FALSE(ll_init(list.get(), "std_timing_t")); }),
            error("ll_init", "List Corruption: This list has already been initialized. Ptr:PTR MagicNum:" +
                                 printed_magic(list.get())));
  EXPECT_EQ(head_copy_t(*list.get()), before);
  EXPECT_EQ(list.numbers(), (std::vector<i32>{7, 8}));
}

TEST(LinkedListInit, AcceptsAHeadFullOfGarbage) {
  ll_list_t list{};
  std::memset(static_cast<void *>(&list), 0xAB, sizeof(list));
  EXPECT_EQ(output_of([&] { EXPECT_TRUE(ll_init(&list, "int")); }), "");
  EXPECT_EQ(list.head, nullptr);
  EXPECT_EQ(ll_size(&list), 0);
}

TEST(LinkedListInit, ReportsANullHeadBeforeANullName) {
  EXPECT_EQ(output_of([] { EXPECT_FALSE(ll_init(nullptr, nullptr)); }), error("ll_init", "list ptr is NULL."));
}

TEST(LinkedListInit, ReportsANullNameAndLeavesTheHeadAlone) {
  ll_list_t list{1, 2, 3, nullptr};
  const head_copy_t before(list);
  EXPECT_EQ(output_of([&] { EXPECT_FALSE(ll_init(&list, nullptr)); }),
            error("ll_init", "\"type\" ptr is NULL. type=(nil)"));
  EXPECT_EQ(head_copy_t(list), before);
}

TEST(LinkedListInit, ReportsANullNameBeforeASecondInitialisation) {
  list_of_int_t list;
  EXPECT_EQ(output_of([&] { EXPECT_FALSE(ll_init(list.get(), nullptr)); }),
            error("ll_init", "\"type\" ptr is NULL. type=(nil)"));
}

TEST(LinkedListInit, TakesAnotherTypeAfterDeletion) {
  ll_list_t list{};
  ASSERT_TRUE(ll_init(&list, "int"));
  ASSERT_TRUE(ll_delete_list(&list));
  EXPECT_TRUE(ll_init(&list, "std_timing_t"));
  EXPECT_TRUE(ll_verify_list_type(&list, "std_timing_t"));
  EXPECT_FALSE(ll_verify_list_type(&list, "int"));
}

TEST(LinkedListTag, IsZeroForTheEmptyName) {
  EXPECT_EQ(_calculate_str_checksum(""), 0u);
}

TEST(LinkedListTag, PacksFourBytesLittleEndian) {
  EXPECT_EQ(_calculate_str_checksum("int"), 0x00746E69u);
  EXPECT_EQ(_calculate_str_checksum("abcd"), 0x64636261u);
}

TEST(LinkedListTag, XorsTheFifthByteIntoTheLowByteAgain) {
  EXPECT_EQ(_calculate_str_checksum("abcda"), 0x64636200u);
  EXPECT_EQ(_calculate_str_checksum("abcdab"), 0x64630000u);
  EXPECT_EQ(_calculate_str_checksum("abcdefgha"), 0x0C040404u ^ 0x61u);
}

TEST(LinkedListTag, SignExtendsBytesFromHalfTheRangeOn) {
  EXPECT_EQ(_calculate_str_checksum("\x80"), 0xFFFFFF80u);
  EXPECT_EQ(_calculate_str_checksum("a\xFF"), 0xFFFFFF61u);
  EXPECT_EQ(_calculate_str_checksum("a\x80"), 0xFFFF8061u);
  EXPECT_EQ(_calculate_str_checksum("abc\x80"), 0x80636261u);
}

TEST(LinkedListTag, LetsDifferentNamesCollide) {
  ll_list_t list{};
  ASSERT_TRUE(ll_init(&list, "abcdefgh"));
  EXPECT_TRUE(ll_verify_list_type(&list, "efghabcd"));
}

TEST(LinkedListMagic, IsTheAddressUnderAKey) {
  const std::array<ll_list_t, 2> lists{};
  EXPECT_EQ(std::to_string(static_cast<i32>(_get_magic_number(&lists[0]))), printed_magic(&lists[0]));
  EXPECT_NE(_get_magic_number(&lists[0]), _get_magic_number(&lists[1]));
}

TEST(LinkedListMagic, IsZeroForNullWhichIsReported) {
  EXPECT_EQ(output_of([] { EXPECT_EQ(_get_magic_number(nullptr), 0u); }),
            error("_get_magic_number", "list ptr is NULL."));
}

TEST(LinkedListIsInitialized, LooksAtTheMagicOnly) {
  list_of_int_t list{1};
  list->size = 17;
  list->type = 0;
  EXPECT_EQ(output_of([&] { EXPECT_TRUE(ll_is_initialized(list.get())); }), "");
}

TEST(LinkedListIsInitialized, IsFalseForAZeroedAndForADeletedHead) {
  ll_list_t list{};
  EXPECT_EQ(output_of([&] { EXPECT_FALSE(ll_is_initialized(&list)); }), "");
  ASSERT_TRUE(ll_init(&list, "int"));
  EXPECT_TRUE(ll_is_initialized(&list));
  ASSERT_TRUE(ll_delete_list(&list));
  EXPECT_FALSE(ll_is_initialized(&list));
}

TEST(LinkedListIsInitialized, ReportsNullOnce) {
  EXPECT_EQ(output_of([] { EXPECT_FALSE(ll_is_initialized(nullptr)); }),
            error("ll_is_initialized", "list ptr is NULL."));
}

TEST(LinkedListVerifyListType, ComparesTagsSilently) {
  list_of_int_t list{1};
  EXPECT_EQ(output_of([&] {
              EXPECT_TRUE(ll_verify_list_type(list.get(), "int"));
              EXPECT_FALSE(ll_verify_list_type(list.get(), "std_timing_t"));
            }),
            "");
}

TEST(LinkedListVerifyListType, DoesNotCheckTheIntegrity) {
  list_of_int_t list{1};
  list->size = 2;
  list->magic = 0;
  EXPECT_EQ(output_of([&] { EXPECT_TRUE(ll_verify_list_type(list.get(), "int")); }), "");
}

TEST(LinkedListVerifyListType, ReportsANullHeadBeforeANullName) {
  list_of_int_t list;
  EXPECT_EQ(output_of([] { EXPECT_FALSE(ll_verify_list_type(nullptr, nullptr)); }),
            error("ll_verify_list_type", "list ptr is NULL."));
  EXPECT_EQ(output_of([&] { EXPECT_FALSE(ll_verify_list_type(list.get(), nullptr)); }),
            error("ll_verify_list_type", "\"type\" ptr is NULL. type=(nil)"));
}

TEST(LinkedListSize, CountsEntries) {
  list_of_int_t list{1, 2, 3};
  EXPECT_EQ(output_of([&] { EXPECT_EQ(ll_size(list.get()), 3); }), "");
}

TEST(LinkedListSize, ReportsNullAsOneLineWithModuleLineAndFunction) {
  EXPECT_EQ(output_of([] { EXPECT_EQ(ll_size(nullptr), 0); }), "linked_list:N:ll_size() ERROR: list ptr is NULL.\n");
  const std::string raw = test_support::raw_output_of([] { ll_size(nullptr); });
  EXPECT_TRUE(test_support::matches(raw, "linked_list:[1-9][0-9]*:ll_size\\(\\) ERROR: list ptr is NULL\\.\n")) << raw;
}

TEST(LinkedListDeleteList, FreesEntriesAndLeavesTheTypeOnly) {
  ll_list_t list{};
  ASSERT_TRUE(ll_init(&list, "int"));
  test_support::append_to<i32>(list, "int", 1);
  test_support::append_to<i32>(list, "int", 2);
  EXPECT_EQ(output_of([&] { EXPECT_TRUE(ll_delete_list(&list)); }), "");
  EXPECT_EQ(list.magic, 0u);
  EXPECT_EQ(list.type, 0x00746E69u);
  EXPECT_EQ(list.size, 0u);
  EXPECT_EQ(list.head, nullptr);
}

TEST(LinkedListDeleteList, OfAnEmptyListMakesItUninitialised) {
  ll_list_t list{};
  ASSERT_TRUE(ll_init(&list, "int"));
  const std::string magic = printed_magic(&list);
  EXPECT_EQ(output_of([&] { EXPECT_TRUE(ll_delete_list(&list)); }), "");
  EXPECT_EQ(list.magic, 0u);
  EXPECT_EQ(output_of([&] { EXPECT_EQ(ll_size(&list), 0); }),
            error("ll_verify_integrity", "Corrupt List: List not initialized. Ptr:PTR ExpectedMagic:0 Magic:" + magic +
                                             " Size:0 Head:(nil) ") +
                bug("ll_size", "Failed integrity test. list:PTR"));
}

TEST(LinkedListDeleteList, ReportsNull) {
  EXPECT_EQ(output_of([] { EXPECT_FALSE(ll_delete_list(nullptr)); }), error("ll_delete_list", "list ptr is NULL."));
}

TEST(LinkedListDeleteList, RefusesACorruptListAndDeletesNothing) {
  list_of_int_t list{1, 2};
  list->size = 3;
  EXPECT_EQ(output_of([&] { EXPECT_FALSE(ll_delete_list(list.get())); }),
            error("ll_verify_integrity",
                  "Corrupt List: Either the list's size doesn't match the number of entries. ListSize:2 Counted:3") +
                bug("ll_delete_list", "Failed verifying integrity of the list. list:PTR"));
  EXPECT_EQ(list.numbers(), (std::vector<i32>{1, 2}));
  EXPECT_TRUE(ll_is_initialized(list.get()));
}

}  // namespace
}  // namespace linked_list_tests
