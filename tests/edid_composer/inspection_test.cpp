// The entry points that look at EDIDs without composing one.
#include <gtest/gtest.h>

#include <memory>
#include <string>
#include <utility>
#include <vector>

#include "edid_composer.h"
#include "edid_composer/composer_lines.h"
#include "support/edid_builder.h"
#include "support/failing_allocation.h"
#include "support/output_capture.h"
#include "support/records.h"

namespace inspection_tests {
namespace {

using composer_lines::error;
using test_support::base_block_builder_t;
using test_support::bytes_t;
using test_support::error_line;
using test_support::extension_builder_t;
using test_support::join;
using test_support::output_of;
using test_support::traced_output_of;

constexpr const char *codec = "edid_decode_encode";

// Prints from a heap block of exactly the bytes given, whatever the size says.
void print(const bytes_t &bytes, u32 size, u8 brief = 1, const char *title = "TITLE") {
  const std::unique_ptr<u8[]> exact(new u8[bytes.size()]);
  std::copy(bytes.begin(), bytes.end(), exact.get());
  print_edid(exact.get(), size, brief, title);
}

std::string printed(const bytes_t &bytes, u32 size, u8 brief = 1, const char *title = "TITLE") {
  return output_of([&] { print(bytes, size, brief, title); });
}

bytes_t base_block() {
  return base_block_builder_t().byte(12, 42).descriptor(0, test_support::text_descriptor(0xFC, "TV")).build();
}

bytes_t extension() {
  return extension_builder_t().block(test_support::video_block({0x90, 0x04})).build();
}

const std::string base_report =
    "TITLE\n"
    "\tManufacter   : TST\n"
    "\tMonitor Name : \"TV\"\n"
    "\tSerial Number: 42\n"
    "\n\tVics:\n"
    "\n\tAddress=0.0.0.0\n";

const std::string whole_report =
    "TITLE\n"
    "\tManufacter   : TST\n"
    "\tMonitor Name : \"TV\"\n"
    "\tSerial Number: 42\n"
    "\n\tVics:\n"
    "\t  16\t1920x1080p60Hz16x9   Native\n"
    "\t  4\t1280x720p60Hz16x9   \n"
    "\n\tAddress=0.0.0.0\n";

const std::string no_block =
    error("print_edid", "\"edid_block\" memory block parameter is NULL. Exiting. edid_block:(nil)");

std::string bad_size(const std::string &size) {
  return error("print_edid", "Edid size is not an valid value. edid_bytes=" + size + " Range=(128-256)");
}

}  // namespace

TEST(PrintEdid, PrintsABaseBlockAlone) {
  EXPECT_EQ(printed(base_block(), 128), base_report);
}

TEST(PrintEdid, PrintsABaseBlockWithItsExtension) {
  EXPECT_EQ(printed(join(base_block(), extension()), 256), whole_report);
}

TEST(PrintEdid, GoesByTheSizeNotByTheNumberOfExtensionsAnnounced) {
  const bytes_t announcing = base_block_builder_t()
                                 .byte(12, 42)
                                 .descriptor(0, test_support::text_descriptor(0xFC, "TV"))
                                 .extensions(1)
                                 .build();
  EXPECT_EQ(printed(announcing, 128), base_report);
  EXPECT_EQ(printed(join(announcing, extension()), 256), whole_report);
  EXPECT_EQ(printed(join(base_block(), extension()), 128), base_report);
}

TEST(PrintEdid, HandsFormAndTitleOn) {
  const std::string long_report = printed(base_block(), 128, 0, "Some title");
  EXPECT_EQ(long_report.substr(0, long_report.find('\n', 12)), "Some title\nVersion.Revision    = 1.3");
  EXPECT_EQ(printed(base_block(), 128, 1, nullptr), base_report.substr(5));
  EXPECT_EQ(printed(base_block(), 128, 1, ""), base_report.substr(5));
  EXPECT_EQ(printed(base_block(), 128, 0x80), base_report);
}

TEST(PrintEdid, PrintsTheLongReportOfBothBlocks) {
  const bytes_t with_hdmi = join(base_block(), extension_builder_t()
                                                   .flags(0xC0)
                                                   .block(test_support::video_block({0x90}))
                                                   .block(test_support::audio_block({0x09, 0x07, 0x05}))
                                                   .block(test_support::hdmi_block({0x10, 0x00}))
                                                   .build());
  EXPECT_EQ(printed(with_hdmi, 256, 0),
            "TITLE\n"
            "Version.Revision    = 1.3\n"
            "Manufacture Name    = TST\n"
            "Monitor name        = \"TV\"\n"
            "Serial Number       = 0x2a\n"
            "Product Code        = 0x0\n"
            "Week of manufacture = 0\n"
            "Year of manufacture = 1990\n"
            "Gamma               = 1.0\n"
            "Horizontal/Vertical image sizes are set to 0.\n"
            "\nPower Management\n"
            "\tStand-by              = unsupported\n"
            "\tSuspend               = unsupported\n"
            "\tActive-off            = unsupported\n"
            "\tStandard colorspace   = false\n"
            "\tPreferred timing mode = false\n"
            "\tGTF                   = unsupported\n"
            "\nColorimetry:\n"
            "\nStandard Timings: - 0 timings\n"
            "\nDetailed Timing Descriptions: - 0 timings\n"
            "\nMonitor Limits:\n"
            "\tMin Vertical Rate:   0 Hz\n"
            "\tMax Vertical Rate:   0 Hz\n"
            "\tMin Horizontal Rate: 0 KHz\n"
            "\tMax Horizontal Rate: 0 KHz\n"
            "\tMax Pixel Clock:     0 MHz\n"
            "Number of extension blocks = 0\n"
            "\nShort Video Codes: Num:1\n"
            "\t16\t1920x1080p60Hz16x9   Native\n"
            "\nShort Audio Codes: Num:1\n"
            "\tCode: 1:PCM Channels:2 Freq:32kHz 44.1kHz 48kHz  Bits:16bits 24bits \n"
            "\nSpeaker config    = \n"
            "Address           = 1.0.0.0\n"
            "Supports AI       = false\n"
            "Bits per pixel    = \n"
            "Supports Dual DVI = false\n"
            "Max TMDS Clock    = 0\n"
            "CNC0              = 0\n"
            "CNC1              = 0\n"
            "CNC2              = 0\n"
            "CNC3              = 0\n"
            "Underscan support = true\n"
            "Basic audio       = true\n");
}

TEST(PrintEdid, PrintsTheDecodersTracesBeforeTheReport) {
  EXPECT_EQ(traced_output_of([] { print(join(base_block(), extension()), 256); }),
            test_support::trace_line("decode_edid_extensions", "Video Data Block. Len=2") + whole_report);
}

TEST(PrintEdid, RefusesAMissingEdidFirst) {
  EXPECT_EQ(output_of([] { print_edid(nullptr, 128, 1, "TITLE"); }), no_block);
  EXPECT_EQ(output_of([] { print_edid(nullptr, 200, 0, nullptr); }), no_block);
}

TEST(PrintEdid, RefusesSizesThatAreNotAMultipleOf128) {
  for (const u32 size : {1u, 64u, 127u, 129u, 200u, 255u, 257u, 300u}) {
    EXPECT_EQ(printed(base_block(), size), bad_size(std::to_string(size)));
  }
  EXPECT_EQ(printed(base_block(), 0xFFFFFFFF), bad_size("-1"));
}

TEST(PrintEdid, PrintsTheBaseBlockForASizeOf0) {
  EXPECT_EQ(printed(base_block(), 0), base_report);
}

TEST(PrintEdid, LooksForTimingsOfTheExtensionInFurtherBlocksToo) {
  bytes_t third(128, 0);
  // The extension's collection ends at its byte 7, so slots start at 7 + 18 x 7 = 133.
  const bytes_t timing = test_support::timing_descriptor(test_support::timing_of_vic(16));
  std::copy(timing.begin(), timing.end(), third.begin() + 5);
  const bytes_t edid = join(join(base_block(), extension()), third);
  ASSERT_EQ(edid[130], 7);
  const std::string of_384 = printed(edid, 384, 0);
  EXPECT_EQ(test_support::count_of(of_384, "\nDetailed Timing Descriptions: - 1 timings\nTiming 0: 1920x1080p60\n"), 1);
  EXPECT_EQ(test_support::count_of(printed(edid, 256, 0), "\nDetailed Timing Descriptions: - 0 timings\n"), 1);
}

TEST(PrintEdid, PrintsNoReportOfABaseBlockThatCannotBeDecoded) {
  const std::string consequence = error("print_edid", "Failed decoding EDID block 0.");
  EXPECT_EQ(printed(bytes_t(256, 0), 256),
            error_line(codec, "decode_edid_block_0",
                       "Failed verifying the header. Expected:  ffffffffffff00 Received:               0") +
                consequence);
  bytes_t bad_checksum = join(base_block(), extension());
  const u8 right = bad_checksum[127];
  bad_checksum[127] = static_cast<u8>(right ^ 0x80);
  char message[100];
  std::snprintf(message, sizeof(message), "Edid failed the checksum. Calculated:0x%02X Received:0x%02X", right,
                right ^ 0x80);
  EXPECT_EQ(printed(bad_checksum, 256), error_line(codec, "decode_edid_block_0", message) + consequence);
  EXPECT_EQ(printed(bad_checksum, 256, 0, nullptr), error_line(codec, "decode_edid_block_0", message) + consequence);
}

TEST(PrintEdid, PrintsNoReportOfAnExtensionThatCannotBeDecoded) {
  const std::string consequence = error("print_edid", "Failed decoding EDID block 1.");
  const bytes_t other = extension_builder_t().byte(0, 0x70).build();
  EXPECT_EQ(
      printed(join(base_block(), other), 256),
      error_line(codec, "decode_edid_extensions", "The extension is not a CEA extension. Expected=0x2 Received=0x70") +
          consequence);
  const bytes_t revision_1 = extension_builder_t().byte(1, 1).build();
  EXPECT_EQ(printed(join(base_block(), revision_1), 256),
            error_line(codec, "decode_edid_extensions", "Extension is the wrong version. Expected=0x3 Received=0x1") +
                consequence);
  // Decoded halfway: its lists are released all the same.
  const bytes_t overrun = extension_builder_t().block(test_support::video_block({4, 5})).block({0x22, 0x09}).build();
  EXPECT_EQ(printed(join(base_block(), overrun), 256),
            error_line(codec, "decode_edid_extensions",
                       "Malformed EDID: The CEA extension data block specifies a tag with a length whose total bytes "
                       "exceeds the length of the CEA extension's data block. Tag:1 Len:2 Current Byte:3 Data Block "
                       "Len:5") +
                consequence);
}

TEST(PrintEdid, PrintsNoReportWhenAnEntryCannotBeAllocated) {
  EXPECT_EQ(output_of([] {
              const bytes_t edid = join(base_block(), extension());
              const test_support::failing_allocation_t failing(3);
              print(edid, 256);
            }),
            test_support::bug_line("linked_list", "ll_create_entry",
                                   "calloc failed to allocate memory for the entry. ptr:PTR") +
                error_line(codec, "decode_edid_extensions", "Failed creating new entry.") +
                error("print_edid", "Failed decoding EDID block 1."));
}

TEST(PrintEdid, LeavesTheBytesAlone) {
  const bytes_t original = join(base_block(), extension());
  bytes_t bytes = original;
  output_of([&] { print_edid(bytes.data(), 256, 0, "TITLE"); });
  EXPECT_EQ(bytes, original);
}

namespace {

std::string mask_line(u32 mask) {
  return output_of([&] { print_edid_audio_mask(mask); });
}

const std::pair<u32, const char *> mask_names[] = {
    {0, "pcm "},  {1, "ac3 "},      {2, "mpeg1 "},   {3, "mp3 "},      {4, "mpeg2 "},         {5, "aac "},
    {6, "dts "},  {7, "atrac "},    {8, "dsd "},     {9, "ac3 "},      {10, "dts_hd "},       {11, "mlp "},
    {12, "dst "}, {13, "wma_pro "}, {14, "he_aac "}, {15, "he_aac2 "}, {16, "mpeg_surround "}};

}  // namespace

TEST(PrintEdidAudioMask, NamesEachBit) {
  for (const auto &[bit, name] : mask_names) {
    char prefix[40];
    std::snprintf(prefix, sizeof(prefix), "EDID: Audio mask: 0x%08X => ", 1u << bit);
    EXPECT_EQ(mask_line(1u << bit), std::string(prefix) + name + "\n");
  }
}

TEST(PrintEdidAudioMask, HasNoNamesForTheUpperBits) {
  for (u32 bit = 17; bit < 32; ++bit) {
    char line[40];
    std::snprintf(line, sizeof(line), "EDID: Audio mask: 0x%08X => \n", 1u << bit);
    EXPECT_EQ(mask_line(1u << bit), line);
  }
}

TEST(PrintEdidAudioMask, NamesSeveralBitsFromTheLowestUp) {
  EXPECT_EQ(mask_line(0x00000201), "EDID: Audio mask: 0x00000201 => pcm ac3 \n");
  EXPECT_EQ(mask_line(0x00010043), "EDID: Audio mask: 0x00010043 => pcm ac3 dts mpeg_surround \n");
  EXPECT_EQ(mask_line(0x80000001), "EDID: Audio mask: 0x80000001 => pcm \n");
  const std::string all_but_pcm =
      "ac3 mpeg1 mp3 mpeg2 aac dts atrac dsd ac3 dts_hd mlp dst wma_pro he_aac he_aac2 mpeg_surround ";
  EXPECT_EQ(mask_line(0xFFFFFFFE), "EDID: Audio mask: 0xFFFFFFFE => " + all_but_pcm + "\n");
  EXPECT_EQ(mask_line(0x0001FFFF), "EDID: Audio mask: 0x0001FFFF => pcm " + all_but_pcm + "\n");
}

TEST(PrintEdidAudioMask, HasWordsForAllAndNone) {
  EXPECT_EQ(mask_line(0xFFFFFFFF), "EDID: Audio mask: 0xFFFFFFFF => All audio formats supported\n");
  EXPECT_EQ(mask_line(0x00000000), "EDID: Audio mask: 0x00000000 => No audio formats\n");
}

TEST(PrintEdidAudioMask, PrintsTheSameWhileTracing) {
  EXPECT_EQ(traced_output_of([] { print_edid_audio_mask(0x00000001); }), "EDID: Audio mask: 0x00000001 => pcm \n");
}

}  // namespace inspection_tests
