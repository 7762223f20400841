// The patterns over lists that the library repeats: the checked walk, and adding and deleting elements.
#include "linked_list/typed_list.h"

#include "linked_list/list_fixture.h"
#include "support/failing_allocation.h"

namespace linked_list_tests {
namespace {

using edid_composer::appender_t;
using edid_composer::entry_arena_t;
using edid_composer::init_list;
using edid_composer::named_list_t;
using edid_composer::new_entry_texts_t;
using edid_composer::site_t;
using edid_composer::unlink_elements;
using edid_composer::walk;
using test_support::failing_allocation_t;
using test_support::output_of;

constexpr site_t reporter{"utility", "_reporter"};
constexpr new_entry_texts_t texts{"No entry.", "Not added."};

named_list_t named(const ll_list_t *list) {
  return {list, "&record->numbers", reporter, 42};
}

std::string reported_error(const std::string &message) {
  return test_support::error_line("utility", "_reporter", message);
}

std::vector<i32> walked(const ll_list_t *list) {
  std::vector<i32> numbers;
  for (const i32 &number : walk<const i32>(named(list)))
    numbers.push_back(number);
  return numbers;
}

TEST(CheckedWalk, VisitsEntriesFrontToBackSilently) {
  list_of_int_t list{4, 5, 6};
  list_of_int_t empty;
  EXPECT_EQ(output_of([&] {
              EXPECT_EQ(walked(list.get()), (std::vector<i32>{4, 5, 6}));
              EXPECT_EQ(walked(empty.get()), std::vector<i32>{});
            }),
            "");
}

TEST(CheckedWalk, LendsEntriesForChanging) {
  list_of_int_t list{4, 5};
  for (i32 &number : walk<i32>(named(list.get())))
    number *= 10;
  EXPECT_EQ(list.numbers(), (std::vector<i32>{40, 50}));
}

TEST(CheckedWalk, ReportsAListOfAnotherTypeAndGoesOn) {
  list_of_int_t list{4, 5};
  list->type = 1;
  EXPECT_EQ(output_of([&] {
              EXPECT_EQ(walked(list.get()), (std::vector<i32>{4, 5}));
            }),
            reported_error("The list types don't match."));
}

TEST(CheckedWalk, NamesANullListByItsExpressionAndType) {
  EXPECT_EQ(output_of([] { EXPECT_EQ(walked(nullptr), std::vector<i32>{}); }),
            error("ll_verify_list_type", "list ptr is NULL.") + reported_error("The list types don't match.") +
                test_support::bug_line("utility", "_reporter", "The list:&record->numbers of type:int is NULL."));
}

TEST(ElementTypes, AreNamedAfterTheirRecords) {
  const auto tag_of = [](auto initialise) {
    ll_list_t list{};
    EXPECT_TRUE(initialise(&list));
    return list;
  };
  ll_list_t list = tag_of(init_list<i32>);
  EXPECT_TRUE(ll_verify_list_type(&list, "int"));
  list = tag_of(init_list<short_video_desc_t>);
  EXPECT_TRUE(ll_verify_list_type(&list, "short_video_desc_t"));
  list = tag_of(init_list<std_timing_t>);
  EXPECT_TRUE(ll_verify_list_type(&list, "std_timing_t"));
  list = tag_of(init_list<detailed_timing_t>);
  EXPECT_TRUE(ll_verify_list_type(&list, "detailed_timing_t"));
  list = tag_of(init_list<short_audio_desc_t>);
  EXPECT_TRUE(ll_verify_list_type(&list, "short_audio_desc_t"));
}

TEST(ElementLookup, IsNullWithTheListsLinesWhenThereIsNone) {
  list_of_int_t list{4, 5};
  EXPECT_EQ(*edid_composer::entry_at<i32>(list.get(), 1), 5);
  EXPECT_NE(output_of([&] { EXPECT_EQ(edid_composer::entry_at<i32>(list.get(), 2), nullptr); }), "");
}

TEST(Appender, AppendsCopiesAtTheEnd) {
  list_of_int_t list{1};
  appender_t<i32> numbers(list.get(), nullptr, reporter);
  EXPECT_EQ(numbers.size(), 1);
  EXPECT_EQ(output_of([&] {
              for (const i32 number : {2, 3, 4})
                EXPECT_TRUE(numbers.append(number));
            }),
            "");
  EXPECT_EQ(list.numbers(), (std::vector<i32>{1, 2, 3, 4}));
  EXPECT_EQ(numbers.size(), 4);
  EXPECT_TRUE(ll_verify_integrity(list.get()));
}

TEST(Appender, ReportsAFailedCreationInItsWordsAndGoesOn) {
  list_of_int_t list;
  appender_t<i32> numbers(list.get(), nullptr, reporter, texts);
  EXPECT_TRUE(numbers.append(1));
  for (const char *part : {"entry", "data storage"}) {
    EXPECT_EQ(output_of([&] {
                const failing_allocation_t failing(part == std::string("entry") ? 1 : 2);
                EXPECT_FALSE(numbers.append(2));
                EXPECT_TRUE(failing.happened());
              }),
              bug("ll_create_entry", std::string("calloc failed to allocate memory for the ") + part + ". ptr:PTR") +
                  reported_error("No entry."));
  }
  EXPECT_TRUE(numbers.append(3));
  EXPECT_EQ(list.numbers(), (std::vector<i32>{1, 3}));
}

TEST(Appender, FreesAnEntryThatTheListRefuses) {
  list_of_int_t list;
  list->type = 1;
  const std::string different = "This entry represents a different type and cannot be added to";
  const std::string types = " list. List:0x00000001 Entry:0x00746E69";
  EXPECT_EQ(output_of([&] { EXPECT_FALSE(appender_t<i32>(list.get(), nullptr, reporter, texts).append(2)); }),
            bug("ll_add_entry_to_back", different + " this" + types) + reported_error("Not added."));
  EXPECT_EQ(output_of([&] { EXPECT_FALSE(appender_t<i32>(list.get(), nullptr, reporter).prepend(2)); }),
            bug("ll_add_entry_to_front", different + "this" + types) +
                reported_error("Failed adding entry to the back of the list."));
  EXPECT_EQ(list->size, 0u);
}

TEST(Appender, PrependsACopyOnDemand) {
  list_of_int_t list{1};
  EXPECT_EQ(output_of([&] { EXPECT_TRUE(appender_t<i32>(list.get(), nullptr, reporter).prepend(2)); }), "");
  EXPECT_EQ(list.numbers(), (std::vector<i32>{2, 1}));
}

TEST(Arena, HoldsEntriesThatAreUnlinkedAndGoWithIt) {
  entry_arena_t arena;
  ll_list_t list{};
  ASSERT_TRUE(init_list<i32>(&list));
  appender_t<i32> numbers(&list, &arena, reporter);
  std::vector<i32> expected;
  for (i32 number = 0; number < 200; ++number) {
    EXPECT_TRUE(numbers.append(number));
    if (number == 0 || number % 2 == 0) expected.push_back(number);
  }
  i32 next_place = 1;
  unlink_elements<i32>(&list, 1, [&](i32 place, const i32 &number) {
    EXPECT_EQ(place, next_place++);
    return number % 2 == 1;
  });
  EXPECT_EQ(test_support::elements_of<i32>(list), expected);
  EXPECT_TRUE(ll_verify_integrity(&list));
}

TEST(Arena, WithoutMemoryLeavesTheListAsItIs) {
  entry_arena_t arena;
  ll_list_t list{};
  ASSERT_TRUE(init_list<i32>(&list));
  appender_t<i32> numbers(&list, &arena, reporter);
  EXPECT_TRUE(numbers.append(1));
  EXPECT_EQ(output_of([&] {
              const failing_allocation_t failing(1);
              i32 kept = 1;
              while (numbers.append(++kept))
                ASSERT_LT(kept, 1000);
              EXPECT_EQ(ll_size(&list), kept - 1);
            }),
            bug("ll_create_entry", "calloc failed to allocate memory for the entry. ptr:PTR") +
                reported_error("Failed creating entry."));
  EXPECT_TRUE(numbers.append(2));
  EXPECT_TRUE(ll_verify_integrity(&list));
}

}  // namespace
}  // namespace linked_list_tests
