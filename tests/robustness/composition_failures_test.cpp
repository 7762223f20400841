// A composition when memory runs out at any of its allocations.
#include <gtest/gtest.h>

#include <map>
#include <set>
#include <span>
#include <string>
#include <vector>

#include "sample.h"
#include "support/allocation_ledger.h"
#include "support/failing_allocation.h"
#include "support/observation.h"
#include "support/output_capture.h"
#include "support/patterns.h"

namespace robustness {
namespace {

using test_support::allocation_ledger_t;
using test_support::bytes_t;
using test_support::failing_allocation_t;
using test_support::failing_t;
using test_support::platform_configuration_t;

const std::string refusal = "refused\n";

/// The diagnostics of one run, their numbers masked.
std::string diagnostics_in(const std::string &output) {
  std::string diagnostics;
  for (const std::string &line : test_support::lines_in(output)) {
    if (!test_support::matches(line, "\\w+:N:\\w+\\(\\) (ERROR|WARNING|BUG): .*")) continue;
    diagnostics +=
        test_support::replaced(test_support::replaced(line, "0x[0-9a-f]+|[0-9]+", "#"), "Magic:-#", "Magic:#") + "\n";
  }
  return diagnostics;
}

struct run_t {
  std::string words;
  std::string diagnostics;
  int allocations = 0;
  u32 decisions = 0;
};

void count(const compose_decision_t *decision, void *context) {
  EXPECT_EQ(decision->size, sizeof *decision);
  EXPECT_STRNE(compose_reason_string(decision->reason), "unknown");
  ++*static_cast<u32 *>(context);
}

/// One sink on one platform, to be composed again and again.
struct situation_t {
  bytes_t sink;
  const platform_values_t *values;  ///< Null: the configuration tree.
  bool observed;
  bool traced;
  const hdmi2_values_t *hdmi2 = nullptr;

  /// With the @p nth allocation failing; 0: none. Whatever comes of it, nothing is lost.
  run_t run(int nth, failing_t failing = failing_t::only_that_one) const {
    run_t run;
    const allocation_ledger_t ledger;
    const auto compose = [&] {
      constexpr std::ptrdiff_t margin = 64;
      bytes_t memory(margin + 256 + margin, 0xA5);
      const compose_cfg_t settings = rich_settings();
      test_support::composition_t composition;
      {
        const failing_allocation_t failure(nth, failing);
        composition.result = test_support::compose_observed(sink, std::span(memory).subspan(margin, 256), &settings,
                                                            values, observed ? count : nullptr, &run.decisions, hdmi2);
        EXPECT_TRUE(nth == 0 || failure.happened());
      }
      composition.bytes.assign(memory.begin() + margin, memory.end() - margin);
      memory.erase(memory.begin() + margin, memory.end() - margin);
      composition.rest_untouched = memory == bytes_t(2 * margin, 0xA5);
      run.words = words_of(composition);
    };
    run.diagnostics =
        diagnostics_in(traced ? test_support::traced_output_of(compose) : test_support::output_of(compose));
    run.allocations = ledger.allocated();
    EXPECT_EQ(ledger.outstanding(), 0);
    return run;
  }
};

/// What a missing entry comes to.
enum class outcome_t {
  refused,
  composed_from_less,  ///< As without that entry of the configuration or of the sink.
  untold,              ///< The bytes are as always, but no decision is passed on.
  as_always,
};

/// By the lines that follow the allocation's own.
const std::map<std::string, outcome_t> &outcomes() {
  const auto error = [](const std::string &site) { return site + "() ERROR: Failed creating entry.\n"; };
  const auto of_composing = [](const std::string &line) {
    return "edid_composer:N:compose_edid_internal() " + line + "\n";
  };
  const std::string of_composer = "edid_composer:N:";
  const std::string of_codec = "edid_decode_encode:N:";
  const auto unprepared = [&](const std::string &record) {
    return of_codec + "edid_destroy() ERROR: List is not initialized. List:standard_timing_list.\n" +
           of_composing("ERROR: Failed cleaning up " + record + ".");
  };
  const std::string standard_timing =
      error(of_codec + "_decode_edid_standard_timing") + of_codec +
      "decode_edid_block_#() ERROR: Failed decoding ## standard timing. Val#:# Val#:#\n";
  const std::string detailed_timing = of_codec + "_decode_edid_dtd() ERROR: Failed creating an entry.\n";
  const std::string base_timing =
      detailed_timing + of_codec + "decode_edid_block_#() ERROR: Failed decoding ## DTD." + [] {
        std::string bytes;
        for (int i = 0; i < 18; ++i)
          bytes += " #";
        return bytes + "\n";
      }();
  const std::string video = of_codec + "decode_edid_extensions() ERROR: Failed creating new entry.\n";
  const std::string audio = error(of_codec + "decode_edid_extensions");
  const std::string base_failed = of_composing("ERROR: Failed decoding the edid block #. Continuing.");
  const std::string extension_failed = of_composing("ERROR: Failed decoding the extension. Continuing.");
  const std::string new_base_failed = of_composing("WARNING: Failed decoding the new edid block #.");
  const std::string new_extension_failed = of_composing("WARNING: Failed decoding the new edid extension.");
  static const std::map<std::string, outcome_t> table{
      {error(of_composer + "_read_platform_values") +
           of_composing("ERROR: Failed trying to read the platform config file.") + unprepared("edid") +
           unprepared("new_edid") +
           "linked_list:N:ll_verify_integrity() ERROR: Corrupt List: List not initialized. Ptr:PTR ExpectedMagic:# "
           "Magic:# Size:# Head:(nil) \n"
           "linked_list:N:ll_delete_list() BUG: Failed verifying integrity of the list. list:PTR\n" +
           of_composing("ERROR: Failed cleaning up video list."),
       outcome_t::refused},
      {error(of_composer + "_get_vic_list_callback"), outcome_t::composed_from_less},
      {error(of_composer + "_get_vic_list_callback") + of_composer +
           "_get_platform_list() ERROR: A mode list (#) is empty. Please verify that all of the video mode lists are "
           "properly populated with #D mode formated strings.\n",
       outcome_t::composed_from_less},
      {error(of_composer + "_get_std_timing_callback"), outcome_t::composed_from_less},
      {standard_timing + base_failed, outcome_t::composed_from_less},
      {base_timing + base_failed, outcome_t::composed_from_less},
      {detailed_timing, outcome_t::composed_from_less},
      {video + extension_failed, outcome_t::composed_from_less},
      {audio + extension_failed, outcome_t::composed_from_less},
      {error(of_composer + "_filter_video_modes") + of_composing("ERROR: Failed filtering the video modes."),
       outcome_t::refused},
      {error(of_composer + "_filter_audio_formats") + of_composing("ERROR: Failed filtering the audio formats."),
       outcome_t::refused},
      {error(of_composer + "_populate_new_edid") + of_composing("ERROR: Failed populating the new edid."),
       outcome_t::refused},
      {"linked_list:N:ll_copy_list() BUG: Failed creating entry for the destination list.\n" +
           of_composing("ERROR: Failed populating the new edid."),
       outcome_t::refused},
      {error(of_composer + "change_record") + of_composing("ERROR: Failed adding HDMI # to the new edid."),
       outcome_t::refused},
      // Of the explanation.
      {error(of_composer + "compose_edid_internal"), outcome_t::untold},
      // Of the log.
      {error(of_composer + "_filter_audio_list_with_mask"), outcome_t::as_always},
      {standard_timing + new_base_failed, outcome_t::as_always},
      {base_timing + new_base_failed, outcome_t::as_always},
      {video + new_extension_failed, outcome_t::as_always},
      {audio + new_extension_failed, outcome_t::as_always},
  };
  return table;
}

void expect_outcome(outcome_t expected, const run_t &run, const run_t &whole) {
  EXPECT_EQ(run.words == refusal, expected == outcome_t::refused);
  const bool is_told = expected == outcome_t::composed_from_less || expected == outcome_t::as_always;
  EXPECT_EQ(run.decisions != 0, is_told && whole.decisions != 0);
  if (expected != outcome_t::refused && expected != outcome_t::composed_from_less) {
    EXPECT_EQ(run.words, whole.words);
  }
}

/// The lines that follow the allocation's own, of which there is one.
std::string after_the_allocations_own(const std::string &diagnostics) {
  const std::string bug = "linked_list:N:ll_create_entry() BUG: calloc failed to allocate memory for the ";
  EXPECT_EQ(diagnostics.find(bug), 0U) << diagnostics;
  EXPECT_EQ(test_support::count_of(diagnostics, bug), 1);
  return diagnostics.substr(diagnostics.find('\n') + 1);
}

/// Entries take their room from blocks of the heap, so that each allocation serves for many: sinks and configurations
/// of any length make each kind of entry the first of a block.
class FailingComposition : public testing::Test {
 protected:
  FailingComposition() {
    rich_configuration().write_to(values_.get());
    for (u32 i = 0; i < 24; ++i) {
      sample_sink_t sink = rich_sink();
      sink.video.insert(sink.video.end(), i, 60);
      situations_.push_back({sink.build(), values_.get(), i % 2 == 0, false});
      situations_.push_back({sink.build(), values_.get(), false, true});
      hdmi2_[i] = hdmi2_values(i % 12);
      situations_.push_back({sink.build(), values_.get(), i % 2 == 0, i % 3 == 0, &hdmi2_[i]});
    }
  }

  void let_each_allocation_fail(const situation_t &situation) {
    const run_t whole = situation.run(0);
    EXPECT_NE(whole.words, refusal);
    EXPECT_EQ(whole.diagnostics, "");
    EXPECT_EQ(whole.decisions != 0, situation.observed);
    for (int nth = 1; nth <= whole.allocations && !HasFailure(); ++nth) {
      SCOPED_TRACE("allocation " + std::to_string(nth));
      const run_t run = situation.run(nth);
      const std::string lines = after_the_allocations_own(run.diagnostics);
      const auto outcome = outcomes().find(lines);
      ASSERT_NE(outcome, outcomes().end()) << lines;
      expect_outcome(outcome->second, run, whole);
      seen_.insert(lines);
    }
    EXPECT_EQ(situation.run(0).words, whole.words);
  }

  /// With @p count modes that the box makes itself, the first of them the preferred one.
  static hdmi2_values_t hdmi2_values(u32 count) {
    hdmi2_values_t values{};
    values.size = sizeof values;
    hdmi2_values_init(&values);
    values.enable = values.preferred_extended = 1;
    values.tmds_limit = 600;
    for (u32 i = 0; i < count; ++i)
      values.vic_priority_list[i] = values.vic_addition_list[i] = static_cast<i32>(97 - i);
    return values;
  }

  test_support::scoped_values_t values_;
  hdmi2_values_t hdmi2_[24]{};
  std::vector<situation_t> situations_;
  std::set<std::string> seen_;
};

TEST_F(FailingComposition, ReportsEveryAllocationAndComesToWhatItsLinesSay) {
  for (const situation_t &situation : situations_)
    let_each_allocation_fail(situation);
  for (std::size_t entries = 3; entries <= 26; ++entries) {
    platform_configuration_t configuration = rich_configuration();
    configuration.audio.resize(entries, 0x07070F);
    test_support::configuration_tree_t tree;
    configuration.write_to(tree);
    let_each_allocation_fail({rich_sink().build(), nullptr, false, false});
  }
  for (const auto &[lines, outcome] : outcomes())
    EXPECT_EQ(seen_.count(lines), 1U) << "No allocation failed with:\n" << lines;
}

TEST_F(FailingComposition, SurvivesWithoutAnyMemoryFromAnyAllocationOn) {
  for (const situation_t &situation : situations_) {
    const run_t whole = situation.run(0);
    for (int nth = 1; nth <= whole.allocations; ++nth) {
      const run_t run = situation.run(nth, failing_t::all_from_there_on);
      EXPECT_TRUE(run.words == refusal || run.words.size() == whole.words.size()) << run.words;
    }
    EXPECT_EQ(situation.run(0).words, whole.words);
  }
}

// Nothing configured, no sink: the first entry is that of basic audio.
TEST(FailingPoorComposition, IsRefused) {
  const test_support::configuration_tree_t tree;
  const situation_t situation{{}, nullptr, true, false};
  for (int nth = 1; nth <= 2; ++nth)
    EXPECT_EQ(situation.run(nth).words, refusal);
}

}  // namespace
}  // namespace robustness
