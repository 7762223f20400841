// What a composition with HDMI 2 reads of the sink, and what it returns of that.
#include <gtest/gtest.h>

#include "edid_composer/hdmi2/layer_composition.h"
#include "support/output_capture.h"
#include "support/records.h"
#include "support/request.h"

namespace hdmi2_test {
namespace {

using test_support::base_block_builder_t;
using test_support::data_block;
using test_support::extension_builder_t;
using test_support::join;

class LayerSink : public testing::Test {
 protected:
  LayerSink() {
    values_.size = sizeof values_;
    hdmi2_values_init(&values_);
    values_.enable = 1;
    values_.tmds_limit = 600;
    values_.vic_priority_list[0] = 95;
    test_support::append_modes(platform_->video_60_priority, {{16, 0}, {4, 0}, {2, 0}, {1, 0}});
    test_support::append_modes(platform_->video_60_additional, {{1, 0}});
  }
  struct outcome_t {
    composed_t composed;
    compose_result_t result;
  };
  outcome_t compose_below(const bytes_t &sink) {
    test_support::request_t request(sink, test_support::plain_settings(), platform_.get());
    request.request.hdmi2 = &values_;
    outcome_t outcome;
    outcome.composed.lines = test_support::output_of([&] { EXPECT_TRUE(request.compose()); });
    outcome.composed.bytes = request.new_edid;
    outcome.result = request.result;
    return outcome;
  }
  static bytes_t base(u8 extensions) { return base_block_builder_t().extensions(extensions).build(); }
  /// 1080p60 and 2160p30, for today's stages and for the layer; 300 MHz.
  static extension_builder_t both() {
    return extension_builder_t().block(test_support::video_block({16, 95})).block(forum_block(60));
  }
  static bytes_t block_map() {
    bytes_t block(128, 0);
    block[0] = 0xF0;
    test_support::mend_checksum(block, 0);
    return block;
  }

  test_support::scoped_values_t platform_;
  hdmi2_values_t values_{};
};

const bytes_t nothing{0x81, 1, 1, 1};

TEST_F(LayerSink, IsReadFromTheFirstCtaExtension) {
  const outcome_t outcome = compose_below(join(base(2), join(block_map(), both().build())));
  EXPECT_EQ(outcome.composed.svds(), (bytes_t{0x90, 1, 1, 1, 95}));
  EXPECT_EQ(outcome.result.sink_extension_status, static_cast<u32>(COMPOSE_EXTENSION_READ));
  EXPECT_EQ(outcome.result.sink_blocks_unread, 1U);
}

TEST_F(LayerSink, IsReadFromAllExtensionsForHdmi2OnlyTheFirstForTheRest) {
  const outcome_t outcome = compose_below(join(
      base(2), join(extension_builder_t().block(test_support::video_block({16})).build(),
                    extension_builder_t().block(test_support::video_block({4, 95})).block(forum_block(60)).build())));
  EXPECT_EQ(outcome.composed.svds(), (bytes_t{0x90, 1, 1, 1, 95})) << "16 of the first, 95 of any, 4 of none";
  EXPECT_EQ(outcome.result.sink_blocks_unread, 0U);
}

TEST_F(LayerSink, MayHaveATimingOffsetUpTo127) {
  const auto svds = [&](u8 offset) {
    extension_builder_t extension = both();
    return compose_below(join(base(1), extension.byte(2, offset).build()));
  };
  for (const u8 offset : {u8{111}, u8{127}})
    EXPECT_EQ(svds(offset).composed.svds(), (bytes_t{0x90, 1, 1, 1, 95})) << int{offset};
  const outcome_t outcome = svds(128);
  EXPECT_EQ(outcome.composed.svds(), nothing);
  EXPECT_EQ(outcome.result.sink_extension_status, static_cast<u32>(COMPOSE_EXTENSION_OFFSET_UNSUPPORTED));
  EXPECT_EQ(outcome.result.sink_blocks_unread, 1U);
}

TEST_F(LayerSink, WithoutAReadableExtensionIsASinkWithoutBlocks) {
  const outcome_t outcome = compose_below(join(base(1), both().byte(127, 0x55).build()));
  EXPECT_EQ(outcome.composed.svds(), nothing);
  EXPECT_EQ(outcome.result.sink_status, static_cast<u32>(COMPOSE_SINK_READ));
  EXPECT_EQ(outcome.result.sink_extension_status, static_cast<u32>(COMPOSE_EXTENSION_CHECKSUM_INVALID));
  EXPECT_NE(outcome.composed.lines.find("The sink has no CTA-861 extension of revision 3 that can be read. Announced:1 "
                                        "There:1\n"),
            std::string::npos);
  EXPECT_EQ(compose_below(base(1)).result.sink_extension_status, static_cast<u32>(COMPOSE_EXTENSION_MISSING));
  EXPECT_EQ(compose_below(base(0)).result.sink_extension_status, static_cast<u32>(COMPOSE_EXTENSION_NOT_ANNOUNCED));
}

TEST_F(LayerSink, ThatIsRefusedTakes165Mhz) {
  values_.vic_addition_list[0] = 0;
  values_.vic_priority_list[0] = 97;
  values_.scdc = 1;
  // A rate above 165 MHz would stand in the HDMI Forum block.
  const auto rate = [&](const bytes_t &sink) { return compose_below(sink).composed.forum()->at(4) * 5; };
  EXPECT_EQ(rate({}), 600) << "without a sink the box decides";
  bytes_t refused = join(base_block_builder_t().byte(18, 2).extensions(1).build(), both().build());
  EXPECT_EQ(rate(refused), 0);
  refused.resize(255);
  EXPECT_EQ(rate(refused), 0);
  const bytes_t malformed_descriptor{0, 0, 1, 0xFE, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0};
  EXPECT_EQ(rate(join(base_block_builder_t().descriptor(3, malformed_descriptor).extensions(1).build(),
                      extension_builder_t().block(forum_block(120)).build())),
            0);
  EXPECT_EQ(rate(join(base(1), extension_builder_t().block(forum_block(120)).build())), 600);
}

TEST_F(LayerSink, MayShareItsBufferWithTheNewEdid) {
  bytes_t buffer = join(base(1), both().build());
  const bytes_t expected = compose_below(buffer).composed.bytes;
  test_support::request_t request(buffer, test_support::plain_settings(), platform_.get());
  request.request.hdmi2 = &values_;
  request.request.sink = buffer.data();
  request.request.new_edid = buffer.data();
  test_support::output_of([&] { EXPECT_TRUE(request.compose()); });
  EXPECT_EQ(buffer, expected);
}

TEST_F(LayerSink, GivesNothingToABufferOfAnotherSize) {
  test_support::request_t request({}, test_support::plain_settings(), platform_.get());
  request.request.hdmi2 = &values_;
  request.request.new_edid_bytes = 255;
  const std::string lines = test_support::output_of([&] { EXPECT_FALSE(request.compose()); });
  EXPECT_NE(lines.find("Function called with an unsupported block size. val:255 expected:256"), std::string::npos);
  EXPECT_EQ(request.result.bytes_written, 0U);
}

}  // namespace
}  // namespace hdmi2_test
