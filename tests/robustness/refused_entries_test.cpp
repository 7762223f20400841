// Entries that a list refuses: they are reported and freed again.
#include <gtest/gtest.h>

#include <cstdio>
#include <string>

#include "sample.h"
#include "support/allocation_ledger.h"
#include "support/output_capture.h"
#include "support/records.h"

namespace robustness {
namespace {

using test_support::bytes_t;

// One of a record's four lists holds entries of another type, and what is then said about an entry of its own.
struct refusal_t {
  const char *name;
  ll_list_t edid_t::*list;
  const char *function;
  const char *addition_failed;
};

std::ostream &operator<<(std::ostream &out, const refusal_t &refusal) {
  return out << refusal.name;
}

class RefusedEntry : public testing::TestWithParam<refusal_t> {};

TEST_P(RefusedEntry, IsReportedAndFreed) {
  const refusal_t &refusal = GetParam();
  const bytes_t sink = rich_sink().build();
  const test_support::allocation_ledger_t ledger;
  std::string output;
  char mismatch[160];
  {
    test_support::scoped_edid_t edid;
    ll_list_t &list = *edid.get().*refusal.list;
    const u32 entry_type = list.type;
    EXPECT_TRUE(ll_delete_list(&list));
    EXPECT_TRUE(ll_init(&list, "int"));
    std::snprintf(mismatch, sizeof mismatch,
                  "This entry represents a different type and cannot be added to this list. List:0x00746E69 "
                  "Entry:0x%08X",
                  entry_type);
    output = test_support::output_of([&] {
      if (decode_edid_block_0(sink.data(), edid.get()) == 1) decode_edid_extensions(sink.data() + 128, 128, edid.get());
    });
    EXPECT_EQ(list.size, 0U);
  }
  EXPECT_EQ(ledger.outstanding(), 0);
  const std::string lines = test_support::bug_line("linked_list", "ll_add_entry_to_back", mismatch) +
                            test_support::error_line("edid_decode_encode", refusal.function, refusal.addition_failed);
  EXPECT_EQ(output.substr(0, lines.size()), lines);
  EXPECT_EQ(test_support::count_of(output, "ll_add_entry_to_back() BUG: "), 1) << output;
}

constexpr const char *to_the_back_of_the_list = "Failed adding entry to the back of the list.";

INSTANTIATE_TEST_SUITE_P(Lists, RefusedEntry,
                         testing::Values(refusal_t{"standard timing", &edid_t::std_timings,
                                                   "_decode_edid_standard_timing", to_the_back_of_the_list},
                                         refusal_t{"detailed timing", &edid_t::dtd_list, "_decode_edid_dtd",
                                                   "Failed adding entry to the back."},
                                         refusal_t{"short video descriptor", &edid_t::video_list,
                                                   "decode_edid_extensions", "Failed adding entry to the back."},
                                         refusal_t{"short audio descriptor", &edid_t::audio_list,
                                                   "decode_edid_extensions", to_the_back_of_the_list}));

TEST(RefusedCopy, IsReportedAndFreed) {
  test_support::scoped_list_t<i32> destination;
  test_support::scoped_list_t<std_timing_t> source;
  test_support::append(*source, std_timing_t{1280, 2, 60});
  const test_support::allocation_ledger_t ledger;
  EXPECT_EQ(test_support::count_of(
                test_support::output_of([&] { EXPECT_FALSE(ll_copy_list(source.get(), destination.get(), 12)); }),
                "Failed adding entry to back of the destination list."),
            1);
  EXPECT_EQ(ledger.outstanding(), 0);
}

}  // namespace
}  // namespace robustness
