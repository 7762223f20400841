// The stack that HDMI 2 adds to a composition.
#include <gtest/gtest.h>

#include "bench/stack_meter.h"
#include "support/edid_builder.h"
#include "support/observation.h"
#include "support/output_capture.h"
#include "support/records.h"

namespace {

using test_support::bytes_t;
using test_support::data_block;

/// A television with every data block of HDMI 2 that is passed on or read.
bytes_t television() {
  return test_support::join(test_support::base_block_builder_t().extensions(1).build(),
                            test_support::extension_builder_t()
                                .block(test_support::video_block({16, 97, 96, 95}))
                                .block(test_support::hdmi_block({0x10, 0x00, 0x38, 60}))
                                .block(data_block(3, {0xD8, 0x5D, 0xC4, 1, 120, 0x80, 0x03, 0x02, 48, 120}))
                                .block(data_block(7, {0x06, 0x0D, 0x01, 120, 90, 30}))
                                .block(data_block(7, {0x0E, 102}))
                                .block(data_block(7, {0x0F, 0x06}))
                                .block(data_block(7, {0x07, 3, 1, 0}))
                                .block(data_block(7, {0x01, 0x46, 0xD0, 0x00, 0x02, 0, 0, 0, 0}))
                                .build());
}

hdmi2_values_t values_as_sink() {
  hdmi2_values_t values{};
  values.size = sizeof values;
  hdmi2_values_init(&values);
  values.enable = values.preferred_extended = values.pass_hdr_dynamic = values.pass_dolby_vision = 1;
  values.tmds_limit = 600;
  for (i32 i = 0; i < HDMI2_MOST_LISTED_VICS; ++i)
    values.vic_priority_list[i] = values.vic_addition_list[i] = 102 - i;
  values.y420 = values.dc_30bit_420 = values.dc_36bit_420 = values.allm = values.vrr = values.hdr_pq = 2;
  return values;
}

TEST(StackOfHdmi2, IsBelow8KibMore) {
  constexpr std::size_t most = 8192;
  const bytes_t sink = television();
  const hdmi2_values_t hdmi2 = values_as_sink();
  test_support::scoped_values_t platform;
  test_support::append_modes(platform->video_60_priority, {{16, 7}, {4, 7}, {2, 7}, {1, 7}});
  test_support::append_modes(platform->video_60_additional, {{16, 7}, {4, 7}, {2, 7}, {1, 7}});
  const compose_cfg_t settings = test_support::plain_settings();
  bytes_t bytes(256);
  for (const bool traced : {false, true}) {
    const auto stack_of = [&](const hdmi2_values_t *values) {
      const auto compose = [&] {
        test_support::compose_observed(
            sink, bytes, &settings, platform.get(), [](const compose_decision_t *, void *) {}, nullptr, values);
      };
      std::size_t stack = 0;
      const auto measure = [&] {
        compose();
        stack = bench::stack_use_of(compose);
      };
      traced ? test_support::traced_output_of(measure) : test_support::output_of(measure);
      return stack;
    };
    const std::size_t without = stack_of(nullptr);
    const std::size_t with = stack_of(&hdmi2);
    EXPECT_GT(with, without);
    EXPECT_LT(with - without, most);
  }
}

}  // namespace
