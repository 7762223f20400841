// Each section of the long report, with and without what it prints.
#include "long_report_texts.h"
#include "report_fixture.h"

namespace codec_test {
namespace {

using change_t = void (*)(edid_t *);

std::string report_with(change_t change) {
  scoped_edid_t edid;
  edid->valid = 1;
  change(edid.get());
  return report_of(edid.get(), 0);
}

}  // namespace

TEST(LongReport, PrintsAValidRecordWithoutAnything) {
  EXPECT_EQ(report_with([](edid_t *) {}), empty_long_report);
}

TEST(LongReport, PrintsTheFractionOfGammaWithoutALeadingZero) {
  const std::pair<u32, const char *> cases[] = {{0, "1.0"}, {5, "1.5"}, {50, "1.50"}, {105, "2.5"}, {255, "3.55"}};
  for (const auto &[gamma, text] : cases) {
    scoped_edid_t edid;
    edid->valid = 1;
    edid->gamma = gamma;
    EXPECT_EQ(report_of(edid.get(), 0), with(empty_long_report, "= 1.0\n", std::string("= ") + text + "\n"));
  }
}

TEST(LongReport, PrintsSizesOnlyWhenBothAreGiven) {
  EXPECT_EQ(report_with([](edid_t *edid) { edid->h_size_cm = 100; }), empty_long_report);
  EXPECT_EQ(report_with([](edid_t *edid) { edid->v_size_cm = 100; }), empty_long_report);
  EXPECT_EQ(report_with([](edid_t *edid) {
              edid->h_size_cm = 255;
              edid->v_size_cm = 2;
            }),
            with(empty_long_report, "Horizontal/Vertical image sizes are set to 0.\n",
                 "Horizontal size     = 255 cm (100 in)\n"
                 "Vertical size       = 2 cm (0 in)\n"));
}

TEST(LongReport, PrintsEachFeature) {
  EXPECT_EQ(report_with([](edid_t *edid) { edid->standby = 1; }),
            with(empty_long_report, "Stand-by              = unsupported", "Stand-by              = supported"));
  EXPECT_EQ(report_with([](edid_t *edid) { edid->suspend = 1; }),
            with(empty_long_report, "Suspend               = unsupported", "Suspend               = supported"));
  EXPECT_EQ(report_with([](edid_t *edid) { edid->active_off = 1; }),
            with(empty_long_report, "Active-off            = unsupported", "Active-off            = supported"));
  EXPECT_EQ(report_with([](edid_t *edid) { edid->standard_colorspace = 1; }),
            with(empty_long_report, "Standard colorspace   = false", "Standard colorspace   = true"));
  EXPECT_EQ(report_with([](edid_t *edid) { edid->preferred_timing = 1; }),
            with(empty_long_report, "Preferred timing mode = false", "Preferred timing mode = true"));
  EXPECT_EQ(report_with([](edid_t *edid) { edid->gtf = 1; }),
            with(empty_long_report, "GTF                   = unsupported", "GTF                   = supported"));
}

TEST(LongReport, PrintsTheHeightOfStandardTimingsByTheirAspectRatio) {
  EXPECT_EQ(report_with([](edid_t *edid) {
              append(edid->std_timings, std_timing_t{1440, 0, 60});
              append(edid->std_timings, std_timing_t{1152, 1, 85});
              append(edid->std_timings, std_timing_t{1288, 2, 61});
              append(edid->std_timings, std_timing_t{1368, 3, 123});
              append(edid->std_timings, std_timing_t{1280, 4, 60});
            }),
            with(empty_long_report, "\nStandard Timings: - 0 timings\n",
                 "\nStandard Timings: - 5 timings\n"
                 "\t1440x1440p60\n"
                 "\t1152x864p85\n"
                 "\t1288x1030p61\n"
                 "\t1368x769p123\n"
                 "\t1280xp60\n"));
}

TEST(LongReport, PrintsImageSizesInWholeInchesToo) {
  scoped_edid_t edid;
  edid->valid = 1;
  detailed_timing_t timing = test_support::timing_of_vic(16);
  timing.h_image_size = 254;
  timing.v_image_size = 253;
  append(edid->dtd_list, timing);
  timing.h_image_size = 4095;
  timing.v_image_size = 26;
  append(edid->dtd_list, timing);
  const std::string report = report_of(edid.get(), 0);
  EXPECT_EQ(test_support::count_of(report, "\tH image size:    254 mm (10 in)\n\tV image size:    253 mm (9 in)\n"), 1);
  EXPECT_EQ(test_support::count_of(report, "\tH image size:    4095 mm (161 in)\n\tV image size:    26 mm (1 in)\n"),
            1);
}

TEST(LongReport, PrintsThe3dSectionOnlyWithMandatory3d) {
  reported_record_t record;
  record->hdmi_3d_present = 0;
  EXPECT_EQ(report_of(record.get(), 0), with(whole_long_report,
                                             "\nMandatory 3D modes: Num:5\n"
                                             "\t32\t1920x1080p24Hz16x9 FP TBH \n"
                                             "\t4\t1280x720p60Hz16x9 FP TBH \n"
                                             "\t5\t1920x1080i60Hz16x9 SSH \n"
                                             "\t19\t1280x720p50Hz16x9 FP TBH \n"
                                             "\t20\t1920x1080i50Hz16x9 SSH \n",
                                             ""));
}

TEST(LongReport, PrintsThe4kSectionOnlyWithCodes) {
  reported_record_t record;
  record->hdmi_vic_len = 0;
  EXPECT_EQ(report_of(record.get(), 0), with(whole_long_report,
                                             "\n4k x 2k Modes: Num:2\n"
                                             "\t1\t3840x2160p30Hz\n"
                                             "\t4\t4096x2160p24Hz\n",
                                             ""));
}

TEST(LongReport, PrintsUnderscanAndBasicAudioInTheHdmiSectionOnly) {
  EXPECT_EQ(report_with([](edid_t *edid) {
              edid->underscan = 1;
              edid->basic_audio = 1;
            }),
            empty_long_report);
  EXPECT_EQ(report_with([](edid_t *edid) {
              edid->hdmi_present = 1;
              edid->basic_audio = 1;
            }),
            empty_long_report +
                "Address           = 0.0.0.0\n"
                "Supports AI       = false\n"
                "Bits per pixel    = \n"
                "Supports Dual DVI = false\n"
                "Max TMDS Clock    = 0\n"
                "CNC0              = 0\n"
                "CNC1              = 0\n"
                "CNC2              = 0\n"
                "CNC3              = 0\n"
                "Underscan support = false\n"
                "Basic audio       = true\n");
}

TEST(LongReport, PrintsEachFieldOfTheHdmiSection) {
  const struct {
    u8 edid_t::*field;
    const char *part;
    const char *replacement;
  } cases[] = {{&edid_t::dc_48bit, "= 36bits Y444 \n", "= 48bits 36bits Y444 \n"},
               {&edid_t::dc_30bit, "= 36bits Y444 \n", "= 36bits 30bits Y444 \n"},
               {&edid_t::dvi_dual, "Dual DVI = false", "Dual DVI = true"},
               {&edid_t::cnc0, "CNC0              = 0", "CNC0              = 1"},
               {&edid_t::cnc2, "CNC2              = 0", "CNC2              = 1"},
               {&edid_t::basic_audio, "Basic audio       = false", "Basic audio       = true"},
               {&edid_t::xvycc709, "Colorimetry: xvYCC601 \n", "Colorimetry: xvYCC601 xvYCC709 \n"}};
  for (const auto &each : cases) {
    reported_record_t record;
    record.get()->*each.field = 1;
    EXPECT_EQ(report_of(record.get(), 0), with(whole_long_report, each.part, each.replacement));
  }
}

TEST(LongReport, PrintsTheColorimetryWithoutAnHdmiBlockToo) {
  EXPECT_EQ(report_with([](edid_t *edid) { edid->xvycc709 = 1; }),
            empty_long_report + "Additional Colorimetry: xvYCC709 \n");
  EXPECT_EQ(report_with([](edid_t *edid) { edid->xvycc601 = 1; }),
            empty_long_report + "Additional Colorimetry: xvYCC601 \n");
}

TEST(LongReport, DoesNotPrintSomeFields) {
  EXPECT_EQ(report_with([](edid_t *edid) {
              edid->digital = 1;
              edid->red_x = edid->red_y = edid->green_x = edid->green_y = 1;
              edid->blue_x = edid->blue_y = edid->white_x = edid->white_y = 1;
              edid->checksum = 1;
              edid->ycbcr_444 = edid->ycbcr_422 = 1;
              edid->video_latency = edid->audio_latency = edid->i_video_latency = edid->i_audio_latency = 1;
              edid->image_size = 1;
              edid->hdmi_video_present = 1;
              edid->speaker[2] = 0xFF;
            }),
            empty_long_report);
}

}  // namespace codec_test
