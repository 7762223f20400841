// What the platform says of HDMI 2: the configuration's table, and a caller's record.
#include <gtest/gtest.h>

#include <cstddef>

#include "edid_composer/hdmi2/layer_composition.h"
#include "support/configuration_tree.h"
#include "support/output_capture.h"
#include "support/records.h"
#include "support/request.h"

namespace hdmi2_test {
namespace {

using test_support::config_operation_t;
using test_support::configuration_tree_t;

const std::string domain = "platform.software.drivers.vorex.edid.";

/// A composition without sink, from a complete configuration.
class Hdmi2Configuration : public testing::Test {
 protected:
  Hdmi2Configuration() {
    tree_.fill_completely();
    tree_.set("geometry_limit", 0);
    for (const char *mode : {"31", "19", "20", "17"})
      tree_.add("50_hz_addition_list", std::string(mode));
  }

  composed_t compose() {
    test_support::request_t request({}, test_support::plain_settings(), nullptr);
    composed_t composed;
    composed.lines = test_support::output_of([&] { EXPECT_TRUE(request.compose()); });
    composed.bytes = request.new_edid;
    return composed;
  }
  /// The calls of one composition that are about HDMI 2.
  std::vector<std::string> calls() {
    std::vector<std::string> paths;
    for (const auto &call : tree_.calls()) {
      if (call.path.find("hdmi2") != std::string::npos) paths.push_back(call.path.substr(domain.size()));
    }
    return paths;
  }
  /// Data blocks of HDMI 2: there is always a video capability block.
  static bool has_hdmi2(const composed_t &composed) { return composed.block(extended, {0x00}).has_value(); }

  configuration_tree_t tree_;
};

TEST_F(Hdmi2Configuration, WithoutTheTableTakesOneLookUpAndNoLine) {
  const composed_t composed = compose();
  EXPECT_FALSE(has_hdmi2(composed));
  EXPECT_EQ(calls(), std::vector<std::string>{"hdmi2.enable"});
  EXPECT_EQ(composed.lines, "");
}

TEST_F(Hdmi2Configuration, WithoutEnableReadsNothingElseOfTheTable) {
  tree_.set("hdmi2.tmds_limit", 9999);
  EXPECT_FALSE(has_hdmi2(compose()));
  tree_.set("hdmi2.enable", 0);
  const composed_t composed = compose();
  EXPECT_FALSE(has_hdmi2(composed));
  EXPECT_EQ(composed.lines, "");
  for (const std::string &path : calls())
    EXPECT_EQ(path, "hdmi2.enable");
}

TEST_F(Hdmi2Configuration, IsNotReadByTheOtherOperations) {
  tree_.set("hdmi2.enable", 1);
  bytes_t bytes(256);
  const compose_cfg_t settings = test_support::plain_settings();
  EXPECT_TRUE(compose_edid(nullptr, 0, bytes.data(), 256, &settings));
  EXPECT_TRUE(compose_edid_internal(nullptr, 0, bytes.data(), 256, &settings, nullptr));
  EXPECT_EQ(calls(), std::vector<std::string>{});
}

TEST_F(Hdmi2Configuration, IsSilentWithEveryKeyMissing) {
  tree_.set("hdmi2.enable", 1);
  const composed_t composed = compose();
  EXPECT_TRUE(has_hdmi2(composed));
  EXPECT_EQ(composed.lines, "");
}

TEST_F(Hdmi2Configuration, TellsAndReplacesWhatIsOutsideOfItsLimits) {
  tree_.set("hdmi2.enable", 7);
  expect_line(compose(),
              "The value of hdmi2.enable is larger than the maximum value. Setting to maximum. Min:0 Val:7 "
              "Max:1");
  tree_.set("hdmi2.enable", 1);
  tree_.set("hdmi2.tmds_limit", 601);
  const composed_t composed = compose();
  expect_line(composed,
              "The value of hdmi2.tmds_limit is larger than the maximum value. Setting to maximum. Min:165 "
              "Val:601 Max:600");
  EXPECT_EQ(composed.forum()->at(4), 600 / 5);
  tree_.set("hdmi2.tmds_limit", -1);
  expect_line(compose(),
              "The value of hdmi2.tmds_limit is smaller than the minimum value. Setting to minimum. Min:165 "
              "Val:-1 Max:600");
  tree_.remove("hdmi2.tmds_limit");
  tree_.set("hdmi2.deep_color", 1);
  expect_line(compose(), "hdmi2.deep_color has an unrecognized value:1. Valid values: 0,2. Using:0");
}

TEST_F(Hdmi2Configuration, TellsWhatIsOfTheWrongKind) {
  tree_.set("hdmi2.enable", std::string("yes"));
  expect_line(compose(), "The value for platform path:" + domain + "hdmi2.enable is not an integer. Defaulting to:0");
  tree_.set("hdmi2.enable", 1);
  tree_.set("hdmi2.uhd_vic", std::string("yes"));
  expect_line(compose(), "The value for platform path:" + domain + "hdmi2.uhd_vic is not an integer. Defaulting to:1");
  tree_.remove("hdmi2.uhd_vic");
  tree_.set("hdmi2.vic_priority_list", 97);
  expect_line(compose(), "The value for platform path:" + domain +
                             "hdmi2.vic_priority_list is not a list. Defaulting to an empty one.");
}

TEST_F(Hdmi2Configuration, TellsAndSkipsEntriesOfItsLists) {
  tree_.set("hdmi2.enable", 1);
  for (const i32 vic : {76, 64, 128, 192, 220, -1, 0})
    tree_.add("hdmi2.vic_priority_list", vic, "node");
  tree_.add("hdmi2.vic_priority_list", std::string("97"), "text");
  tree_.add("hdmi2.vic_priority_list", 75, "node");
  for (const i32 vic : {75, 76})
    tree_.add("hdmi2.vic_addition_list", vic);
  const composed_t composed = compose();
  const bytes_t svds = composed.svds();
  EXPECT_EQ(bytes_t(svds.end() - 2, svds.end()), (bytes_t{76, 75}));
  EXPECT_EQ(std::count(composed.lines.begin(), composed.lines.end(), '\n'), 7);
  EXPECT_NE(composed.lines.find("hdmi2.vic_priority_list holds a VIC that is not supported. Expected:65-127,193-219 "
                                "Received:64 Node:node\n"),
            std::string::npos);
  EXPECT_NE(composed.lines.find("Expected an integer. Entry name:text\n"), std::string::npos);
}

TEST_F(Hdmi2Configuration, KeepsTheFirst31EntriesOfItsLists) {
  tree_.set("hdmi2.enable", 1);
  for (i32 i = 0; i < 30; ++i)
    tree_.add("hdmi2.vic_priority_list", 76);
  tree_.add("hdmi2.vic_priority_list", 75);
  tree_.add("hdmi2.vic_priority_list", 74);
  for (const i32 vic : {74, 75, 76})
    tree_.add("hdmi2.vic_addition_list", vic);
  const composed_t composed = compose();
  const bytes_t svds = composed.svds();
  EXPECT_EQ(bytes_t(svds.end() - 2, svds.end()), (bytes_t{76, 75})) << "one named again takes a place";
  expect_line(composed, "hdmi2.vic_priority_list holds more VICs than are supported. Ignoring VIC:74 Max:31");
}

// A caller's record.

TEST(Hdmi2Values, AreInitialisedWithTheDefaultsOfTheKeys) {
  hdmi2_values_t values;
  std::memset(&values, 0xA5, sizeof values);
  values.size = sizeof values;
  ASSERT_TRUE(hdmi2_values_init(&values));
  hdmi2_values_t expected{};
  expected.size = sizeof expected;
  expected.tmds_limit = 340;
  expected.uhd_vic = 1;
  expected.vrr_min = 48;
  expected.hdr_luminance = expected.rgb_quantization = expected.ycc_quantization = 2;
  EXPECT_EQ(std::memcmp(&values, &expected, sizeof values), 0);
}

TEST(Hdmi2Values, ThatAreMissingOrTooSmallAreNotInitialised) {
  EXPECT_EQ(
      test_support::output_of([] { EXPECT_FALSE(hdmi2_values_init(nullptr)); }),
      test_support::error_line("edid_composer", "hdmi2_values_init", "\"values\" parameter is NULL. values:(nil)"));
  hdmi2_values_t values{};
  values.size = sizeof values - 1;
  EXPECT_EQ(test_support::output_of([&] { EXPECT_FALSE(hdmi2_values_init(&values)); }),
            test_support::error_line("edid_composer", "hdmi2_values_init",
                                     "The size of the values is too small. Expected at least:" +
                                         std::to_string(sizeof values) + " Received:" + std::to_string(values.size)));
  EXPECT_EQ(values.tmds_limit, 0);
}

class CallersValues : public testing::Test {
 protected:
  layer_situation_t situation_;
};

TEST_F(CallersValues, ThatDontEnableItLeaveHdmi2OffWhateverTheyHold) {
  situation_.values.enable = 0;
  situation_.values.tmds_limit = 9999;
  const observed::composition_t off = observe(situation_);
  EXPECT_EQ(off.output, "");
  situation_.hdmi2.reset();
  EXPECT_EQ(observe(situation_).bytes, off.bytes);
}

TEST_F(CallersValues, OutsideOfTheirLimitsCountAsTheNearest) {
  situation_.values.tmds_limit = 9999;
  const composed_t composed = compose(situation_);
  expect_line(composed, "The value of hdmi2.tmds_limit is larger than the maximum value.");
  EXPECT_EQ(composed.forum()->at(4), 600 / 5);
  situation_.values.tmds_limit = 340;
  situation_.values.deep_color = 1;
  expect_line(compose(situation_), "hdmi2.deep_color has an unrecognized value:1.");
  situation_.values.deep_color = 0;
  situation_.name({64, 76, 0, 75});
  situation_.add({75, 76});
  const composed_t listed = compose(situation_);
  expect_line(listed, "hdmi2.vic_priority_list holds a VIC that is not supported.");
  EXPECT_EQ(listed.svds().back(), 76) << "a 0 ends the list";
}

TEST_F(CallersValues, OfAnEarlierSizeAreServedWithDefaultsForTheRest) {
  situation_.values.tmds_limit = 600;
  situation_.values.allm = 1;
  situation_.values.size = offsetof(hdmi2_values_t, allm);
  const composed_t composed = compose(situation_);
  EXPECT_EQ(composed.forum()->at(4), 600 / 5);
  EXPECT_EQ(composed.forum()->size(), 7U) << "no ALLM";
  // Half a member is none.
  situation_.values.size = offsetof(hdmi2_values_t, allm) + 3;
  EXPECT_EQ(compose(situation_).bytes, composed.bytes);
  // A later one is served as far as it is known.
  situation_.values.size = sizeof situation_.values + 64;
  EXPECT_EQ(compose(situation_).forum()->size(), 8U);
}

TEST_F(CallersValues, ThatAreTooSmallAreRefused) {
  situation_.values.size = 4;
  const observed::composition_t composition = observe(situation_);
  EXPECT_FALSE(composition.result);
  EXPECT_NE(composition.output.find("ERROR: The size of the hdmi2 is too small. Expected at least:8 Received:4\n"),
            std::string::npos);
}

TEST_F(CallersValues, AreTakenWithoutALookAtTheTable) {
  configuration_tree_t tree;
  tree.fill_completely();
  tree.set("hdmi2.enable", 0);
  test_support::request_t request({}, test_support::plain_settings(), nullptr);
  request.request.hdmi2 = &situation_.values;
  EXPECT_TRUE(request.compose());
  EXPECT_TRUE((composed_t{request.new_edid, ""}.block(extended, {0x00}).has_value()));
  EXPECT_GT(tree.lookups(), 0);
  EXPECT_EQ(configuration_tree_t::forget_calls(domain + "hdmi2.enable"), 0);
}

TEST_F(CallersValues, OfThePlatformAloneLeaveHdmi2Off) {
  configuration_tree_t tree;
  tree.set("hdmi2.enable", 1);
  situation_.hdmi2.reset();
  const observed::composition_t composition = observe(situation_);
  EXPECT_TRUE(composition.result);
  EXPECT_EQ(tree.lookups(), 0);
  EXPECT_FALSE((composed_t{composition.bytes, ""}.block(extended, {0x00}).has_value()));
}

}  // namespace
}  // namespace hdmi2_test
