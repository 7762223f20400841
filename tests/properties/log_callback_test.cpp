// The log callback receives every line that is printed without it, and nothing else changes.
#include "composing_fixture.h"
#include "support/patterns.h"
#include "support/request.h"

namespace properties {
namespace {

/// Records on the stack of the two calls have different addresses.
std::string without_addresses(const std::string &text) {
  return test_support::replaced(text, "0x[0-9a-f]{9,16}\\b", "PTR");
}

TEST(RandomComposition, HandsTheCallbackWhatItPrintsWithoutIt) {
  u32 lines = 0;
  u32 failures = 0;
  for_each_run(1500, [&](random_source_t &random) {
    situation_t situation = random_situation(random);
    if (random.flag() != 0) situation.sink.bytes = random_bytes_of_a_sink(random);
    values_of_t values(situation.platform);
    test_support::configuration_tree_t tree;
    situation.platform.write_to(tree);
    test_support::request_t request(situation.sink.bytes, situation.settings,
                                    random.flag() != 0 ? values.get() : nullptr);
    debug_enable(random.flag() != 0);
    bool composed = false;
    const std::string printed = test_support::raw_output_of([&] { composed = request.compose(); });
    const compose_result_t expected = request.result;
    const test_support::bytes_t expected_bytes = request.new_edid;

    request.new_edid.assign(256, 0xA5);
    EXPECT_EQ(test_support::raw_output_of([&] { EXPECT_EQ(request.compose_logged(), composed); }), "");
    debug_enable(false);
    EXPECT_EQ(without_addresses(request.lines), without_addresses(printed));
    EXPECT_EQ(std::memcmp(&request.result, &expected, sizeof expected), 0);
    EXPECT_TRUE(!composed || request.new_edid == expected_bytes);

    EXPECT_EQ(request.result.bytes_written, composed ? 256u : 0u);
    EXPECT_EQ(request.result.physical_address_offset, composed ? request.spa_offset : 0u);
    EXPECT_STRNE(compose_sink_status_string(request.result.sink_status), "unknown");
    EXPECT_STRNE(compose_extension_status_string(request.result.sink_extension_status), "unknown");
    lines += printed.empty() ? 0 : 1;
    failures += composed ? 0 : 1;
  });
  expect_at_least(750, lines, "compositions_with_lines");
  expect_at_least(2, failures, "failures");
}

}  // namespace
}  // namespace properties
