// What is said and done when a call fails that its caller has made sure of. A failure that cannot happen is still not
// taken for success, and what was made until then is released.
#include <gtest/gtest.h>

#include <array>
#include <optional>
#include <string>
#include <vector>

#include "composition_table.h"
#include "failing_call.h"
#include "support/allocation_ledger.h"
#include "support/output_capture.h"
#include "support/patterns.h"

namespace robustness {
namespace {

using test_support::bug_line;
using test_support::bytes_t;
using test_support::error_line;
using test_support::output_of;
using test_support::warning_line;

/// The diagnostics, and what became of the composition.
struct outcome_t {
  std::string lines;
  std::string result;

  bool operator==(const outcome_t &) const = default;
};

std::ostream &operator<<(std::ostream &out, const outcome_t &outcome) {
  return out << outcome.lines << "-> " << outcome.result << '\n';
}

constexpr const char *refused = "refused";
constexpr const char *as_always = "as always";
constexpr const char *otherwise = "composed otherwise";

std::string compose_error(const std::string &message) {
  return error_line("edid_composer", "compose_edid_internal", message);
}

std::string selection_error(const std::string &message) {
  return error_line("edid_composer", "_filter_video_modes", message) +
         compose_error("Failed filtering the video modes.");
}

std::string encoding_error(const std::string &message) {
  return error_line("edid_decode_encode", "encode_edid", message) + compose_error("Failed encoding the new edid.");
}

std::string preparation_error(const std::string &message, const std::string &record) {
  return error_line("edid_decode_encode", "edid_prepare", message) + compose_error("Failed preparing " + record + ".");
}

std::string missing_list(const std::string &list, const std::string &record) {
  return error_line("edid_decode_encode", "edid_destroy", "List is not initialized. List:" + list + ".") +
         compose_error("Failed cleaning up " + record + ".");
}

std::string deletion_of_an_unprepared_list() {
  return error_line("linked_list", "ll_verify_integrity",
                    "Corrupt List: List not initialized. Ptr:PTR ExpectedMagic:0 Magic:M Size:0 Head:(nil) ") +
         bug_line("linked_list", "ll_delete_list", "Failed verifying integrity of the list. list:PTR");
}

std::string clean_up_without_modes() {
  return missing_list("standard_timing_list", "new_edid") + deletion_of_an_unprepared_list() +
         compose_error("Failed cleaning up video list.");
}

const std::array<std::string, 4> names_at_destruction{"standard_timing_list", "detailed_timing_list",
                                                      "short_video_description_timing_list",
                                                      "short_audio_description_timing_list"};
const std::array<std::string, 4> record_lists{"standard_timing_list", "detailed_timing_list",
                                              "short_video_description_list", "short_audio_description_list"};
const std::array<std::string, 6> platform_lists{"audio_list",        "video_50_priority",   "video_50_additional",
                                                "video_60_priority", "video_60_additional", "standard timings"};

// The computed magic of a list depends on where it lies.
std::string without_magic(const std::string &text) {
  return test_support::replaced(text, " Magic:-?[0-9]+ ", " Magic:M ");
}

class FailingCall : public testing::Test {
 protected:
  FailingCall() {
    test_support::platform_configuration_t configuration = rich_configuration();
    configuration.geometry_limit = 1;
    configuration.write_to(values_.get());
    settings_.audio_mask = 0x2;
    sample_sink_t sink = rich_sink();
    // 3D: one structure for all modes, and one each for the second and the first.
    sink.hdmi = {0x10, 0x00, 0xB8, 45, 0xA0, 11, 6, 0xA0, 0x05, 0x00, 0x01, 0x18, 0x00, 0x06};
    sink_ = sink.build();
    EXPECT_EQ(output_of([&] { whole_ = composed(); }), "");
    EXPECT_NE(whole_, "refused\n");
  }

  /// Lets each of the calls that a composition makes of @p operation fail, one at a time. Outcomes that differ in
  /// nothing but numbers, one behind the other, stand once, as the first of them was.
  std::vector<outcome_t> outcomes(operation_name_t operation) { return outcomes(operation, output_of); }

  /// As above, with tracing on, without the traces.
  std::vector<outcome_t> traced_outcomes(operation_name_t operation) {
    return outcomes(operation, traced_diagnostics_of);
  }

  /// What comes of a failure of the @p nth call; nothing when there are not as many.
  std::optional<outcome_t> outcome_of(operation_name_t operation, int nth) {
    return outcome_of(operation, nth, output_of);
  }

 private:
  std::string composed() { return words_of(test_support::compose(sink_, settings_, values_.get())); }

  template <typename capture_t>
  std::optional<outcome_t> outcome_of(operation_name_t operation, int nth, const capture_t &capture) {
    bool happened = false;
    std::string words;
    const test_support::allocation_ledger_t ledger;
    const std::string output = without_magic(capture([&] {
      const failing_call_t failing(operation, nth);
      words = composed();
      happened = failing.happened();
    }));
    EXPECT_EQ(ledger.outstanding(), 0) << nth << ": " << output;
    if (!happened) return std::nullopt;
    return outcome_t{output, words == "refused\n" ? refused : words == whole_ ? as_always : otherwise};
  }

  template <typename capture_t>
  std::vector<outcome_t> outcomes(operation_name_t operation, const capture_t &capture) {
    std::vector<outcome_t> result;
    std::string last;
    for (int nth = 1;; ++nth) {
      const std::optional<outcome_t> outcome = outcome_of(operation, nth, capture);
      if (!outcome) return result;
      const std::string kind = test_support::replaced(outcome->lines, "[0-9]+", "#") + outcome->result;
      if (kind != last) result.push_back(*outcome);
      last = kind;
    }
  }

  test_support::scoped_values_t values_;
  bytes_t sink_;
  compose_cfg_t settings_ = rich_settings();
  std::string whole_;
};

TEST_F(FailingCall, OfListInitialisationIsRefused) {
  std::vector<outcome_t> expected;
  for (const std::string &list : platform_lists) {
    expected.push_back(
        {bug_line("utility", "platform_values_init", "Failed to initialize the platform values " + list) +
             compose_error("Failed initializing platfrom values."),
         refused});
  }
  const std::string failed = "Failed initailzing list.";
  for (const std::string &list : names_at_destruction) {
    expected.push_back(
        {preparation_error(failed, "edid") + missing_list(list, "edid") + clean_up_without_modes(), refused});
  }
  expected.push_back({compose_error("Failed initializing modes.") + clean_up_without_modes(), refused});
  for (const std::string &list : names_at_destruction)
    expected.push_back({preparation_error(failed, "new edid") + missing_list(list, "new_edid"), refused});
  expected.push_back({error_line("edid_composer", "_filter_video_modes", "Failed initializing the linked list.") +
                          deletion_of_an_unprepared_list() + selection_error("Failed deleting list."),
                      refused});
  EXPECT_EQ(outcomes(operation_name_t::ll_init), expected);
}

TEST_F(FailingCall, OfReadingAnEntryIsReportedByEachReader) {
  const auto vendor_block_error = [](const std::string &message) {
    return error_line("edid_decode_encode", "_decode_edid_vendor_block", message);
  };
  const std::vector<outcome_t> expected{
      {vendor_block_error("Failed reading from an linked list. index:0"), as_always},
      {vendor_block_error("The Vendor Specific Data Block (VSDB) 3D description references an index (1) that doesn't "
                          "exist. Continuing. List len:4"),
       as_always},
      {"", as_always},
      {bug_line("edid_composer", "_filter_audio_list_with_mask", "Failed trying to retrieve index:3\n"), otherwise},
      {bug_line("edid_composer", "_filter_audio_list_with_mask", "Failed trying to retrieve index:1\n"), as_always},
      {error_line("edid_composer", "_populate_new_edid", "Failed reading from an linked list. index:0 ptr:(nil)") +
           encoding_error("The function expects there to be at least 2 DTDs. Total DTDs:0"),
       refused},
      {encoding_error("Failed to locate index #0 in the list."), refused},
      {encoding_error("Failed trying to obtain index #0 list."), refused},
      {encoding_error("Failed trying to access index #0 in the list."), refused},
      {encoding_error("Failed trying to obtain index #0 list."), refused},
  };
  EXPECT_EQ(outcomes(operation_name_t::ll_entry_at), expected);
}

TEST_F(FailingCall, OfDeletingAnEntryEndsTheSelection) {
  EXPECT_EQ(outcomes(operation_name_t::ll_delete_entry),
            (std::vector<outcome_t>{{selection_error("Failed deleting entry."), refused}}));
  const std::vector<outcome_t> expected{
      {selection_error("Failed deleting entry index:0."), refused},
      {bug_line("edid_composer", "_filter_audio_list_with_mask", "Failed trying to delete entry"), otherwise},
      {bug_line("edid_composer", "_filter_audio_list_with_mask", "Failed trying to delete entry"), as_always},
  };
  EXPECT_EQ(outcomes(operation_name_t::ll_delete_entry_at), expected);
}

TEST_F(FailingCall, OfDeletingTheCandidatesEndsTheSelection) {
  EXPECT_EQ(outcome_of(operation_name_t::ll_delete_list, 1),
            (outcome_t{selection_error("Failed deleting list."), refused}));
}

// Between the candidates and the modes, two records are destroyed.
TEST_F(FailingCall, OfDeletingTheLastListsIsReportedAndNothingMore) {
  int nth = 10;
  EXPECT_EQ(outcome_of(operation_name_t::ll_delete_list, nth),
            (outcome_t{compose_error("Failed cleaning up video list."), as_always}));
  for (const std::string &list : platform_lists) {
    const std::string name = list == "standard timings" ? "values " + list : list;
    EXPECT_EQ(
        outcome_of(operation_name_t::ll_delete_list, ++nth),
        (outcome_t{bug_line("utility", "platform_values_destroy", "Failed removing platform " + name), as_always}));
  }
  EXPECT_EQ(outcome_of(operation_name_t::ll_delete_list, ++nth), std::nullopt);
}

TEST_F(FailingCall, OfPreparingARecordIsRefusedUnlessItIsForTheLog) {
  const std::vector<outcome_t> expected{
      {compose_error("Failed preparing edid.") + missing_list("standard_timing_list", "edid") +
           clean_up_without_modes(),
       refused},
      {compose_error("Failed preparing new edid.") + missing_list("standard_timing_list", "new_edid"), refused},
      {warning_line("edid_composer", "compose_edid_internal", "edid_prepare failed."), as_always},
  };
  EXPECT_EQ(traced_outcomes(operation_name_t::edid_prepare), expected);
}

TEST_F(FailingCall, OfDestroyingARecordChangesNothing) {
  const std::vector<outcome_t> expected{
      {warning_line("edid_composer", "compose_edid_internal", "Failed to destroy the debug edid."), as_always},
      {compose_error("Failed cleaning up edid."), as_always},
      {compose_error("Failed cleaning up new_edid."), as_always},
  };
  EXPECT_EQ(traced_outcomes(operation_name_t::edid_destroy), expected);
}

TEST_F(FailingCall, OfDecodingTheNewEdidForTheLogChangesNothing) {
  const auto warning = [](const std::string &message) {
    return std::vector<outcome_t>{{warning_line("edid_composer", "compose_edid_internal", message), as_always}};
  };
  EXPECT_EQ(traced_outcomes(operation_name_t::decode_edid_block_0), warning("Failed decoding the new edid block 0."));
  EXPECT_EQ(traced_outcomes(operation_name_t::decode_edid_extensions),
            warning("Failed decoding the new edid extension."));
}

TEST_F(FailingCall, OfFindingTheTimingOfAVicLeavesItOutOfTheLimits) {
  const auto bug = [](const std::string &function, const std::string &vic) {
    return bug_line("edid_composer", function, "\tFailed converting VIC:" + vic + " to a DTD.");
  };
  const std::vector<outcome_t> expected{
      {bug("_find_largest_height", "16"), as_always},
      {bug("_remove_larger_height_modes", "4"), as_always},
      {bug("_maximum_pixel_clock", "16"), as_always},
      {error_line("edid_composer", "_populate_new_edid", "Error converting vic to dtd. Vic:16:1920x1080p60Hz16x9") +
           compose_error("Failed populating the new edid."),
       refused},
      {encoding_error("Failed converting vic to dtd."), refused},
  };
  EXPECT_EQ(outcomes(operation_name_t::convert_vic_to_dtd), expected);
}

TEST_F(FailingCall, OfFindingAValidTimingIsRefusedByTheEncoder) {
  const std::string invalid =
      error_line("edid_decode_encode", "_encode_edid_dtd", "Called encode DTD with an invalid timing structure.");
  const std::vector<outcome_t> expected{
      {"", as_always},
      {invalid + encoding_error("Failed encoding DTD. index:0 Len:2"), refused},
      {invalid + encoding_error("Failed encoding DTD. Failing."), refused},
  };
  EXPECT_EQ(outcomes(operation_name_t::convert_vic_to_valid_dtd), expected);
}

TEST(FailingListCheck, OfFreshListsIsRefusedByPreparation) {
  for (int nth = 1; nth <= 4; ++nth) {
    edid_t edid;
    EXPECT_EQ(output_of([&] {
                const failing_call_t failing(operation_name_t::ll_is_initialized, nth);
                EXPECT_EQ(edid_prepare(&edid), 0);
              }),
              error_line("edid_decode_encode", "edid_prepare",
                         record_lists[static_cast<std::size_t>(nth) - 1] + " has already been initialized."));
  }
}

TEST(FailingListCheck, OfDeletedListsIsReportedByDestruction) {
  for (int nth = 1; nth <= 4; ++nth) {
    edid_t edid;
    ASSERT_EQ(edid_prepare(&edid), 1);
    EXPECT_EQ(output_of([&] {
                const failing_call_t failing(operation_name_t::ll_is_initialized, 4 + nth);
                EXPECT_EQ(edid_destroy(&edid), 1);
              }),
              bug_line("edid_decode_encode", "edid_destroy",
                       "Deleted list believes it is still initialized: " +
                           record_lists[static_cast<std::size_t>(nth) - 1] + "."));
  }
}

TEST(FailingListDeletion, IsRefusedByDestruction) {
  for (int nth = 1; nth <= 4; ++nth) {
    edid_t edid;
    ASSERT_EQ(edid_prepare(&edid), 1);
    EXPECT_EQ(output_of([&] {
                const failing_call_t failing(operation_name_t::ll_delete_list, nth);
                EXPECT_EQ(edid_destroy(&edid), 0);
              }),
              error_line("edid_decode_encode", "edid_destroy",
                         "Failed deleting list: " + record_lists[static_cast<std::size_t>(nth) - 1] + "."));
  }
}

TEST(FailingReport, IsReportedByPrintEdid) {
  const bytes_t sink = rich_sink().build();
  const auto lines_when = [&](operation_name_t operation) {
    return output_of([&] {
      const failing_call_t failing(operation, 1);
      print_edid(sink.data(), static_cast<u32>(sink.size()), 0, "Sink");
    });
  };
  const auto error = [](const std::string &message) { return error_line("edid_composer", "print_edid", message); };
  EXPECT_EQ(lines_when(operation_name_t::edid_prepare), error("Failed preparing edid."));
  EXPECT_EQ(lines_when(operation_name_t::print_edid_struct),
            warning_line("edid_composer", "print_edid", "Failed printing edid."));
  EXPECT_EQ(lines_when(operation_name_t::decode_edid_block_0), error("Failed decoding EDID block 0."));
  const std::string report = output_of([&] { print_edid(sink.data(), static_cast<u32>(sink.size()), 0, "Sink"); });
  EXPECT_EQ(lines_when(operation_name_t::edid_destroy), report + error("Failed cleaning up edid."));
}

}  // namespace
}  // namespace robustness
