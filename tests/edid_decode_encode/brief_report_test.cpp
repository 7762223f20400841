#include "report_fixture.h"

namespace codec_test {
namespace {

constexpr u8 brief = 1;

const std::string whole_report =
    "TITLE\n"
    "\tManufacter   : TST\n"
    "\tMonitor Name : \"TEST TV\"\n"
    "\tSerial Number: -2\n"
    "\tSerial String: \"SN 0042\"\n"
    "\tData String  : \"Some data\"\n"
    "\n\tVics:\n"
    "\t  16\t1920x1080p60Hz16x9   Native\n"
    "\t  4\t1280x720p60Hz16x9 FP SSH TBH  \n"
    "\t  39\t1920x10801250i50Hz16x9 FA LA SSF LD LD+G  Native\n"
    "\t  65\tUnknown Value   \n"
    "\n\t4k x 2k Modes:\n"
    "\t  1\t3840x2160p30Hz\n"
    "\t  4\t4096x2160p24Hz\n"
    "\n\tMandatory 3D modes:\n"
    "\t  32\t1920x1080p24Hz16x9 FP TBH \n"
    "\t  4\t1280x720p60Hz16x9 FP TBH \n"
    "\t  5\t1920x1080i60Hz16x9 SSH \n"
    "\t  19\t1280x720p50Hz16x9 FP TBH \n"
    "\t  20\t1920x1080i50Hz16x9 SSH \n"
    "\n\tAudio:\n"
    "\t  Code: 1:PCM Channels:8 Freq:32kHz 44.1kHz 48kHz 88.2kHz 96kHz 176.4kHz 192kHz  Bits:16bits 20bits 24bits \n"
    "\t  Code: 2:AC3 Channels:6 Freq:32kHz 44.1kHz 48kHz  Max Rate:640kHz\n"
    "\t  Code: 10:EAC3/DD+ Channels:8 Freq:44.1kHz 48kHz  val:3\n"
    "\t  Code: 14:WMA pro Channels:2 Freq:48kHz  Max Profile:5\n"
    "\t  Code: 17:HE AACv2 Channels:6 Freq: NoFreqSpecified\n"
    "\t  Code:0 Unrecognized audio code.\n"
    "\n\tAddress=1.2.0.15\n";

const std::string empty_report =
    "TITLE\n"
    "\tManufacter   : \n"
    "\tSerial Number: 0\n"
    "\n\tVics:\n"
    "\n\tAddress=0.0.0.0\n";

}  // namespace

TEST(BriefReport, PrintsARichRecord) {
  reported_record_t record;
  EXPECT_EQ(report_of(record.get(), brief), whole_report);
  EXPECT_EQ(report_of(record.get(), 0xFF), whole_report);
}

TEST(BriefReport, LeavesTheRecordAloneAndPrintsTheSameWhileTracing) {
  reported_record_t record;
  const fields_t before = fields_of(*record.get());
  EXPECT_EQ(traced_output_of([&] { EXPECT_EQ(print_edid_struct(record.get(), brief, "TITLE"), 1); }), whole_report);
  EXPECT_EQ(fields_of(*record.get()), before);
}

TEST(BriefReport, PrintsIdentityAndAddressOfARecordStraightFromPreparation) {
  scoped_edid_t edid;
  EXPECT_EQ(report_of(edid.get(), brief), empty_report);
}

TEST(BriefReport, DoesNotAskWhetherTheRecordIsValid) {
  reported_record_t record;
  record->valid = 0;
  EXPECT_EQ(report_of(record.get(), brief), whole_report);
}

TEST(BriefReport, PrintsAMissingTitleAsAnEmptyOne) {
  scoped_edid_t edid;
  EXPECT_EQ(report_of(edid.get(), brief, nullptr), with(empty_report, "TITLE\n", "\n"));
  EXPECT_EQ(report_of(edid.get(), brief, ""), with(empty_report, "TITLE\n", "\n"));
}

TEST(BriefReport, LeavesOutTextsThatAreEmpty) {
  reported_record_t record;
  record->monitor_name[0] = '\0';
  std::string expected = with(whole_report, "\tMonitor Name : \"TEST TV\"\n", "");
  EXPECT_EQ(report_of(record.get(), brief), expected);
  record->serial_string[0] = '\0';
  expected = with(expected, "\tSerial String: \"SN 0042\"\n", "");
  EXPECT_EQ(report_of(record.get(), brief), expected);
  record->data_string[0] = '\0';
  EXPECT_EQ(report_of(record.get(), brief), with(expected, "\tData String  : \"Some data\"\n", ""));
}

TEST(BriefReport, EndsTextsAtTheirFields) {
  scoped_edid_t edid;
  std::memset(edid->manufacturer, 'M', 4);
  std::memset(edid->serial_string, 'S', 14);
  std::memset(edid->data_string, 'D', 14);
  std::memset(edid->monitor_name, 'N', 14);
  EXPECT_EQ(report_of(edid.get(), brief),
            "TITLE\n"
            "\tManufacter   : MMMM\n"
            "\tMonitor Name : \"NNNNNNNNNNNNNN\"\n"
            "\tSerial Number: 0\n"
            "\tSerial String: \"SSSSSSSSSSSSSS\"\n"
            "\tData String  : \"DDDDDDDDDDDDDD\"\n"
            "\n\tVics:\n"
            "\n\tAddress=0.0.0.0\n");
}

TEST(BriefReport, PrintsTheSerialNumberAsASignedNumber) {
  scoped_edid_t edid;
  edid->serial_number = 0x7FFFFFFF;
  EXPECT_EQ(report_of(edid.get(), brief), with(empty_report, "Number: 0\n", "Number: 2147483647\n"));
  edid->serial_number = 0x80000000;
  EXPECT_EQ(report_of(edid.get(), brief), with(empty_report, "Number: 0\n", "Number: -2147483648\n"));
}

TEST(BriefReport, PrintsThe4kModesOnlyUpToTheirNumber) {
  scoped_edid_t edid;
  for (u32 i = 0; i < 7; ++i)
    edid->hdmi_vic[i] = i;
  edid->hdmi_vic_len = 7;
  EXPECT_EQ(report_of(edid.get(), brief), with(empty_report, "\tVics:\n",
                                               "\tVics:\n"
                                               "\n\t4k x 2k Modes:\n"
                                               "\t  0\tUnknown Value\n"
                                               "\t  1\t3840x2160p30Hz\n"
                                               "\t  2\t3840x2160p25Hz\n"
                                               "\t  3\t3840x2160p24Hz\n"
                                               "\t  4\t4096x2160p24Hz\n"
                                               "\t  5\tUnknown Value\n"
                                               "\t  6\tUnknown Value\n"));
  edid->hdmi_vic_len = 0;
  EXPECT_EQ(report_of(edid.get(), brief), empty_report);
}

TEST(BriefReport, PrintsTheAudioSectionFromOneFormatOn) {
  scoped_edid_t edid;
  append(edid->audio_list, short_audio_desc_t{16, 2, 0x04, 0, 0, 0, 0});
  EXPECT_EQ(report_of(edid.get(), brief), with(empty_report, "\tVics:\n",
                                               "\tVics:\n"
                                               "\n\tAudio:\n"
                                               "\t  Code: 16:HE AAC Channels:2 Freq:48kHz \n"));
}

TEST(BriefReport, PrintsNoMore4kModesThanTheRecordHolds) {
  scoped_edid_t edid;
  edid->hdmi_vic_len = 255;
  edid->xvycc601 = 1;
  EXPECT_EQ(test_support::count_of(report_of(edid.get(), brief), "\t  0\tUnknown Value\n"), 7);
}

TEST(BriefReport, ReportsAListOfAnotherTypeAndGoesOn) {
  reported_record_t record;
  mistype(record->video_list, 0x1234);
  mistype(record->audio_list, 0x1234);
  const std::string mismatch = report_error("The list types don't match.");
  EXPECT_EQ(report_of(record.get(), brief), with(with(whole_report, "\n\tVics:\n", "\n\tVics:\n" + mismatch),
                                                 "\n\tAudio:\n", "\n\tAudio:\n" + mismatch));
}

}  // namespace codec_test
