// Compositions below the sample sinks.
#include <gtest/gtest.h>

#include <algorithm>
#include <filesystem>
#include <string>
#include <vector>

#include "composition.h"
#include "extension_view.h"
#include "support/configuration_tree.h"
#include "support/hex_text.h"
#include "support/output_capture.h"
#include "support/records.h"

namespace {

using end_to_end::compose;
using end_to_end::hdmi_block_of;
using end_to_end::vics_of;
using test_support::configuration_tree_t;
using test_support::hex_lines;

std::vector<std::string> sample_sinks() {
  std::vector<std::string> names;
  for (const auto &entry : std::filesystem::directory_iterator(std::string(EXAMPLES_DIR) + "/sinks"))
    names.push_back(entry.path().filename().string());
  std::sort(names.begin(), names.end());
  return names;
}

std::vector<u8> sink_named(const std::string &name) {
  return test_support::bytes_of_hex_file(std::string(EXAMPLES_DIR) + "/sinks/" + name);
}

// Offers every mode of the two families on request of the sink, best first.
void fill_platform(configuration_tree_t &tree) {
  tree.fill_completely();
  for (const char *key : {"is_tv", "geometry_limit", "current_mode_set_to_priority"})
    tree.set(key, 0);
  for (const char *list : {"60_hz_priority_list", "50_hz_priority_list", "60_hz_addition_list", "50_hz_addition_list"})
    tree.remove(list);
  for (const char *mode :
       {"16 FP TBH", "5 SBSH", "4 FP TBH", "31", "20", "19", "32 FP TBH", "3", "2", "18", "17", "1"}) {
    tree.add("60_hz_priority_list", std::string(mode));
    tree.add("50_hz_priority_list", std::string(mode));
  }
  for (const char *mode : {"1", "2", "3", "17"}) {
    tree.add("60_hz_addition_list", std::string(mode));
    tree.add("50_hz_addition_list", std::string(mode));
  }
}
const std::vector<u8> offered_vics{16, 5, 4, 31, 20, 19, 32, 3, 2, 18, 17, 1};

/// The address of the platform's input: the sink's, with the input's number at its first zero.
std::pair<u8, u8> expected_address(const std::vector<u8> &sink, u8 port) {
  const auto hdmi = hdmi_block_of(sink);
  if (!hdmi) return {0xFF, 0xFF};
  u32 address = u32{hdmi->payload[3]} << 8 | hdmi->payload[4];
  if (address >> 12 == 0) return {0xFF, 0xFF};
  for (u32 shift = 8; shift != static_cast<u32>(-4); shift -= 4) {
    if ((address >> shift & 0xF) != 0) continue;
    address = (address & ~((0x10U << shift) - 1)) | u32{port} << shift;
    return {static_cast<u8>(address >> 8), static_cast<u8>(address & 0xFF)};
  }
  return {0xFF, 0xFF};
}

class SampleSink : public testing::TestWithParam<std::string> {
 protected:
  const std::vector<u8> sink_ = sink_named(GetParam());
  compose_cfg_t cfg_ = test_support::plain_settings();
};

TEST_P(SampleSink, GivesAValidEdidWithoutAWord) {
  configuration_tree_t tree;
  fill_platform(tree);
  cfg_.hdmi_3d_mode = 1;
  const auto composition = compose(sink_, cfg_, nullptr, false);
  EXPECT_TRUE(composition.composed);
  EXPECT_EQ(composition.output, "");
  end_to_end::expect_valid_edid(composition.bytes);
  EXPECT_EQ(end_to_end::text_of(composition.bytes, 0xFC), "Living room");
}

TEST_P(SampleSink, ItsModesAndThoseAddedAreOfferedInThePlatformsOrder) {
  configuration_tree_t tree;
  fill_platform(tree);
  std::vector<u8> known = vics_of(sink_);
  const std::vector<u8> timings = end_to_end::timing_vics_of(sink_);
  known.insert(known.end(), timings.begin(), timings.end());
  known.insert(known.end(), {1, 2, 3, 17});
  std::vector<u8> expected;
  for (const u8 vic : offered_vics) {
    if (std::find(known.begin(), known.end(), vic) != known.end()) expected.push_back(vic);
  }
  EXPECT_EQ(vics_of(compose(sink_, cfg_, nullptr, false).bytes), expected);
}

TEST_P(SampleSink, AddressIsExtendedByThePort) {
  configuration_tree_t tree;
  fill_platform(tree);
  for (const u8 port : {u8{1}, u8{4}, u8{15}}) {
    cfg_.port = port - 1U;
    const auto composition = compose(sink_, cfg_, nullptr, false);
    const auto hdmi = hdmi_block_of(composition.bytes);
    ASSERT_TRUE(hdmi);
    EXPECT_EQ(composition.spa_offset, hdmi->offset + 4);
    EXPECT_EQ((std::pair{hdmi->payload[3], hdmi->payload[4]}), expected_address(sink_, port));
  }
}

TEST_P(SampleSink, GivesTheSameBytesAgainTracedOrNot) {
  configuration_tree_t tree;
  fill_platform(tree);
  const auto first = compose(sink_, cfg_, nullptr, false);
  const auto second = compose(sink_, cfg_, nullptr, false);
  const auto traced = compose(sink_, cfg_, nullptr, true);
  EXPECT_EQ(hex_lines(first.bytes), hex_lines(second.bytes));
  EXPECT_EQ(first.output, second.output);
  EXPECT_EQ(hex_lines(first.bytes), hex_lines(traced.bytes));
  EXPECT_EQ(first.spa_offset, traced.spa_offset);
}

TEST_P(SampleSink, CompositionCanBeDecodedAndPrinted) {
  configuration_tree_t tree;
  fill_platform(tree);
  const auto composition = compose(sink_, cfg_, nullptr, false);
  const std::string report = test_support::output_of([&] { print_edid(composition.bytes.data(), 256, 1, "Composed"); });
  EXPECT_EQ(report.find("Composed\n\tManufacter   : TST\n\tMonitor Name : \"Living room\"\n"), 0U) << report;
  EXPECT_EQ(report.find("ERROR"), std::string::npos);
  EXPECT_EQ(report.find("WARNING"), std::string::npos);
}

TEST_P(SampleSink, GivesAnEdidFromAnEmptyConfigurationToo) {
  const configuration_tree_t tree;
  const auto composition = compose(sink_, cfg_, nullptr, false);
  EXPECT_TRUE(composition.composed);
  end_to_end::expect_valid_edid(composition.bytes);
  // Nothing is configured, so nothing is offered but the padding.
  EXPECT_EQ(vics_of(composition.bytes), (std::vector<u8>{1, 1, 1, 1}));
}

TEST_P(SampleSink, IsPrintedWithoutAnError) {
  const std::string report =
      test_support::output_of([&] { print_edid(sink_.data(), static_cast<u32>(sink_.size()), 0, "Sink"); });
  EXPECT_EQ(report.find("Sink\nVersion.Revision    = 1."), 0U) << report;
  EXPECT_EQ(report.find("ERROR"), std::string::npos) << report;
}

INSTANTIATE_TEST_SUITE_P(EndToEnd, SampleSink, testing::ValuesIn(sample_sinks()), [](const auto &sink) {
  std::string name = sink.param.substr(0, sink.param.find('.'));
  std::replace(name.begin(), name.end(), '-', '_');
  return name;
});

TEST(SampleSinks, AreThere) {
  EXPECT_GE(sample_sinks().size(), 5U);
}

// Three of them in detail.

TEST(SampleSinks, TelevisionOfThe4kKindPassesIts4kModesOn) {
  configuration_tree_t tree;
  fill_platform(tree);
  compose_cfg_t cfg = test_support::plain_settings();
  const auto hdmi = hdmi_block_of(compose(sink_named("tv_4k.txt"), cfg, nullptr, false).bytes);
  ASSERT_TRUE(hdmi);
  // Address 2.1.0.0, AI and deep colour, the configured 300 MHz, latencies of the sink, the 4K modes of both.
  EXPECT_EQ(hdmi->payload, (std::vector<u8>{0x03, 0x0C, 0x00, 0x21, 0x00, 0xB8, 0x3C, 0xEF, 0x2E, 0x2E, 0x33, 0x33,
                                            0x00, 0x60, 0x01, 0x02, 0x03}));
}

TEST(SampleSinks, TelevisionOfThe3dKindPassesItsStructuresOnWhenAskedTo) {
  configuration_tree_t tree;
  fill_platform(tree);
  tree.remove("4k_x_2k_priority_list");
  tree.add("4k_x_2k_priority_list", 1);  // Which nobody has.
  compose_cfg_t cfg = test_support::plain_settings();
  cfg.hdmi_3d_mode = 1;
  const auto hdmi = hdmi_block_of(compose(sink_named("tv_1080p_3d.txt"), cfg, nullptr, false).bytes);
  ASSERT_TRUE(hdmi);
  // 1080p60 and 1080p50 have side-by-side and top-and-bottom; the platform's list grants 1080p60 top-and-bottom.
  EXPECT_EQ(hdmi->payload, (std::vector<u8>{0x03, 0x0C, 0x00, 0x11, 0x00, 0xB8, 0x3C, 0x2F, 0x88, 0x01, 0x06}));
}

TEST(SampleSinks, FiftyHertzTelevisionTakesTheFiftyHertzLists) {
  configuration_tree_t tree;
  fill_platform(tree);
  tree.remove("60_hz_priority_list");
  tree.set("native_refresh_rate", 60);
  const auto edid = compose(sink_named("tv_720p_50hz.txt"), test_support::plain_settings(), nullptr, false);
  EXPECT_EQ(vics_of(edid.bytes), (std::vector<u8>{5, 4, 20, 19, 3, 2, 18, 17, 1}));
}

}  // namespace
