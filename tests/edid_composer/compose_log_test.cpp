// The complete trace of whole compositions.
#include <gtest/gtest.h>

#include <cstring>
#include <string>

#include "edid_composer/composer_lines.h"
#include "support/edid_builder.h"
#include "support/output_capture.h"
#include "support/records.h"

namespace {

using composer_lines::trace;
using test_support::append_modes;
using test_support::bytes_t;
using test_support::traced_output_of;

constexpr const char *compose = "compose_edid_internal";

// 1080p60 and 720p60 as the detailed timings, "Box" as the monitor's name, no physical address.
const std::string new_edid_in_hexadecimal =
    "00 FF FF FF FF FF FF 00 67 39 00 00 00 00 00 00 \n"
    "01 16 01 03 80 A0 5A 78 0E 0D C9 A0 57 47 98 27 \n"
    "12 48 4C 20 00 00 01 01 01 01 01 01 01 01 01 01 \n"
    "01 01 01 01 01 01 02 3A 80 18 71 38 2D 40 58 2C \n"
    "45 00 C4 8E 21 00 00 1E 01 1D 00 72 51 D0 1E 20 \n"
    "6E 28 55 00 C4 8E 21 00 00 1E 00 00 00 FC 00 42 \n"
    "6F 78 0A 20 20 20 20 20 20 20 20 20 00 00 00 FD \n"
    "00 31 3D 0F 46 0F 00 0A 20 20 20 20 20 20 01 0A \n"
    "\n"
    "02 03 1A 73 83 01 00 00 44 90 04 02 01 23 09 07 \n"
    "05 68 03 0C 00 FF FF 00 00 00 D6 09 80 A0 20 E0 \n"
    "2D 10 10 60 A2 00 13 8E 21 00 00 18 00 00 00 00 \n"
    "00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 \n"
    "00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 \n"
    "00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 \n"
    "00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 \n"
    "00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 3A \n";

// Four modes of the addition list, all of them named by the priority list too.
const std::string four_candidates =
    "\t\tVIC:1 640x480p60Hz4x3   \n"
    "\t\tVIC:2 720x480p60Hz4x3   \n"
    "\t\tVIC:4 1280x720p60Hz16x9   \n"
    "\t\tVIC:16 1920x1080p60Hz16x9   \n";

std::string listed(const std::string &name) {
  return "\t\tVIC:" + name + "         \n";
}

const std::string four_selected = listed("16 1920x1080p60Hz16x9") + listed("4 1280x720p60Hz16x9") +
                                  listed("2 720x480p60Hz4x3") + listed("1 640x480p60Hz4x3");

std::string arguments_without_sink() {
  return trace(compose,
               "\"edid_block\" memory block parameter is NULL. Skipping edid reading and proceeding with creation. "
               "edid_block:(nil)") +
         trace(compose,
               "Edid is not an valid value. edid_bytes=0 Range=(128-256) Skipping edid reading and proceeding with "
               "creation.") +
         trace(compose, "Valid edid not available. Continuing composing edid. Passed in edid:(nil) size:0 bytes");
}

std::string video_modes() {
  const auto combine = [](const char *message) { return trace("_combine_lists", message); };
  const auto native = [](const char *message) { return trace("_determine_tv_native_refresh_rate", message); };
  const auto filter = [](const char *message) { return trace("_filter_video_modes", message); };
  return combine("Combine Lists:") + combine("\tList after combining:") +
         native(
             "Unable to find a video mode that indicates the native refresh rate of the television. Reading the "
             "platform config file for native refresh rate.") +
         native("Using 60Hz as native rate.") + filter("Combining 60Hz lists:") + combine("Combine Lists:") +
         combine("\tAdding video format:1 640x480p60Hz4x3 stereo:0x000") +
         combine("\tAdding video format:2 720x480p60Hz4x3 stereo:0x000") +
         combine("\tAdding video format:4 1280x720p60Hz16x9 stereo:0x000") +
         combine("\tAdding video format:16 1920x1080p60Hz16x9 stereo:0x000") + combine("\tList after combining:") +
         four_candidates + filter("\tPrioritization List:") + four_selected +
         filter("Prioritize the list of valid modes and remove duplicates. Modes:4 MasterList:4") +
         filter("\tIgnoring hdmi_current_mode.") + filter("\tNew EDID List of VICs:") + four_selected;
}

std::string modes_4k_x_2k() {
  return trace("_filter_4k_modes", "Downstream 4k x 2k:") + trace("_filter_4k_modes", "Additional 4k x 2k:") +
         trace("_filter_4k_modes", "Priority 4k x 2k:");
}

std::string audio_formats() {
  const auto filter = [](const char *message) { return trace("_filter_audio_formats", message); };
  return filter("Create Audio mode list:") + filter("\tExamining platform audio formats:") +
         filter("\tSink Filter is turned OFF") + filter("\tPassThrough Mode:0") +
         filter("\tReading the platform audio modes:") + trace("_filter_audio_list_with_mask", "\tMask:0xFFFFFFFF") +
         trace("_filter_audio_list_with_mask", "_filter_audio_list_with_mask() - Printing reverse formats\n") +
         filter("\tNo \"basic audio\" PCM 2-chan entry found. Adding one.") +
         "\tCode: 1:PCM Channels:2 Freq:32kHz 44.1kHz 48kHz  Bits:16bits 24bits \n";
}

std::string population() {
  const auto populate = [](const char *message) { return trace("_populate_new_edid", message); };
  const auto listed_again = [](const std::string &name) { return "\t\tVIC:" + name + "          \n"; };
  return populate("Setting up the new EDID:") + populate("\tProduct Code    = 0x0") +
         populate("\tSerial Number   = 0x0") + populate("\tweek            = 1") +
         populate("\tyear            = 2012") + populate("\tManufacturer ID = YYY") +
         populate("\tMonitor Name    = Box") +
         populate("\tNo hdmi specific downstream EDID available. Setting SPA to f.f.f.f") + populate("\tdc_30bit = 0") +
         populate("\tdc_36bit = 0") + populate("\tspeaker = 3:0x00 2:0x00 1:0x01") +
         populate("\tNew EDID List of VICs:") + listed_again("16 1920x1080p60Hz16x9") +
         listed_again("4 1280x720p60Hz16x9") + listed_again("2 720x480p60Hz4x3") + listed_again("1 640x480p60Hz4x3") +
         populate("\tEncoding the video timings: Num:4") + populate("\tCreating the first 2 DTDs.") +
         populate("\t\tVIC:16 1920x1080p60Hz16x9") + populate("\t\tVIC:4 1280x720p60Hz16x9") +
         populate("\tEncoding the VIC list up to 31 modes. Total:4");
}

std::string decoded_result() {
  const auto timing = [](const char *message) { return trace("_decode_edid_dtd", message); };
  const auto block = [](const char *message) { return trace("decode_edid_extensions", message); };
  return trace(compose, "New EDID...") + new_edid_in_hexadecimal + timing("Added DTD: WxH=1920x1080p pixel:148500000") +
         timing("Added DTD: WxH=1280x720p pixel:74250000") + timing("Added DTD: WxH=640x480p pixel:25180000") +
         block("Speaker Allocation Data Block. Len=3") + block("Video Data Block. Len=4") +
         block("Audio Data Block. Len=3") + block("Vendor Specific Data Block. Len=8");
}

class PipelineLog : public testing::Test {
 protected:
  PipelineLog() {
    append_modes(values_->video_60_priority, {{16, 0}, {4, 0}, {2, 0}, {1, 0}});
    append_modes(values_->video_60_additional, {{1, 0}, {2, 0}, {4, 0}, {16, 0}});
    std::strcpy(values_->monitor_name, "Box");
  }

  test_support::scoped_values_t values_;
  compose_cfg_t cfg_ = test_support::plain_settings();
  bytes_t new_ = bytes_t(256);
};

TEST_F(PipelineLog, CompositionWithoutSinkIsTracedFromItsArgumentsToTheDecodedResult) {
  EXPECT_EQ(
      traced_output_of([&] { EXPECT_TRUE(compose_edid_internal(nullptr, 0, new_.data(), 256, &cfg_, values_.get())); }),
      arguments_without_sink() + video_modes() + modes_4k_x_2k() + audio_formats() + population() + decoded_result());
}

TEST_F(PipelineLog, SinksBlocksAreDumpedBeforeTheyAreDecoded) {
  // What was composed above, as the sink: both blocks are dumped on their own.
  ASSERT_TRUE(compose_edid_internal(nullptr, 0, new_.data(), 256, &cfg_, values_.get()));
  const bytes_t sink = new_;
  const std::size_t separator = new_edid_in_hexadecimal.find("\n\n");
  const std::string block_0 = new_edid_in_hexadecimal.substr(0, separator + 1);
  const std::string block_1 = new_edid_in_hexadecimal.substr(separator + 2);
  const auto timing = [](const char *message) { return trace("_decode_edid_dtd", message); };
  const std::string expected =
      trace(compose, "Decode EDID Block 0") + block_0 + timing("Added DTD: WxH=1920x1080p pixel:148500000") +
      timing("Added DTD: WxH=1280x720p pixel:74250000") + trace(compose, "Decode EDID Block 1") + block_1 +
      timing("Added DTD: WxH=640x480p pixel:25180000");
  bytes_t next(256);
  const std::string output = traced_output_of(
      [&] { EXPECT_TRUE(compose_edid_internal(sink.data(), 256, next.data(), 256, &cfg_, values_.get())); });
  EXPECT_EQ(output.substr(0, expected.size()), expected);
}

TEST_F(PipelineLog, TracingIsOffAtTheNextLineAndTheBytesAreTheSame) {
  ASSERT_TRUE(compose_edid_internal(nullptr, 0, new_.data(), 256, &cfg_, values_.get()));
  const bytes_t untraced = new_;
  traced_output_of([&] { compose_edid_internal(nullptr, 0, new_.data(), 256, &cfg_, values_.get()); });
  EXPECT_EQ(new_, untraced);
  EXPECT_EQ(test_support::output_of([&] { compose_edid_internal(nullptr, 0, new_.data(), 256, &cfg_, values_.get()); }),
            "");
}

}  // namespace
