// The report of the record.
#include "codec_cases.h"

namespace hdmi2_test {
namespace {

constexpr const char *full_report =
    "TITLE\n"
    "\n"
    "Short Video Codes, with YCbCr 4:2:0: Num:5\n"
    "\t16\t1920x1080p60Hz16x9 Native\n"
    "\t97\t3840x2160p60Hz16x9 YCbCr 4:2:0\n"
    "\t102\t4096x2160p60Hz256x135 YCbCr 4:2:0\n"
    "\t107\t3840x2160p60Hz64x27\n"
    "\t220\tUnknown Value\n"
    "\n"
    "Modes in YCbCr 4:2:0 only: Num:1\n"
    "\t96\t3840x2160p50Hz16x9\n"
    "\n"
    "YCbCr 4:2:0 capability map:\n"
    "\tBytes                   = 1\n"
    "\n"
    "HDMI Forum:\n"
    "\tVersion                 = 1\n"
    "\tMax TMDS rate           = 600 MHz\n"
    "\tSCDC                    = supported\n"
    "\tSCDC read request       = unsupported\n"
    "\tScrambling to 340 MHz   = supported\n"
    "\tFixed rate link         = 12 Gbit/s on 4 lanes\n"
    "\tVICs of HDMI_VIC modes  = supported\n"
    "\t30 bits in 4:2:0        = supported\n"
    "\t36 bits in 4:2:0        = unsupported\n"
    "\t48 bits in 4:2:0        = unsupported\n"
    "\tAuto low-latency mode   = supported\n"
    "\tMin variable rate       = 48 Hz\n"
    "\tMax variable rate       = 120 Hz\n"
    "\n"
    "Video capability:\n"
    "\tRGB quantization range  = selectable\n"
    "\tYCC quantization range  = not selectable\n"
    "\tPreferred timing        = as the other timings\n"
    "\tIT timings              = always underscanned\n"
    "\tCE timings              = overscanned or underscanned\n"
    "\n"
    "Colorimetry:\n"
    "\tColor spaces            = xvYCC601, BT2020YCC, BT2020RGB\n"
    "\tGamut                   = metadata profile 0\n"
    "\n"
    "HDR static metadata:\n"
    "\tTransfer functions      = SDR gamma, PQ (SMPTE ST 2084), HLG\n"
    "\tStatic metadata         = type 1\n"
    "\tMax luminance           = 603.67 cd/m2 (code 115)\n"
    "\tMax average luminance   = 351.25 cd/m2 (code 90)\n"
    "\tMin luminance           = 0.0301 cd/m2 (code 18)\n"
    "\n"
    "HDR dynamic metadata:\n"
    "\tBytes                   = 07 05 01 00 02 00 00 02 04 00\n"
    "\tMetadata type           = 1\n"
    "\tVersion of the type     = 2\n"
    "\tMetadata type           = 4\n"
    "\n"
    "HDR10+:\n"
    "\tBytes                   = 01 8B 84 90 39\n"
    "\tApplication version     = 1\n"
    "\n"
    "Dolby Vision:\n"
    "\tBytes                   = 01 46 D0 00 2A 18 03 51 59\n"
    "\tVersion                 = 1\n"
    "\t2160p60                 = supported\n"
    "\n"
    "FreeSync:\n"
    "\tBytes                   = 1A 00 00 01 01 30 90 E6\n"
    "\tVersion                 = 1\n"
    "\tMin refresh rate        = 48 Hz\n"
    "\tMax refresh rate        = 144 Hz\n";

constexpr const char *empty_report =
    "TITLE\n"
    "\n"
    "Short Video Codes, with YCbCr 4:2:0: Num:0\n"
    "\n"
    "Modes in YCbCr 4:2:0 only: Num:0\n"
    "\n"
    "YCbCr 4:2:0 capability map: none\n"
    "\n"
    "HDMI Forum: none\n"
    "\n"
    "Video capability: none\n"
    "\n"
    "Colorimetry: none\n"
    "\n"
    "HDR static metadata: none\n"
    "\n"
    "HDR dynamic metadata: none\n"
    "\n"
    "HDR10+: none\n"
    "\n"
    "Dolby Vision: none\n"
    "\n"
    "FreeSync: none\n";

std::string report_of(const hdmi2_t &record, const char *title = "TITLE") {
  return test_support::output_of([&] { EXPECT_TRUE(print_hdmi2(&record, title)); });
}

hdmi2_t full_record() {
  return read_blocks({{0x45, 144, 97, 102, 107, 220},
                      {0x6A, 0xD8, 0x5D, 0xC4, 1, 120, 0x88, 0x69, 0x02, 0x30, 120},
                      {0xE2, 0x00, 0x4B},
                      {0xE3, 0x05, 0xC1, 0x01},
                      {0xE6, 0x06, 0x0D, 0x01, 115, 90, 18},
                      {0xE2, 0x0E, 96},
                      {0xE2, 0x0F, 0x06},
                      {0xEA, 0x07, 0x05, 0x01, 0x00, 0x02, 0x00, 0x00, 0x02, 0x04, 0x00},
                      {0xE5, 0x01, 0x8B, 0x84, 0x90, 0x39},
                      {0xE9, 0x01, 0x46, 0xD0, 0x00, 0x2A, 0x18, 0x03, 0x51, 0x59},
                      {0x68, 0x1A, 0x00, 0x00, 0x01, 0x01, 48, 144, 0xE6}});
}

/// A line of the report of a record that was changed.
std::string line_of(const std::string &label, const std::function<void(hdmi2_t *)> &change) {
  hdmi2_t record = full_record();
  change(&record);
  for (const std::string &line : test_support::lines_in(report_of(record))) {
    if (line.compare(0, label.size() + 1, "\t" + label) == 0) return line.substr(line.find('=') + 2);
  }
  return "no line";
}

}  // namespace

TEST(Hdmi2Report, HasEveryField) {
  EXPECT_EQ(report_of(full_record()), full_report);
}

TEST(Hdmi2Report, SaysWhatIsMissing) {
  EXPECT_EQ(report_of(empty_record()), empty_report);
  EXPECT_EQ(report_of(empty_record(), nullptr), std::string(empty_report).substr(5));
}

TEST(Hdmi2Report, HasAWordForEveryValue) {
  const auto rate = [](u32 value) {
    return line_of("Max TMDS rate", [&](hdmi2_t *record) { record->max_tmds_rate = value; });
  };
  EXPECT_EQ(rate(0), "340 MHz or less");
  EXPECT_EQ(rate(1275), "1275 MHz");
  const auto link = [](u8 value) {
    return line_of("Fixed rate link", [&](hdmi2_t *record) { record->frl_rate = value; });
  };
  EXPECT_EQ(link(0), "none");
  EXPECT_EQ(link(1), "3 Gbit/s on 3 lanes");
  EXPECT_EQ(link(2), "6 Gbit/s on 3 lanes");
  EXPECT_EQ(link(3), "6 Gbit/s on 4 lanes");
  EXPECT_EQ(link(4), "8 Gbit/s on 4 lanes");
  EXPECT_EQ(link(5), "10 Gbit/s on 4 lanes");
  EXPECT_EQ(link(6), "12 Gbit/s on 4 lanes");
  EXPECT_EQ(link(7), "7 (unknown)");
  EXPECT_EQ(link(255), "255 (unknown)");
  const auto scan = [](u8 value) { return line_of("CE timings", [&](hdmi2_t *record) { record->ce_scan = value; }); };
  EXPECT_EQ(scan(0), "unsupported");
  EXPECT_EQ(scan(1), "always overscanned");
  EXPECT_EQ(scan(2), "always underscanned");
  EXPECT_EQ(scan(3), "overscanned or underscanned");
  EXPECT_EQ(line_of("Static metadata", [](hdmi2_t *record) { record->metadata_types = 0x81; }), "type 1, bit 7");
  EXPECT_EQ(line_of("Transfer functions", [](hdmi2_t *record) { record->eotfs = 0x22; }), "HDR gamma, bit 5");
  EXPECT_EQ(line_of("Gamut", [](hdmi2_t *record) { record->gamut_metadata = 0xFE; }),
            "metadata profile 1, metadata profile 2, metadata profile 3, default RGB, sRGB, ICtCp, ST2113RGB");
  EXPECT_EQ(line_of("Color spaces", [](hdmi2_t *record) { record->colorimetry = 0x3E; }),
            "xvYCC709, sYCC601, opYCC601, opRGB, BT2020cYCC");
  EXPECT_EQ(line_of("Short Video Codes", [](hdmi2_t *record) { record->y420_map_bytes = 0; }), "all");
}

TEST(Hdmi2Report, TellsWhatIsNotDeclared) {
  EXPECT_EQ(line_of("Auto low-latency mode", [](hdmi2_t *record) { record->allm_present = 0; }), "not declared");
  EXPECT_EQ(line_of("Auto low-latency mode", [](hdmi2_t *record) { record->allm = 0; }), "unsupported");
  EXPECT_EQ(line_of("Variable refresh rate", [](hdmi2_t *record) { record->vrr_present = 0; }), "not declared");
  EXPECT_EQ(line_of("Min variable rate", [](hdmi2_t *record) { record->vrr_min = 0; }), "0 Hz (unsupported)");
  EXPECT_EQ(line_of("Max variable rate", [](hdmi2_t *record) { record->vrr_max = 0; }), "0 Hz (no limit declared)");
  const auto two_luminances = [](hdmi2_t *record) { record->luminance_count = 2; };
  EXPECT_EQ(line_of("Max average luminance", two_luminances), "351.25 cd/m2 (code 90)");
  EXPECT_EQ(line_of("Min luminance", two_luminances), "not declared");
}

TEST(Hdmi2Report, ReadsNoMoreOfABlockThanItHas) {
  const auto dynamic = [](const bytes_t &payload) {
    return test_support::count_of(report_of(read_blocks({test_support::data_block(7, payload)})), "Metadata type");
  };
  EXPECT_EQ(dynamic({0x07, 0x02, 0x01, 0x00}), 1);
  EXPECT_EQ(dynamic({0x07, 0xFF, 0x01, 0x00}), 1);
  EXPECT_EQ(dynamic({0x07, 0x00, 0x00, 0x00}), 0);
  EXPECT_EQ(dynamic({0x07, 0x02, 0x01, 0x00, 0x02, 0x02, 0x00}), 2);
  EXPECT_EQ(dynamic({0x07, 0x02, 0x01, 0x00, 0x01, 0x02}), 1);
}

TEST(Hdmi2Report, SaysOf2160p60InDolbyVisionOnlyWhatItsVersionDoes) {
  const auto version = [](u8 byte) {
    return line_of("2160p60", [&](hdmi2_t *record) { record->dolby_vision.payload[4] = byte; });
  };
  EXPECT_EQ(version(0x02), "supported");
  EXPECT_EQ(version(0x20), "unsupported");
  EXPECT_EQ(version(0x42), "no line");
}

TEST(Hdmi2Report, OfNumbersThatNoBlockCanHoldEnds) {
  hdmi2_t record = empty_record();
  std::memset(&record.svd_count, 0xFF, sizeof record - sizeof record.size);
  EXPECT_EQ(test_support::count_of(report_of(record), "\t255\tUnknown Value"), int{HDMI2_MOST_SVDS} + 30);
}

}  // namespace hdmi2_test
