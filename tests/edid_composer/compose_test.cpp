// The road of one composition: arguments, the sink's EDID, the stages, the clean-up.
#include <gtest/gtest.h>

#include <cstring>
#include <string>
#include <vector>

#include "edid_composer/composer_lines.h"
#include "support/configuration_tree.h"
#include "support/edid_builder.h"
#include "support/failing_allocation.h"
#include "support/hex_text.h"
#include "support/output_capture.h"
#include "support/records.h"

namespace {

using composer_lines::error;
using composer_lines::trace;
using test_support::append_modes;
using test_support::bytes_t;
using test_support::error_line;
using test_support::hex_lines;
using test_support::output_of;
using test_support::traced_output_of;

constexpr const char *compose = "compose_edid_internal";

/// A sink at 1.0.0.0 that shows 1080p60 and 720p60.
bytes_t sink_with(const bytes_t &extension) {
  return test_support::join(test_support::base_block_builder_t()
                                .descriptor(0, test_support::timing_descriptor(test_support::timing_of_vic(16)))
                                .byte(27, 0x77)
                                .extensions(1)
                                .build(),
                            extension);
}

bytes_t good_extension() {
  return test_support::extension_builder_t()
      .block(test_support::video_block({16, 4}))
      .block(test_support::hdmi_block({0x10, 0x00}))
      .build();
}

class Pipeline : public testing::Test {
 protected:
  Pipeline() {
    append_modes(values_->video_60_priority, {{16, 0}, {4, 0}, {2, 0}, {1, 0}});
    append_modes(values_->video_60_additional, {{16, 0}, {4, 0}, {2, 0}, {1, 0}});
  }
  bool compose_with(const bytes_t &sink) {
    return compose_edid_internal(sink.data(), static_cast<u32>(sink.size()), new_.data(), 256, &cfg_, values_.get());
  }
  bool compose_without_sink() { return compose_edid_internal(nullptr, 0, new_.data(), 256, &cfg_, values_.get()); }
  void expect_valid_edid() {
    EXPECT_EQ(test_support::block_sum(new_.data()), 0);
    EXPECT_EQ(test_support::block_sum(new_.data() + 128), 0);
    EXPECT_EQ(new_[1], 0xFF);
    EXPECT_EQ(new_[128], 2);
  }

  test_support::scoped_values_t values_;
  compose_cfg_t cfg_ = test_support::plain_settings();
  bytes_t new_ = bytes_t(256, 0xA5);
};

TEST_F(Pipeline, MissingOutputIsTheFirstErrorOfAll) {
  EXPECT_EQ(
      output_of([] { EXPECT_FALSE(compose_edid(nullptr, 0, nullptr, 0, nullptr)); }),
      error(compose, "\"new_edid_block\" memory block parameter is NULL. Unable to proceed. new_edid_block:(nil)"));
}

TEST_F(Pipeline, SizeOfTheOutputIsTestedBeforeTheSettings) {
  for (const u32 size : {0U, 1U, 127U, 257U, 512U, 0xFFFFFFFFU}) {
    bytes_t small(size < 1000 ? size + 1 : 1, 0xA5);
    EXPECT_EQ(output_of([&] { EXPECT_FALSE(compose_edid(nullptr, 0, small.data(), size, nullptr)); }),
              error(compose, "New EDID size is not an valid value. Unable to proceed. edid_bytes=" +
                                 std::to_string(static_cast<i32>(size)) + " Expected=256"));
    EXPECT_EQ(small, bytes_t(small.size(), 0xA5));
  }
}

TEST_F(Pipeline, MissingSettingsAreTestedBeforeThePlatformValues) {
  const platform_values_t never_initialised{};
  EXPECT_EQ(output_of([&] {
              EXPECT_FALSE(compose_edid_internal(nullptr, 0, new_.data(), 256, nullptr, &never_initialised));
            }),
            error(compose, "cfg is NULL. Unable to proceed. cfg : (nil)."));
}

TEST_F(Pipeline, SinksArgumentsAreTracedBeforeTheOutputIsRefused) {
  EXPECT_EQ(
      traced_output_of([] { EXPECT_FALSE(compose_edid(nullptr, 5, nullptr, 0, nullptr)); }),
      trace(compose,
            "\"edid_block\" memory block parameter is NULL. Skipping edid reading and proceeding with creation. "
            "edid_block:(nil)") +
          trace(compose,
                "Edid is not an valid value. edid_bytes=5 Range=(128-256) Skipping edid reading and proceeding "
                "with creation.") +
          error(compose, "\"new_edid_block\" memory block parameter is NULL. Unable to proceed. new_edid_block:(nil)"));
}

TEST_F(Pipeline, DestroyedPlatformValuesAreRefused) {
  platform_values_t values;
  ASSERT_TRUE(platform_values_init(&values));
  ASSERT_TRUE(platform_values_destroy(&values));
  EXPECT_EQ(output_of([&] { EXPECT_FALSE(compose_edid_internal(nullptr, 0, new_.data(), 256, &cfg_, &values)); }),
            error(compose, "The passed in platform_values has not been initialized."));
  EXPECT_EQ(new_, bytes_t(256, 0xA5));
}

TEST_F(Pipeline, MovedPlatformValuesAreRefused) {
  const platform_values_t moved = *values_.get();
  EXPECT_EQ(output_of([&] { EXPECT_FALSE(compose_edid_internal(nullptr, 0, new_.data(), 256, &cfg_, &moved)); }),
            error(compose, "The passed in platform_values has not been initialized."));
}

TEST_F(Pipeline, OutputBelow256BytesIsRefusedByTheEncoder) {
  for (const u32 size : {128U, 129U, 255U}) {
    bytes_t small(size, 0xA5);
    EXPECT_EQ(
        output_of([&] { EXPECT_FALSE(compose_edid_internal(nullptr, 0, small.data(), size, &cfg_, values_.get())); }),
        error_line("edid_decode_encode", "encode_edid",
                   "Function called with an unsupported block size. val:" + std::to_string(size) + " expected:256") +
            error(compose, "Failed encoding the new edid."));
    EXPECT_EQ(small, bytes_t(size, 0xA5));
  }
}

TEST_F(Pipeline, MissingSinkIsNoError) {
  EXPECT_EQ(output_of([&] { EXPECT_TRUE(compose_without_sink()); }), "");
  expect_valid_edid();
}

std::string skipped_size(u32 size) {
  return trace(compose, "Edid is not an valid value. edid_bytes=" + std::to_string(size) +
                            " Range=(128-256) Skipping edid reading and proceeding with creation.");
}

std::string proceeding(const std::string &pointer, u32 size) {
  return trace(compose, "Valid edid not available. Continuing composing edid. Passed in edid:" + pointer +
                            " size:" + std::to_string(size) + " bytes");
}

TEST_F(Pipeline, SinkOfAnUnusualSizeIsLeftUnread) {
  for (const u32 size : {0U, 1U, 127U, 129U, 200U, 255U}) {
    const bytes_t sink(1);  // Not a byte of it is read.
    const std::string output = traced_output_of(
        [&] { EXPECT_TRUE(compose_edid_internal(sink.data(), size, new_.data(), 256, &cfg_, values_.get())); });
    EXPECT_EQ(output.find(skipped_size(size) + proceeding("PTR", size) + trace("_combine_lists", "Combine Lists:")), 0U)
        << output;
    expect_valid_edid();
  }
}

TEST_F(Pipeline, MissingSinkOfAGoodSizeIsTracedAsMissingOnly) {
  const std::string output = traced_output_of(
      [&] { EXPECT_TRUE(compose_edid_internal(nullptr, 256, new_.data(), 256, &cfg_, values_.get())); });
  EXPECT_EQ(
      output.find(trace(compose,
                        "\"edid_block\" memory block parameter is NULL. Skipping edid reading and proceeding with "
                        "creation. edid_block:(nil)") +
                  proceeding("(nil)", 256)),
      0U);
}

TEST_F(Pipeline, GoodSinkIsDecodedWithItsExtension) {
  EXPECT_EQ(output_of([&] { EXPECT_TRUE(compose_with(sink_with(good_extension()))); }), "");
  expect_valid_edid();
  EXPECT_EQ(new_[27], 0x77);  // The sink's red.
}

TEST_F(Pipeline, SinkMayBeDecodedIntoItsOwnBuffer) {
  const bytes_t sink = sink_with(good_extension());
  ASSERT_TRUE(compose_with(sink));
  bytes_t both = sink;
  EXPECT_TRUE(compose_edid_internal(both.data(), 256, both.data(), 256, &cfg_, values_.get()));
  EXPECT_EQ(hex_lines(both), hex_lines(new_));
}

TEST_F(Pipeline, BadChecksumLeavesTheExtensionUnread) {
  bytes_t sink = sink_with(good_extension());
  sink[127] ^= 1;
  char message[80];
  std::snprintf(message, sizeof message, "Edid failed the checksum. Calculated:0x%02X Received:0x%02X", sink[127] ^ 1,
                sink[127]);
  EXPECT_EQ(output_of([&] { EXPECT_TRUE(compose_with(sink)); }),
            error_line("edid_decode_encode", "decode_edid_block_0", message) +
                error(compose, "Failed decoding the edid block 0. Continuing."));
  expect_valid_edid();
  EXPECT_EQ(new_[27], 0);  // The header was good, so the primaries count as the sink's: none was decoded.
}

TEST_F(Pipeline, BadHeaderLeavesTheSinkOut) {
  bytes_t sink = sink_with(good_extension());
  sink[0] = 1;
  const std::string output = output_of([&] { EXPECT_TRUE(compose_with(sink)); });
  EXPECT_NE(output.find("decode_edid_block_0() ERROR: Failed verifying the header."), std::string::npos);
  EXPECT_NE(output.find(error(compose, "Failed decoding the edid block 0. Continuing.")), std::string::npos);
  const bytes_t composed = new_;
  ASSERT_TRUE(compose_without_sink());
  EXPECT_EQ(hex_lines(composed), hex_lines(new_));
}

TEST_F(Pipeline, BadExtensionKeepsWhatWasDecoded) {
  bytes_t sink = sink_with(good_extension());
  sink[129] = 2;
  test_support::mend_checksum(sink, 128);
  EXPECT_EQ(output_of([&] { EXPECT_TRUE(compose_with(sink)); }),
            error_line("edid_decode_encode", "decode_edid_extensions",
                       "Extension is the wrong version. Expected=0x3 Received=0x2") +
                error(compose, "Failed decoding the extension. Continuing."));
  expect_valid_edid();
  EXPECT_EQ(new_[27], 0x77);
}

TEST_F(Pipeline, ExtensionThatIsNotAnnouncedIsNotDecoded) {
  bytes_t sink = sink_with(bytes_t(128, 0xEE));
  sink[126] = 0;
  test_support::mend_checksum(sink, 0);
  EXPECT_EQ(output_of([&] { EXPECT_TRUE(compose_with(sink)); }), "");
}

TEST_F(Pipeline, AnnouncedExtensionThatIsNotThereIsRefusedWithoutReadingIt) {
  const bytes_t sink = sink_with({});
  ASSERT_EQ(sink.size(), 128U);
  const std::string refusal = error_line("edid_decode_encode", "decode_edid_extensions",
                                         "The extension is not a CEA extension. Expected=0x2 Received=0x0") +
                              error(compose, "Failed decoding the extension. Continuing.");
  EXPECT_EQ(output_of([&] { EXPECT_TRUE(compose_with(sink)); }), refusal);
  const std::string output = traced_output_of([&] { EXPECT_TRUE(compose_with(sink)); });
  EXPECT_NE(output.find(trace(compose, "Decode EDID Block 1") + refusal), std::string::npos) << output;
}

TEST_F(Pipeline, BytesBehindTheFirstExtensionAreHandedToItsDecoder) {
  // 384 and 512 bytes pass; detailed timings are looked for up to the end.
  // A collection of reserved data blocks without payload, and timings from byte 110 on.
  const bytes_t extension = test_support::extension_builder_t().byte(2, 110).build();
  bytes_t third(128, 0);
  const bytes_t timing = test_support::timing_descriptor(test_support::timing_of_vic(31));
  // 110 + 18 = 128: the second timing is the first 18 bytes of the next block.
  std::copy(timing.begin(), timing.end(), third.begin());
  bytes_t sink = test_support::join(sink_with(extension), third);
  for (const std::size_t size : {std::size_t{384}, std::size_t{512}}) {
    sink.resize(size, 0);
    const std::string output = traced_output_of([&] { EXPECT_TRUE(compose_with(sink)); });
    EXPECT_NE(output.find(trace("_decode_edid_dtd", "Added DTD: WxH=1920x1080p pixel:148500000") +
                          trace("decode_edid_extensions", "Reserved code. Len=0")),
              std::string::npos)
        << size;
  }
}

TEST_F(Pipeline, SpaOffsetIsWrittenWhenAskedForAndChangesNothingElse) {
  ASSERT_TRUE(compose_without_sink());
  const bytes_t without = new_;
  u8 offsets[3]{0xA5, 0xA5, 0xA5};
  cfg_.spa_offset = &offsets[1];
  ASSERT_TRUE(compose_without_sink());
  EXPECT_EQ(hex_lines(new_), hex_lines(without));
  EXPECT_EQ(offsets[0], 0xA5);
  EXPECT_EQ(offsets[1], 149);
  EXPECT_EQ(offsets[2], 0xA5);
}

TEST_F(Pipeline, PortCountsFromZeroAndIsCutToEightBits) {
  cfg_.port = 0;
  const bytes_t sink = sink_with(good_extension());
  for (const auto &[port, high, low] :
       {std::tuple{0U, 0x11, 0x00}, std::tuple{2U, 0x13, 0x00}, std::tuple{14U, 0x1F, 0x00}, std::tuple{15U, 0x10, 0},
        std::tuple{255U, 0x10, 0}, std::tuple{256U, 0x11, 0}, std::tuple{0xFFFFFFFFU, 0x10, 0}}) {
    cfg_.port = port;
    u8 offset = 0;
    cfg_.spa_offset = &offset;
    ASSERT_TRUE(compose_with(sink));
    EXPECT_EQ(new_[offset], high) << port;
    EXPECT_EQ(new_[offset + 1U], low) << port;
  }
}

TEST_F(Pipeline, OnlyOneTurnsTheAudioSinkFilterOn) {
  test_support::append(values_->audio_list, i32{0x500715});
  for (const u32 value : {0U, 1U, 2U, 0xFFFFFFFFU}) {
    cfg_.audio_sink_filter = value;
    const std::string output = traced_output_of([&] { EXPECT_TRUE(compose_without_sink()); });
    EXPECT_NE(output.find(value == 1 ? "\tSink Filter is turned ON" : "\tSink Filter is turned OFF"),
              std::string::npos);
  }
}

TEST_F(Pipeline, CallersPlatformValuesAreReadAndNothingElse) {
  const test_support::configuration_tree_t tree;
  const platform_values_t before = *values_.get();
  EXPECT_EQ(output_of([&] { EXPECT_TRUE(compose_without_sink()); }), "");
  EXPECT_EQ(tree.lookups(), 0);
  EXPECT_EQ(std::memcmp(values_.get(), &before, sizeof before), 0);
  EXPECT_EQ(test_support::modes_of(values_->video_60_priority),
            (std::vector<test_support::mode_pair_t>{{16, 0}, {4, 0}, {2, 0}, {1, 0}}));
}

TEST_F(Pipeline, ConfigurationIsReadWithoutThem) {
  test_support::configuration_tree_t tree;
  tree.fill_completely();
  tree.set("geometry_limit", 0);
  for (const char *mode : {"31", "19", "20", "17"})
    tree.add("50_hz_addition_list", std::string(mode));
  EXPECT_EQ(output_of([&] { EXPECT_TRUE(compose_edid(nullptr, 0, new_.data(), 256, &cfg_)); }), "");
  expect_valid_edid();
  EXPECT_GT(tree.lookups(), 0);
  const bytes_t composed = new_;
  EXPECT_TRUE(compose_edid_internal(nullptr, 0, new_.data(), 256, &cfg_, nullptr));
  EXPECT_EQ(hex_lines(composed), hex_lines(new_));
}

}  // namespace
