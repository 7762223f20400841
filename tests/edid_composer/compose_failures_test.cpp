// Stages that fail: what is said, and that everything is cleaned up.
#include <gtest/gtest.h>

#include <string>
#include <tuple>
#include <vector>

#include "edid_composer/composer_lines.h"
#include "support/configuration_tree.h"
#include "support/edid_builder.h"
#include "support/failing_allocation.h"
#include "support/output_capture.h"
#include "support/records.h"

namespace {

using composer_lines::bug;
using composer_lines::error;
using test_support::append_modes;
using test_support::bytes_t;
using test_support::error_line;
using test_support::output_of;

constexpr const char *compose = "compose_edid_internal";

class FailingComposition : public testing::Test {
 protected:
  std::string failure() {
    return output_of([&] { EXPECT_FALSE(compose_edid_internal(nullptr, 0, new_.data(), 256, &cfg_, values_.get())); });
  }

  test_support::scoped_values_t values_;
  compose_cfg_t cfg_ = test_support::plain_settings();
  bytes_t new_ = bytes_t(256, 0xA5);
};

TEST_F(FailingComposition, VideoModes) {
  values_->video_60_additional.magic ^= 1;
  const std::string output = failure();
  values_->video_60_additional.magic ^= 1;
  EXPECT_EQ(output, error("_combine_lists", "extra_list has not been initialized. ptr=PTR") +
                        error("_filter_video_modes", "Failed combining 60Hz lists.") +
                        error(compose, "Failed filtering the video modes."));
  EXPECT_EQ(new_, bytes_t(256, 0xA5));
}

TEST_F(FailingComposition, AudioFormats) {
  // No mode is selected, so that basic audio is the first that needs memory.
  const std::string output = output_of([&] {
    const test_support::failing_allocation_t failing(1);
    EXPECT_FALSE(compose_edid_internal(nullptr, 0, new_.data(), 256, &cfg_, values_.get()));
  });
  EXPECT_EQ(output, test_support::bug_line("linked_list", "ll_create_entry",
                                           "calloc failed to allocate memory for the entry. ptr:PTR") +
                        error("_filter_audio_formats", "Failed creating entry.") +
                        error(compose, "Failed filtering the audio formats."));
  EXPECT_EQ(new_, bytes_t(256, 0xA5));
}

TEST_F(FailingComposition, Population) {
  // A VIC that nobody knows, configured and confirmed by the caller's own lists.
  append_modes(values_->video_60_priority, {{100, 0}, {4, 0}, {2, 0}, {1, 0}});
  append_modes(values_->video_60_additional, {{100, 0}, {4, 0}, {2, 0}, {1, 0}});
  const std::string unknown = test_support::warning_line(
      "utility", "convert_vic_to_dtd", "Invalid vic requested for conversion to a DTD. Requested VIC:100 Range:0-64");
  EXPECT_EQ(failure(), unknown + bug("_maximum_pixel_clock", "\tFailed converting VIC:100 to a DTD.") + unknown +
                           error("_populate_new_edid", "Error converting vic to dtd. Vic:100:Unknown Value") +
                           error(compose, "Failed populating the new edid."));
  EXPECT_EQ(new_, bytes_t(256, 0xA5));
}

TEST_F(FailingComposition, Encoding) {
  append_modes(values_->video_60_priority, {{16, 0}, {4, 0}, {2, 0}, {1, 0}});
  append_modes(values_->video_60_additional, {{16, 0}, {4, 0}, {2, 0}, {1, 0}});
  // An audio format of type 0 cannot be encoded; the sink's first one is never filtered out.
  values_->audio_pass_through = 2;
  const bytes_t extension = test_support::extension_builder_t()
                                .block(test_support::audio_block({0x79, 0x07, 0x20, 0x09, 0x07, 0x05}))
                                .build();
  const bytes_t sink = test_support::join(test_support::base_block_builder_t().extensions(1).build(), extension);
  EXPECT_EQ(
      output_of([&] { EXPECT_FALSE(compose_edid_internal(sink.data(), 256, new_.data(), 256, &cfg_, values_.get())); }),
      error_line("edid_decode_encode", "_encode_edid_short_audio", "Audio type is not recognied. Type:0") +
          error_line("edid_decode_encode", "encode_edid", "Failed encoding short audio. Index:0 Type:0") +
          error(compose, "Failed encoding the new edid."));
}

/// What is reported of a record that the composition did not come to.
std::string unprepared(const std::string &record) {
  return error_line("edid_decode_encode", "edid_destroy", "List is not initialized. List:standard_timing_list.") +
         error(compose, "Failed cleaning up " + record + ".");
}

TEST_F(FailingComposition, Configuration) {
  test_support::configuration_tree_t tree;
  tree.fill_completely();
  std::string output = output_of([&] {
    const test_support::failing_allocation_t failing(1);
    EXPECT_FALSE(compose_edid(nullptr, 0, new_.data(), 256, &cfg_));
  });
  // The magic that was expected depends on the list's address.
  const std::size_t magic = output.find(" Magic:");
  ASSERT_NE(magic, std::string::npos);
  output.erase(magic, output.find(" Size:") - magic);
  EXPECT_EQ(output, test_support::bug_line("linked_list", "ll_create_entry",
                                           "calloc failed to allocate memory for the entry. ptr:PTR") +
                        error("_read_platform_values", "Failed creating entry.") +
                        error(compose, "Failed trying to read the platform config file.") + unprepared("edid") +
                        unprepared("new_edid") +
                        error_line("linked_list", "ll_verify_integrity",
                                   "Corrupt List: List not initialized. Ptr:PTR ExpectedMagic:0 Size:0 "
                                   "Head:(nil) ") +
                        test_support::bug_line("linked_list", "ll_delete_list",
                                               "Failed verifying integrity of the list. list:PTR") +
                        error(compose, "Failed cleaning up video list."));
  EXPECT_EQ(new_, bytes_t(256, 0xA5));
}

}  // namespace
