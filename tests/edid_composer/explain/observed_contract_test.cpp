// How an observer is called, and what observing changes: nothing.
#include <gtest/gtest.h>

#include <set>
#include <type_traits>

#include "edid_composer/explain/observed_composition.h"
#include "support/observation.h"
#include "support/output_capture.h"

namespace observed {
namespace {

using words_t = std::vector<std::string>;

static_assert(std::is_trivially_copyable_v<compose_decision_t>, "a copy of a record keeps its meaning");

/// Something for every part of a composition to tell of.
situation_t rich_situation() {
  situation_t situation;
  situation.sink.timings = {test_support::timing_of_vic(16)};
  situation.sink.std_timings = {{{0x31, 0x40}}};
  situation.sink.video = {16, 4, 34};
  situation.sink.audio = test_support::join(descriptor(pcm_2), descriptor(ac3_6));
  situation.sink.hdmi = {0x10, 0x00, 0xB8, 45, 0xA0, 11, 6, 0x80, 0x20, 1};
  situation.platform.video_60_priority.emplace_back(33, 0);
  situation.platform.video_50_priority = modes({31, 19});
  situation.platform.video_50_additional = modes({19, 16});
  situation.platform.audio = {pcm_8, ac3_6, dts_6};
  situation.platform.modes_4k_x_2k_priority = {3, 1};
  situation.platform.modes_4k_x_2k_addition = {3, 2};
  situation.platform.current_mode_set_to_priority = 1;
  situation.platform.geometry_limit = 1;
  situation.platform.audio_pass_through = 1;
  situation.platform.dc_36bit = 1;
  situation.settings.hdmi_current_mode = {1920, 1080, 0, 50};
  situation.settings.hdmi_3d_mode = 1;
  situation.settings.edid_latency[0] = 20;
  return situation;
}

words_t all_words(const composition_t &composition) {
  words_t words;
  for (const auto &decision : composition.decisions)
    words.push_back(words_of(decision));
  return words;
}

void expect_same(const composition_t &composition, const composition_t &expected) {
  EXPECT_EQ(composition.result, expected.result);
  EXPECT_EQ(composition.bytes, expected.bytes);
  EXPECT_EQ(composition.output, expected.output);
}

TEST(Observer, ThatIsNullHearsNothingAndChangesNothing) {
  const situation_t situation = rich_situation();
  const composition_t observed = observe(situation);
  const composition_t unobserved = observe(situation, nullptr);
  ASSERT_TRUE(observed.result);
  expect_same(unobserved, observed);
  EXPECT_TRUE(unobserved.decisions.empty());
  EXPECT_GT(observed.decisions.size(), 30U);
}

TEST(Observer, ChangesNoTrace) {
  const situation_t situation = rich_situation();
  debug_enable(true);
  const composition_t observed = observe(situation);
  const composition_t unobserved = observe(situation, nullptr);
  debug_enable(false);
  expect_same(unobserved, observed);
  EXPECT_GT(test_support::count_of(observed.output, "\n"), 100);
}

TEST(Observer, OfNullComposesLikeTheInternalOperation) {
  const situation_t situation = rich_situation();
  test_support::scoped_values_t values;
  situation.platform.write_to(values.get());
  const bytes_t sink = situation.sink.build();
  bytes_t expected(256, 0xA5);
  const std::string output = test_support::output_of([&] {
    EXPECT_TRUE(compose_edid_internal(sink.data(), static_cast<u32>(sink.size()), expected.data(), 256,
                                      &situation.settings, values.get()));
  });
  const composition_t unobserved = observe(situation, nullptr);
  EXPECT_EQ(unobserved.bytes, expected);
  EXPECT_EQ(unobserved.output, output);
}

TEST(Observer, HearsTheSameFromTheTreeAsFromTheCallersValues) {
  const situation_t situation = rich_situation();
  const composition_t from_values = observe(situation);
  const composition_t from_tree = observe_tree(situation);
  expect_same(from_tree, from_values);
  EXPECT_EQ(all_words(from_tree), all_words(from_values));
}

TEST(Observer, HearsTheSameTwice) {
  EXPECT_EQ(all_words(observe(rich_situation())), all_words(observe(rich_situation())));
}

// What is wrong with a list is for those to report that use it.
TEST(Observer, OfListsThatCantBeWalkedReportsNothing) {
  const situation_t situation = rich_situation();
  const bytes_t sink = situation.sink.build();
  for (const auto list : {&platform_values_t::audio_list, &platform_values_t::video_50_priority,
                          &platform_values_t::video_50_additional, &platform_values_t::video_60_priority,
                          &platform_values_t::video_60_additional, &platform_values_t::std_timings}) {
    for (const bool is_of_other_type : {true, false}) {
      composition_t compositions[2];
      for (composition_t &composition : compositions) {
        const bool is_observed = &composition == compositions;
        test_support::scoped_values_t values;
        situation.platform.write_to(values.get());
        ll_delete_list(&(values.get()->*list));
        values.get()->*list = {};
        if (is_of_other_type) ll_init(&(values.get()->*list), "another type");
        composition.output = test_support::output_of([&] {
          composition.result =
              test_support::compose_observed(sink, composition.bytes, &situation.settings, values.get(),
                                             is_observed ? keep : nullptr, &composition.decisions);
        });
        if (!is_of_other_type) ll_init(&(values.get()->*list), "any type");  // For the destruction of the values.
      }
      expect_same(compositions[0], compositions[1]);
      EXPECT_EQ(compositions[0].decisions.empty(), !compositions[0].result);
    }
  }
}

/// The arguments of a composition that is refused for one reason each, and what refuses it.
struct refusal_t {
  bool buffer = true;
  u32 size = 256;
  bool settings = true;
  bool initialised = true;
};

TEST(Observer, OfARefusedCompositionHearsNothing) {
  const situation_t situation = rich_situation();
  const bytes_t sink = situation.sink.build();
  for (const refusal_t &refusal :
       {refusal_t{.buffer = false}, refusal_t{.size = 0}, refusal_t{.size = 128}, refusal_t{.size = 257},
        refusal_t{.settings = false}, refusal_t{.initialised = false}}) {
    test_support::scoped_values_t values;
    situation.platform.write_to(values.get());
    const platform_values_t moved = *values.get();
    bytes_t bytes(512);
    std::vector<compose_decision_t> decisions;
    const std::string output = test_support::output_of([&] {
      EXPECT_FALSE(
          test_support::compose_observed(sink, refusal.buffer ? std::span(bytes).first(refusal.size) : std::span<u8>(),
                                         refusal.settings ? &situation.settings : nullptr,
                                         refusal.initialised ? values.get() : &moved, keep, &decisions));
    });
    EXPECT_NE(output, "");
    EXPECT_TRUE(decisions.empty()) << output;
  }
}

// A format with the extension escape and no known extension is decoded, but can't be encoded.
TEST(Observer, OfACompositionThatFailsInTheEncoderHearsNothing) {
  situation_t situation = rich_situation();
  situation.platform.audio = {0x00077F};
  const composition_t observed = observe(situation);
  EXPECT_FALSE(observed.result);
  EXPECT_TRUE(observed.decisions.empty());
}

struct context_t {
  const context_t *self = nullptr;
  const u8 *bytes = nullptr;
  int calls = 0;
  int calls_before_the_end = 0;
  bool returned = false;
};

void count_call(const compose_decision_t *decision, void *context) {
  auto *const called = static_cast<context_t *>(context);
  EXPECT_EQ(called->self, called);
  EXPECT_FALSE(called->returned);
  EXPECT_NE(decision, nullptr);
  // The new EDID is written already, with both checksums.
  EXPECT_EQ(test_support::block_sum(called->bytes), 0);
  EXPECT_EQ(test_support::block_sum(called->bytes + 128), 0);
  EXPECT_EQ(called->bytes[128], 2);
  ++called->calls;
}

TEST(Observer, IsHandedItsContextBeforeTheCallReturns) {
  const situation_t situation;
  test_support::scoped_values_t values;
  situation.platform.write_to(values.get());
  bytes_t bytes(256, 0xA5);
  context_t context;
  context.self = &context;
  context.bytes = bytes.data();
  EXPECT_TRUE(test_support::compose_observed({}, bytes, &situation.settings, values.get(), count_call, &context));
  context.returned = true;
  EXPECT_EQ(context.calls, static_cast<int>(observe(situation).decisions.size()));
}

void count_without_context(const compose_decision_t *, void *context) {
  EXPECT_EQ(context, nullptr);
}

TEST(Observer, MayDoWithoutContext) {
  const situation_t situation;
  test_support::scoped_values_t values;
  situation.platform.write_to(values.get());
  bytes_t bytes(256);
  EXPECT_TRUE(
      test_support::compose_observed({}, bytes, &situation.settings, values.get(), count_without_context, nullptr));
}

void compose_again(const compose_decision_t *decision, void *context) {
  keep(decision, context);
  EXPECT_TRUE(observe(situation_t{}).result);
}

TEST(Observer, MayComposeItself) {
  const situation_t situation = rich_situation();
  const composition_t nested = observe(situation, compose_again);
  const composition_t plain = observe(situation);
  expect_same(nested, plain);
  EXPECT_EQ(all_words(nested), all_words(plain));
}

TEST(ObservedRecord, OutlivesTheCompositionInACopy) {
  std::vector<compose_decision_t> copies;
  words_t words;
  {
    const composition_t observed = observe(rich_situation());
    copies = observed.decisions;
    words = all_words(observed);
  }
  observe(situation_t{});  // Uses memory that was freed.
  for (std::size_t i = 0; i < copies.size(); ++i)
    EXPECT_EQ(words_of(copies[i]), words[i]);
}

TEST(ObservedRecord, TellsItsSizeAndWhoNamedEachCandidate) {
  const composition_t observed = observe(rich_situation());
  for (const auto &decision : observed.decisions) {
    SCOPED_TRACE(words_of(decision));
    EXPECT_EQ(decision.size, 56U);
    EXPECT_EQ(decision.origins != 0, decision.subject <= COMPOSE_SUBJECT_AUDIO_FORMAT);
    EXPECT_EQ(decision.origins & ~0xFFFU, 0U);
  }
}

TEST(ObservedRecord, IsTheOnlyOneOfItsCandidate) {
  const composition_t observed = observe(rich_situation());
  std::set<std::pair<u32, u32>> told;
  for (const auto &decision : observed.decisions) {
    if (decision.subject == COMPOSE_SUBJECT_AUDIO_FORMAT || decision.subject == COMPOSE_SUBJECT_SINK_TIMING) continue;
    EXPECT_TRUE(told.emplace(decision.subject, decision.code).second) << words_of(decision);
  }
  const auto modes_told = words_about(COMPOSE_SUBJECT_VIDEO_MODE, observed);
  EXPECT_EQ(modes_told.size(), 8U);  // 16, 4, 34 of the sink, 2, 1 and 33 of the lists, 31 and 19 of the others.
  EXPECT_EQ(words_about(COMPOSE_SUBJECT_AUDIO_FORMAT, observed).size(), 3U + 2 + 1);
  EXPECT_EQ(words_about(COMPOSE_SUBJECT_4K_MODE, observed).size(), 3U);
  EXPECT_EQ(words_about(COMPOSE_SUBJECT_SINK_TIMING, observed).size(), 1U);
}

}  // namespace
}  // namespace observed
