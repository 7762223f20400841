#include "long_report_texts.h"
#include "report_fixture.h"

namespace codec_test {

TEST(LongReport, PrintsARichRecord) {
  reported_record_t record;
  EXPECT_EQ(report_of(record.get(), 0), whole_long_report);
}

TEST(LongReport, LeavesTheRecordAloneAndPrintsTheSameWhileTracing) {
  reported_record_t record;
  const fields_t before = fields_of(*record.get());
  EXPECT_EQ(traced_output_of([&] { EXPECT_EQ(print_edid_struct(record.get(), 0, "TITLE"), 1); }), whole_long_report);
  EXPECT_EQ(fields_of(*record.get()), before);
}

TEST(LongReport, PrintsOnlyTheTitleOfARecordThatIsNotValid) {
  scoped_edid_t edid;
  EXPECT_EQ(report_of(edid.get(), 0), "TITLE\n");
  EXPECT_EQ(report_of(edid.get(), 0, nullptr), "\n");
  reported_record_t record;
  record->valid = 0;
  EXPECT_EQ(report_of(record.get(), 0), "TITLE\n");
}

TEST(LongReport, LeavesOutTextsThatAreEmpty) {
  reported_record_t record;
  record->monitor_name[0] = '\0';
  std::string expected = with(whole_long_report, "Monitor name        = \"TEST TV\"\n", "");
  EXPECT_EQ(report_of(record.get(), 0), expected);
  record->serial_string[0] = '\0';
  expected = with(expected, "Serial String       = \"SN 0042\"\n", "");
  EXPECT_EQ(report_of(record.get(), 0), expected);
  record->data_string[0] = '\0';
  EXPECT_EQ(report_of(record.get(), 0), with(expected, "Monitor data        = \"Some data\"\n", ""));
}

TEST(LongReport, EndsTextsAtTheirFields) {
  reported_record_t record;
  std::memset(record->manufacturer, 'M', 4);
  std::memset(record->serial_string, 'S', 14);
  std::memset(record->data_string, 'D', 14);
  std::memset(record->monitor_name, 'N', 14);
  std::string expected = with(whole_long_report, "= TST\n", "= MMMM\n");
  expected = with(expected, "\"TEST TV\"", "\"NNNNNNNNNNNNNN\"");
  expected = with(expected, "\"SN 0042\"", "\"SSSSSSSSSSSSSS\"");
  EXPECT_EQ(report_of(record.get(), 0), with(expected, "\"Some data\"", "\"DDDDDDDDDDDDDD\""));
}

TEST(LongReport, CountsTimingsThatItDoesNotPrint) {
  scoped_edid_t edid;
  edid->valid = 1;
  append(edid->dtd_list, test_support::timing_of_vic(16));
  append(edid->dtd_list, detailed_timing_t{});
  append(edid->dtd_list, test_support::timing_of_vic(4));
  const std::string report = report_of(edid.get(), 0);
  EXPECT_EQ(test_support::count_of(report, "\nDetailed Timing Descriptions: - 3 timings\nTiming 0: 1920x1080p60\n"), 1);
  EXPECT_EQ(test_support::count_of(report, "\tV sync:          Positive\nTiming 2: 1280x720p60\n"), 1);
  EXPECT_EQ(test_support::count_of(report, "Timing 1:"), 0);
}

TEST(LongReport, PrintsARateOf0ForATimingWithoutATotal) {
  scoped_edid_t edid;
  edid->valid = 1;
  detailed_timing_t timing{};
  timing.valid = 1;
  timing.pixel_clock = 123450000;
  append(edid->dtd_list, timing);
  timing.h_active = 1920;
  append(edid->dtd_list, timing);
  const std::string report = report_of(edid.get(), 0);
  EXPECT_EQ(test_support::count_of(report, "Timing 0: 0x0i0\n\tPixel Clock:     123450000\n\tRefresh Rate:    0\n"), 1);
  EXPECT_EQ(test_support::count_of(report, "Timing 1: 1920x0i0\n\tPixel Clock:     123450000\n\tRefresh Rate:    0\n"),
            1);
}

TEST(LongReport, ReportsListsOfAnotherTypeAndGoesOn) {
  reported_record_t record;
  mistype(record->std_timings, 0x1234);
  mistype(record->dtd_list, 0x1234);
  mistype(record->video_list, 0x1234);
  mistype(record->audio_list, 0x1234);
  const std::string mismatch = report_error("The list types don't match.");
  std::string expected = whole_long_report;
  for (const char *heading : {"Standard Timings: - 2 timings\n", "Descriptions: - 2 timings\n", "Video Codes: Num:4\n",
                              "Audio Codes: Num:6\n"}) {
    expected = with(expected, heading, heading + mismatch);
  }
  EXPECT_EQ(report_of(record.get(), 0), expected);
}

TEST(LongReport, CountsACorruptListAs0) {
  scoped_edid_t edid;
  edid->valid = 1;
  edid->video_list.size = 2;
  const std::string complaint =
      test_support::error_line("linked_list", "ll_verify_integrity",
                               "Corrupt List: The list's head is NULL, but the size isn't zero. Size:2") +
      test_support::bug_line("linked_list", "ll_size", "Failed integrity test. list:PTR");
  EXPECT_EQ(report_of(edid.get(), 0),
            with(empty_long_report, "\nShort Video Codes: Num:0\n", complaint + "\nShort Video Codes: Num:0\n"));
  edid->video_list.size = 0;
}

TEST(Report, RefusesAMissingRecord) {
  for (const u8 brief : {u8{0}, u8{1}}) {
    const auto lines = test_support::lines_of([&] { EXPECT_EQ(print_edid_struct(nullptr, brief, "TITLE"), 0); });
    ASSERT_EQ(lines.size(), 1u);
    const std::string prefix = "edid_decode_encode:N:print_edid_struct() ERROR: ";
    EXPECT_EQ(lines[0].substr(0, prefix.size()), prefix);
  }
}

}  // namespace codec_test
