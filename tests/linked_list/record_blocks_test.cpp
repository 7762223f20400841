// Records that a composition keeps for itself.
#include "linked_list/record_blocks.h"

#include "linked_list/list_fixture.h"
#include "support/failing_allocation.h"

namespace linked_list_tests {
namespace {

using edid_composer::entry_arena_t;
using edid_composer::record_blocks_t;
using edid_composer::site_t;
using test_support::failing_allocation_t;
using test_support::output_of;

constexpr site_t reporter{"utility", "_reporter"};
constexpr i32 several_blocks = 1000;

class RecordBlocks : public testing::Test {
 protected:
  std::vector<i32> forwards() const {
    std::vector<i32> numbers;
    for (const i32 &number : records_)
      numbers.push_back(number);
    return numbers;
  }
  std::vector<i32> backwards() const {
    std::vector<i32> numbers;
    records_.visit_backwards([&](i32 &number) { numbers.push_back(number); });
    return numbers;
  }

  entry_arena_t arena_;
  record_blocks_t<i32> records_{&arena_};
};

TEST_F(RecordBlocks, AreEmptyAtFirst) {
  EXPECT_EQ(forwards(), std::vector<i32>{});
  EXPECT_EQ(backwards(), std::vector<i32>{});
}

TEST_F(RecordBlocks, KeepTheirOrderAndTheirAddresses) {
  std::vector<i32 *> addresses;
  std::vector<i32> numbers;
  for (i32 number = 0; number < several_blocks; ++number) {
    addresses.push_back(records_.add(number, reporter));
    numbers.push_back(number);
    ASSERT_NE(addresses.back(), nullptr);
    if (number % 97 == 0) {
      ASSERT_EQ(forwards(), numbers);
    }
  }
  for (i32 number = 0; number < several_blocks; ++number)
    ASSERT_EQ(*addresses[static_cast<std::size_t>(number)], number);
  EXPECT_EQ(forwards(), numbers);
  EXPECT_EQ(backwards(), std::vector<i32>(numbers.rbegin(), numbers.rend()));
}

TEST_F(RecordBlocks, WithoutMemoryKeepWhatTheyHaveAndGoOnLater) {
  i32 kept = 0;
  EXPECT_EQ(output_of([&] {
              const failing_allocation_t failing(3);
              while (records_.add(kept, reporter) != nullptr)
                ASSERT_LT(++kept, several_blocks);
              EXPECT_TRUE(failing.happened());
            }),
            bug("ll_create_entry", "calloc failed to allocate memory for the entry. ptr:PTR") +
                test_support::error_line("utility", "_reporter", "Failed creating entry."));
  EXPECT_EQ(forwards().size(), static_cast<std::size_t>(kept));
  EXPECT_NE(records_.add(-1, reporter), nullptr);
  EXPECT_EQ(backwards().size(), static_cast<std::size_t>(kept) + 1);
  EXPECT_EQ(backwards().front(), -1);
}

}  // namespace
}  // namespace linked_list_tests
