// A composition depends on what it is given and on nothing else, and writes nothing but its 256 bytes.
#include "composing_fixture.h"
#include "support/hex_text.h"

namespace properties {
namespace {

using test_support::bytes_t;
using test_support::hex_lines;

/// A well-formed sink or any bytes at all.
situation_t random_situation_of_any_sink(random_source_t &random) {
  situation_t situation = random_situation(random);
  if (random.flag() != 0) situation.sink.bytes = random_bytes_of_a_sink(random);
  return situation;
}

TEST(RandomComposition, GivesTheSameBytesTwiceAndTouchesNothingElse) {
  for_each_run(3000, [](random_source_t &random) {
    const situation_t situation = random_situation_of_any_sink(random);
    values_of_t values(situation.platform);
    const auto first = compose_printing(situation.sink.bytes, situation.settings, values.get());
    const auto second = compose_printing(situation.sink.bytes, situation.settings, values.get());
    EXPECT_TRUE(first.rest_untouched);
    EXPECT_TRUE(second.rest_untouched);
    EXPECT_TRUE(first.result || failed_for_unknown_audio(first)) << first.output;
    EXPECT_EQ(first.result, second.result);
    EXPECT_EQ(hex_lines(first.bytes), hex_lines(second.bytes));
    EXPECT_EQ(first.spa_offset, second.spa_offset);
    EXPECT_EQ(first.output, second.output);
  });
}

TEST(RandomComposition, GivesTheSameBytesFromValuesAndFromTheConfigurationTree) {
  for_each_run(1000, [](random_source_t &random) {
    const situation_t situation = random_situation_of_any_sink(random);
    const auto from_values = compose(situation);
    const test_support::configuration_tree_t unread;
    test_support::configuration_tree_t tree;
    situation.platform.write_to(tree);
    const auto from_tree = compose_printing(situation.sink.bytes, situation.settings, nullptr);
    EXPECT_EQ(from_tree.result, from_values.result);
    EXPECT_EQ(hex_lines(from_tree.bytes), hex_lines(from_values.bytes));
    EXPECT_TRUE(from_tree.rest_untouched);
    EXPECT_GT(tree.lookups(), 0);
    EXPECT_EQ(unread.lookups(), 0);
  });
}

TEST(RandomComposition, GivesTheSameBytesWithTracingAndWithoutAnOffset) {
  for_each_run(500, [](random_source_t &random) {
    situation_t situation = random_situation_of_any_sink(random);
    values_of_t values(situation.platform);
    const auto silent = compose_printing(situation.sink.bytes, situation.settings, values.get());
    debug_enable(true);
    const auto traced = compose_printing(situation.sink.bytes, situation.settings, values.get());
    debug_enable(false);
    EXPECT_EQ(traced.result, silent.result);
    EXPECT_EQ(hex_lines(traced.bytes), hex_lines(silent.bytes));
    EXPECT_TRUE(traced.rest_untouched);

    bytes_t bytes(256, 0xA5);
    const bytes_t &sink = situation.sink.bytes;
    situation.settings.spa_offset = nullptr;
    bool result = false;
    test_support::raw_output_of([&] {
      result = compose_edid_internal(sink.empty() ? nullptr : sink.data(), static_cast<u32>(sink.size()), bytes.data(),
                                     256, &situation.settings, values.get());
    });
    EXPECT_EQ(result, silent.result);
    EXPECT_EQ(hex_lines(bytes), hex_lines(silent.bytes));
  });
}

TEST(RandomComposition, HasBothChecksumsAndDecodesAsABaseBlock) {
  for_each_run(2500, [](random_source_t &random) {
    const situation_t situation = random_situation_of_any_sink(random);
    const auto composition = compose(situation);
    if (!composition.result) return;
    EXPECT_EQ(test_support::block_sum(composition.bytes.data()), 0);
    EXPECT_EQ(test_support::block_sum(composition.bytes.data() + 128), 0);
    const std::string &name = situation.platform.monitor_name;
    const u32 descriptors = name.size() >= 2 && name.front() != ' ' ? 4 : 3;
    EXPECT_EQ(composition.bytes[54 + 18 * descriptors], 1);
    test_support::scoped_edid_t edid;
    EXPECT_EQ(
        test_support::raw_output_of([&] { EXPECT_EQ(decode_edid_block_0(composition.bytes.data(), edid.get()), 1); }),
        "");
    EXPECT_EQ(edid->extension_count, descriptors == 4 ? 1 : 0);
  });
}

}  // namespace
}  // namespace properties
