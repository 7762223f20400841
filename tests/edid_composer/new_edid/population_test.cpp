// The fields of a new EDID that come from the platform, the sink and the standard.
#include "edid_composer/new_edid/population.h"

#include <gtest/gtest.h>

#include <array>
#include <cstring>
#include <string>
#include <vector>

#include "edid_composer/composer_lines.h"
#include "edid_composer/new_edid/population_fixture.h"

namespace {

using composer_lines::trace;
using composer_lines::warning;
using test_support::append;

class PopulationFields : public composer_fixtures::Population {};

TEST_F(PopulationFields, IdentityIsThePlatforms) {
  values_->product_id = 0xBEEF;
  values_->serial = 0xFFFFFFFF;
  values_->week = 255;
  values_->year = 2014;
  std::memcpy(values_->manufacturer_id, "ABC", 4);
  std::strcpy(values_->monitor_name, "Thirteen char");
  std::strcpy(values_->monitor_serial, "SN-1");
  EXPECT_EQ(output(), "");
  EXPECT_EQ(new_.product_code, 0xBEEFU);
  EXPECT_EQ(new_.serial_number, 0xFFFFFFFFU);
  EXPECT_EQ(new_.week, 255);
  EXPECT_EQ(new_.year, 2014U);
  EXPECT_STREQ(new_.manufacturer, "ABC");
  EXPECT_STREQ(new_.monitor_name, "Thirteen char");
  EXPECT_STREQ(new_.serial_string, "SN-1");
  EXPECT_STREQ(new_.data_string, "");
}

TEST_F(PopulationFields, WeekKeepsItsLowEightBits) {
  values_->week = 300;
  EXPECT_EQ(output(), "");
  EXPECT_EQ(new_.week, 44);
}

TEST_F(PopulationFields, TextsWithoutEndAreCopiedToTheirFieldsSize) {
  std::memset(values_->manufacturer_id, 'M', sizeof values_->manufacturer_id);
  std::memset(values_->monitor_name, 'N', sizeof values_->monitor_name);
  std::memset(values_->monitor_serial, 'S', sizeof values_->monitor_serial);
  const std::string output = traced_output();
  EXPECT_EQ(std::string(new_.manufacturer, 4), "MMMM");
  EXPECT_EQ(std::string(new_.monitor_name, 14), std::string(14, 'N'));
  EXPECT_EQ(std::string(new_.serial_string, 14), std::string(14, 'S'));
  EXPECT_NE(output.find(trace("_populate_new_edid", "\tManufacturer ID = MMMM")), std::string::npos);
  EXPECT_NE(output.find(trace("_populate_new_edid", "\tMonitor Name    = NNNNNNNNNNNNNN")), std::string::npos);
}

TEST_F(PopulationFields, FixedValuesOfTheBaseBlock) {
  EXPECT_EQ(output(), "");
  EXPECT_EQ(new_.version, 1);
  EXPECT_EQ(new_.revision, 3);
  EXPECT_EQ(new_.digital, 1);
  EXPECT_EQ(new_.h_size_cm, 160);
  EXPECT_EQ(new_.v_size_cm, 90);
  EXPECT_EQ(new_.gamma, 120U);
  EXPECT_EQ(new_.standby, 0);
  EXPECT_EQ(new_.suspend, 0);
  EXPECT_EQ(new_.active_off, 0);
  EXPECT_EQ(new_.standard_colorspace, 1);
  EXPECT_EQ(new_.preferred_timing, 1);
  EXPECT_EQ(new_.gtf, 0);
  EXPECT_EQ(new_.min_v_rate, 49);
  EXPECT_EQ(new_.max_v_rate, 61);
  EXPECT_EQ(new_.min_h_rate, 15);
  EXPECT_EQ(new_.max_h_rate, 70);
  EXPECT_EQ(new_.max_pixel_clock, 150U);
  EXPECT_EQ(new_.basic_audio, 1);
  EXPECT_EQ(new_.ycbcr_444, 1);
  EXPECT_EQ(new_.ycbcr_422, 1);
  EXPECT_EQ(new_.hdmi_present, 1);
  EXPECT_EQ(new_.dc_48bit, 0);
  EXPECT_EQ(new_.dvi_dual, 0);
  EXPECT_EQ(new_.underscan, 0);
  EXPECT_EQ(new_.valid, 0);
}

std::vector<u32> primaries_of(const edid_t &edid) {
  return {edid.red_x, edid.red_y, edid.green_x, edid.green_y, edid.blue_x, edid.blue_y, edid.white_x, edid.white_y};
}

TEST_F(PopulationFields, ColourPrimariesAreTheSinksWhenItsHeaderWasGood) {
  sink_->red_x = 1;
  sink_->red_y = 2;
  sink_->green_x = 3;
  sink_->green_y = 4;
  sink_->blue_x = 5;
  sink_->blue_y = 6;
  sink_->white_x = 7;
  sink_->white_y = 1023;
  EXPECT_EQ(output(), "");
  EXPECT_EQ(primaries_of(new_), (std::vector<u32>{640, 348, 287, 609, 159, 72, 290, 305}));
  sink_->valid = 1;
  EXPECT_EQ(output(), "");
  EXPECT_EQ(primaries_of(new_), (std::vector<u32>{1, 2, 3, 4, 5, 6, 7, 1023}));
}

TEST_F(PopulationFields, TimingBytesArePlatformsWith640x480AtSixtyHertz) {
  values_->established_timings_1 = 0x81;
  values_->established_timings_2 = 0xFF;
  values_->manufacturer_timings = 0x80;
  EXPECT_EQ(output(), "");
  EXPECT_EQ(new_.est_timings_1, 0xA1U);
  EXPECT_EQ(new_.est_timings_2, 0xFFU);
  EXPECT_EQ(new_.man_timings, 0x80U);
}

TEST_F(PopulationFields, StandardTimingsAreThePlatformsAndNotTheSinks) {
  append(values_->std_timings, std_timing_t{1280, 2, 60});
  append(values_->std_timings, std_timing_t{1920, 3, 75});
  append(sink_->std_timings, std_timing_t{640, 1, 60});
  EXPECT_EQ(output(), "");
  EXPECT_EQ(test_support::std_timings_of(new_.std_timings),
            (std::vector<test_support::std_timing_words_t>{{1280, 2, 60}, {1920, 3, 75}}));
  EXPECT_EQ(ll_size(&values_->std_timings), 2);
}

TEST_F(PopulationFields, UnderscanIsAFlag) {
  for (const i32 value : {0, 1, 2, -1}) {
    values_->underscan = value;
    EXPECT_EQ(output(), "");
    EXPECT_EQ(new_.underscan, value == 0 ? 0 : 1);
  }
}

TEST_F(PopulationFields, SpeakersAreTheBytesOfTheirMask) {
  const std::string output = [&] {
    values_->speaker_entry = 0x7FF;
    return traced_output();
  }();
  EXPECT_EQ(new_.speaker[0], 0xFF);
  EXPECT_EQ(new_.speaker[1], 0x07);
  EXPECT_EQ(new_.speaker[2], 0x00);
  EXPECT_NE(output.find(trace("_populate_new_edid", "\tspeaker = 3:0x00 2:0x07 1:0xFF")), std::string::npos);
  values_->speaker_entry = static_cast<i32>(0xAB345678);
  EXPECT_NE(traced_output().find(trace("_populate_new_edid", "\tspeaker = 3:0x34 2:0x56 1:0x78")), std::string::npos);
}

TEST_F(PopulationFields, Hdmi3dFollowsItsMode) {
  // Mode, the sink's flag, what is declared.
  constexpr std::array<std::array<int, 3>, 10> cases{
      {{2, 0, 1}, {2, 1, 1}, {1, 0, 0}, {1, 1, 1}, {1, 5, 1}, {0, 1, 0}, {3, 1, 0}, {-1, 1, 0}, {-2, 1, 0}, {4, 1, 0}}};
  for (const auto &[mode, of_sink, declared] : cases) {
    cfg_.hdmi_3d_mode = mode;
    sink_->hdmi_3d_present = static_cast<u8>(of_sink);
    EXPECT_EQ(output(), "");
    EXPECT_EQ(new_.hdmi_3d_present, declared) << mode;
    EXPECT_EQ(new_.image_size, declared) << mode;
    EXPECT_EQ(new_.hdmi_video_present, declared) << mode;
  }
}

TEST_F(PopulationFields, HdmiVideoIsPresentForA4kMode) {
  modes_4k_.add(3);
  modes_4k_.add(1);
  EXPECT_EQ(output(), "");
  EXPECT_EQ(new_.hdmi_video_present, 1);
  EXPECT_EQ(new_.image_size, 0);
  EXPECT_EQ(new_.hdmi_vic_len, 2);
  EXPECT_EQ(new_.hdmi_vic[0], 3U);
  EXPECT_EQ(new_.hdmi_vic[1], 1U);
  EXPECT_EQ(new_.hdmi_vic[2], 0U);
}

TEST_F(PopulationFields, TriStateValuesAreOffOnOrTheSinks) {
  for (const u32 value : {0U, 1U, 2U, 3U}) {
    for (const u8 of_sink : {u8{0}, u8{1}, u8{7}}) {
      values_->supports_ai = values_->xvYCC601 = values_->xvYCC709 = static_cast<i32>(value);
      values_->cnc0 = values_->cnc1 = values_->cnc2 = values_->cnc3 = value;
      sink_->supports_ai = sink_->xvycc601 = sink_->xvycc709 = of_sink;
      sink_->cnc0 = sink_->cnc1 = sink_->cnc2 = sink_->cnc3 = of_sink;
      EXPECT_EQ(output(), "");
      const bool expected = value == 2 ? of_sink != 0 : value != 0;
      for (const u8 flag :
           {new_.supports_ai, new_.xvycc601, new_.xvycc709, new_.cnc0, new_.cnc1, new_.cnc2, new_.cnc3}) {
        EXPECT_EQ(flag, expected ? 1 : 0) << value << " " << int{of_sink};
      }
    }
  }
}

TEST_F(PopulationFields, TriStateValuesAreIndependentOfEachOther) {
  values_->cnc1 = 1;
  values_->cnc2 = 2;
  values_->xvYCC709 = 2;
  sink_->cnc0 = sink_->cnc2 = sink_->cnc3 = 1;
  sink_->xvycc709 = 1;
  EXPECT_EQ(output(), "");
  EXPECT_EQ(new_.cnc0, 0);
  EXPECT_EQ(new_.cnc1, 1);
  EXPECT_EQ(new_.cnc2, 1);
  EXPECT_EQ(new_.cnc3, 0);
  EXPECT_EQ(new_.supports_ai, 0);
  EXPECT_EQ(new_.xvycc601, 0);
  EXPECT_EQ(new_.xvycc709, 1);
}

struct deep_colour_t {
  i32 offered_30;
  i32 offered_36;
  u8 declared_30;
  u8 declared_36;
  bool corrected;
};

TEST_F(PopulationFields, DeepColourOf30BitsNeeds36) {
  for (const auto &colour :
       {deep_colour_t{0, 0, 0, 0, false}, deep_colour_t{0, 1, 0, 1, false}, deep_colour_t{1, 1, 1, 1, false},
        deep_colour_t{1, 0, 1, 1, true}, deep_colour_t{2, 0, 1, 1, true}, deep_colour_t{0, 5, 0, 1, false}}) {
    values_->dc_30bit = colour.offered_30;
    values_->dc_36bit = colour.offered_36;
    EXPECT_EQ(output(), colour.corrected
                            ? warning("_populate_new_edid",
                                      "The HDMI standard requires 36bit Deep Color to be supported when 30bit or 48bit "
                                      "is supported. Please correct this in your platform configuration file. "
                                      "DC_30bit:true DC_36bit:false DC_48bit:false Setting 36bit support to true.")
                            : "");
    EXPECT_EQ(new_.dc_30bit, colour.declared_30);
    EXPECT_EQ(new_.dc_36bit, colour.declared_36);
    EXPECT_EQ(new_.dc_48bit, 0);
    EXPECT_EQ(new_.dc_y444, colour.declared_30 | colour.declared_36);
  }
}

TEST_F(PopulationFields, SinksDeepColourIsNotTakenOver) {
  sink_->dc_30bit = sink_->dc_36bit = sink_->dc_48bit = sink_->dc_y444 = sink_->dvi_dual = 1;
  EXPECT_EQ(output(), "");
  EXPECT_EQ(new_.dc_30bit | new_.dc_36bit | new_.dc_48bit | new_.dc_y444 | new_.dvi_dual, 0);
}

TEST_F(PopulationFields, LatencyIsTheSumOfTwoValidOnes) {
  // The platform's, the sink's, the sum; 65535 is the mark of an invalid one. The platform's is cut to 16 bits first.
  constexpr std::array<std::array<u32, 3>, 16> cases{{{0, 0, 0},
                                                      {20, 100, 120},
                                                      {500, 500, 1000},
                                                      {0, 500, 500},
                                                      {500, 0, 500},
                                                      {501, 0, 65535},
                                                      {0, 501, 65535},
                                                      {20, 600, 65535},
                                                      {501, 501, 65535},
                                                      {65535, 0, 65535},
                                                      {0, 65535, 65535},
                                                      {65536, 0, 0},
                                                      {65556, 100, 120},
                                                      {0x00020000 + 501, 3, 65535},
                                                      {0xFFFFFFFF, 3, 65535},
                                                      {0xFFFF0001, 3, 4}}};
  for (const auto &[platform, of_sink, sum] : cases) {
    for (std::size_t field = 0; field < 4; ++field) {
      for (u32 &latency : cfg_.edid_latency)
        latency = 1;
      cfg_.edid_latency[field] = platform;
      const std::array<u16 *, 4> of_sinks{&sink_->video_latency, &sink_->audio_latency, &sink_->i_video_latency,
                                          &sink_->i_audio_latency};
      for (u16 *latency : of_sinks)
        *latency = 2;
      *of_sinks[field] = static_cast<u16>(of_sink);
      EXPECT_EQ(output(), "");
      std::array<u32, 4> expected{3, 3, 3, 3};
      expected[field] = sum;
      EXPECT_EQ(
          (std::array<u32, 4>{new_.video_latency, new_.audio_latency, new_.i_video_latency, new_.i_audio_latency}),
          expected)
          << platform << " " << of_sink;
    }
  }
}

}  // namespace
