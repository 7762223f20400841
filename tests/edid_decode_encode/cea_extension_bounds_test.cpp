// Reads of an extension stay inside the bytes that there are; what is missing reads as 0.
#include "extension_lines.h"
#include "support/long_loops.h"

namespace codec_test {
namespace {

using extension_lines::error;
using extension_lines::function;
using extension_lines::malformed;
using extension_lines::trace;
using test_support::data_block;

// The first @p length bytes, with the last of them (of the first block) changed so that the block sums to 0 when the
// missing ones are 0. The first four stay as they are.
bytes_t cut_to(bytes_t bytes, std::size_t length) {
  bytes.resize(length);
  const std::size_t last = std::min<std::size_t>(length, 128) - 1;
  if (length < 5) return bytes;
  u32 sum = 0;
  for (std::size_t i = 0; i < last; ++i)
    sum += bytes[i];
  bytes[last] = byte_of(0 - sum);
  return bytes;
}

struct outcome_t {
  u8 result;
  std::string output;
  fields_t fields;
};

outcome_t outcome_of(const u8 *extension, u32 length) {
  scoped_edid_t edid;
  outcome_t outcome{};
  debug_enable(true);
  outcome.output =
      test_support::raw_output_of([&] { outcome.result = decode_edid_extensions(extension, length, edid.get()); });
  debug_enable(false);
  outcome.fields = fields_of(*edid.get());
  return outcome;
}

// Decoding must not depend on what lies after the bytes, and must be what it is with zeros there.
outcome_t outcome_without_reading_behind(const bytes_t &bytes) {
  const exact_bytes_t exact(bytes);
  outcome_t outcome = outcome_of(exact.data(), exact.size());
  for (const u8 behind : {u8{0x00}, u8{0xFF}, u8{0x61}}) {
    bytes_t padded = bytes;
    padded.resize(bytes.size() + 512, behind);
    const outcome_t padded_outcome = outcome_of(padded.data(), exact.size());
    EXPECT_EQ(padded_outcome.result, outcome.result);
    EXPECT_EQ(padded_outcome.output, outcome.output);
    EXPECT_EQ(padded_outcome.fields, outcome.fields);
  }
  return outcome;
}

// As outcome_without_reading_behind(), with the output as it is compared.
outcome_t checked_outcome(const bytes_t &bytes) {
  outcome_t outcome = outcome_without_reading_behind(bytes);
  outcome.output = test_support::masked(outcome.output);
  return outcome;
}

void expect_refusal(const bytes_t &bytes, const std::string &message) {
  const outcome_t outcome = checked_outcome(bytes);
  EXPECT_EQ(outcome.result, 0);
  EXPECT_EQ(outcome.output, error(message));
  EXPECT_EQ(outcome.fields, fields_of(edid_t{}));
}

// A collection in which every kind of payload reaches far.
bytes_t far_reaching_collection() {
  return all_of({test_support::video_block({0x90, 0x04, 0x05}), test_support::audio_block({0x09, 0x07, 0x05, 0x15}),
                 test_support::hdmi_block({0x12, 0x34, 0xF9, 0x3C, 0xE5, 0x0B, 0x15, 0x1F, 0x29, 0xD8, 0x68,
                                           0x01, 0x02, 0x03, 0x00, 0x07, 0x00, 0x05, 0x10, 0x28, 0x00, 0x06}),
                 data_block(4, {0x0F, 0x01, 0x00}), data_block(7, {0x05, 0x03, 0x00})});
}

}  // namespace

TEST(ExtensionBounds, AnExtensionOfNoBytesIsNoCeaExtension) {
  expect_refusal({}, "The extension is not a CEA extension. Expected=0x2 Received=0x0");
}

TEST(ExtensionBounds, AnExtensionOfOneByteHasNoRevision) {
  expect_refusal({0x02}, "Extension is the wrong version. Expected=0x3 Received=0x0");
}

TEST(ExtensionBounds, AnExtensionWithoutItsLastByteHasAChecksumOf0) {
  expect_refusal({0x02, 0x03}, "Edid failed the checksum. Calculated:0xFB Received:0x00");
  bytes_t almost_all = extension_of({});
  almost_all.resize(127);
  expect_refusal(almost_all, "Edid failed the checksum. Calculated:0xF7 Received:0x00");
}

TEST(ExtensionBounds, EveryCutOfARichExtensionReadsZerosBehindItsEnd) {
  const bytes_t whole =
      extension_of(far_reaching_collection(), 0xF0, test_support::timing_descriptor(test_support::timing_of_vic(16)));
  for (std::size_t length = 0; length <= 128; ++length) {
    SCOPED_TRACE(length);
    const outcome_t outcome = outcome_without_reading_behind(cut_to(whole, length));
    if (length < 5 || length == 128) {
      EXPECT_EQ(outcome.result, length == 128 ? 1 : 0);
    }
    EXPECT_EQ(outcome.fields.at("underscan"), length < 5 ? "0" : "1");
  }
}

TEST(ExtensionBounds, EveryDtdOffsetOfEveryCutReadsZerosBehindItsEnd) {
  bytes_t whole = extension_of(far_reaching_collection());
  for (u32 offset = 0; offset <= 110; offset += test_support::rounds(10, 1)) {
    whole[2] = byte_of(offset);
    for (const std::size_t length : {5u, 6u, 17u, 36u, 64u, 111u, 127u, 128u, 129u, 146u, 256u}) {
      SCOPED_TRACE(std::to_string(offset) + " of " + std::to_string(length));
      outcome_without_reading_behind(cut_to(whole, length));
    }
  }
}

TEST(ExtensionBounds, RandomExtensionsReadZerosBehindTheirEnd) {
  u32 state = 12345;
  const auto next = [&state] {
    state = state * 1664525 + 1013904223;
    return state >> 16;
  };
  for (u32 round = 0; round < test_support::rounds(100, 1000); ++round) {
    SCOPED_TRACE(round);
    const std::size_t length = round % 4 == 0 ? 128 : 5 + next() % 124;
    bytes_t bytes(length, 0);
    for (u8 &byte : bytes)
      byte = byte_of(next());
    bytes[0] = 0x02;
    bytes[1] = 0x03;
    bytes[2] = byte_of(next() % 111);
    // Half of them with an HDMI block that reaches as far as it can.
    if (round % 2 == 0 && length > 12) {
      const bytes_t block = {0x7F, 0x03, 0x0C, 0x00};
      std::copy(block.begin(), block.end(), bytes.begin() + 4);
    }
    outcome_without_reading_behind(cut_to(bytes, length));
  }
}

TEST(ExtensionBounds, HeadersBehindTheEndReadAsReservedBlocksUpToTheBound) {
  // Byte 4 is the last one there; the collection's bound is byte 12.
  const bytes_t bytes = cut_to({0x02, 0x03, 12, 0xF0, 0x00}, 5);
  ASSERT_EQ(bytes[4], 0xFF);
  // 0xFF is an extended block of 31 bytes, which overruns.
  EXPECT_EQ(
      checked_outcome(bytes).output,
      error("Malformed EDID: The CEA extension data block specifies a tag with a length whose total bytes exceeds "
            "the length of the CEA extension's data block. Tag:7 Len:31 Current Byte:0 Data Block Len:8"));

  // Flags chosen so that byte 4 is 0: reserved, no payload, and so are the seven headers after it.
  const bytes_t reserved = cut_to({0x02, 0x03, 12, 0xEF, 0x00}, 5);
  ASSERT_EQ(reserved[4], 0x00);
  std::string expected;
  for (int i = 0; i < 8; ++i)
    expected += trace("Reserved code. Len=0");
  const outcome_t outcome = checked_outcome(reserved);
  EXPECT_EQ(outcome.result, 1);
  EXPECT_EQ(outcome.output, expected);
}

TEST(ExtensionBounds, AnAudioDescriptorThatIsMissingReadsAsFormat0) {
  // An audio block of 9 bytes, of which 4 are there; the fourth makes the sum right.
  const bytes_t bytes = cut_to({0x02, 0x03, 14, 0x00, 0x29, 0x09, 0x07, 0x05, 0x00}, 9);
  ASSERT_EQ(bytes[8], 0xAF);
  const outcome_t outcome = checked_outcome(bytes);
  EXPECT_EQ(outcome.result, 1);
  EXPECT_EQ(outcome.output,
            trace("Audio Data Block. Len=9") +
                codec_error("decode_edid_short_audio",
                            "Unrecognized audio type found in audio format. Expected:1-15 Received:0") +
                codec_warning(function, "Failed to decode audio format. Index:6 byte3:0x00 byte2:0x00 byte1:0x00"));
  const fields_t expected = together(prefixed("audio_list[0].", fields_of(short_audio_desc_t{1, 2, 7, 5, 0, 0, 0})),
                                     prefixed("audio_list[1].", fields_of(short_audio_desc_t{5, 8, 0, 0, 0, 0, 0})));
  EXPECT_EQ(difference(fields_of(edid_t{}), outcome.fields), expected);
}

TEST(ExtensionBounds, VideoDescriptorsThatAreMissingReadAs0) {
  const bytes_t bytes = cut_to({0x02, 0x03, 9, 0x00, 0x44, 0x10, 0x00}, 7);
  ASSERT_EQ(bytes[6], 0x9E);
  const outcome_t outcome = checked_outcome(bytes);
  EXPECT_EQ(outcome.result, 1);
  fields_t expected = prefixed("video_list[0].", fields_of(short_video_desc_t{0, 16, 0}));
  expected.merge(prefixed("video_list[1].", fields_of(short_video_desc_t{1, 30, 0})));
  expected.merge(prefixed("video_list[2].", fields_of(short_video_desc_t{0, 0, 0})));
  expected.merge(prefixed("video_list[3].", fields_of(short_video_desc_t{0, 0, 0})));
  EXPECT_EQ(difference(fields_of(edid_t{}), outcome.fields), expected);
}

namespace {

// An extension whose byte 2 is below 4, so that the bound of the collection wraps: descriptors of zeros, and a reserved
// block at byte 26 whose payload makes the checksum 0.
bytes_t without_bound(u8 offset, std::size_t length) {
  bytes_t bytes(128, 0);
  bytes[0] = 0x02;
  bytes[1] = 0x03;
  bytes[2] = offset;
  bytes[26] = 0x01;
  bytes[27] = byte_of(0u - (0x02u + 0x03u + offset + 0x01u));
  bytes.resize(length);
  return bytes;
}

}  // namespace

TEST(ExtensionBounds, AWrappedCollectionEndsAsAnOverrunBehindTheLastByte) {
  for (const std::size_t length : {28u, 29u, 60u, 127u, 128u}) {
    SCOPED_TRACE(length);
    const outcome_t outcome = checked_outcome(without_bound(3, length));
    std::string expected;
    // The block at byte 26 takes two bytes.
    for (std::size_t header = 4; header < length; ++header) {
      if (header == 27) continue;
      expected += trace(header == 26 ? "Reserved code. Len=1" : "Reserved code. Len=0");
    }
    EXPECT_EQ(outcome.result, 0);
    EXPECT_EQ(outcome.output, expected + malformed(0, 0, static_cast<u32>(length) - 4, -1));
    EXPECT_EQ(outcome.fields, fields_of(edid_t{}));
  }
}

TEST(ExtensionBounds, AWrappedCollectionReportsItsLengthAsASignedNumber) {
  const std::pair<u8, i32> offsets[] = {{0, -4}, {1, -3}, {2, -2}, {3, -1}};
  for (const auto &[offset, collection] : offsets) {
    SCOPED_TRACE(collection);
    const bytes_t bytes = without_bound(offset, 128);
    const exact_bytes_t exact(bytes);
    scoped_edid_t edid;
    EXPECT_EQ(output_of([&] { EXPECT_EQ(decode_edid_extensions(exact.data(), 128, edid.get()), 0); }),
              malformed(0, 0, 124, collection));
  }
}

TEST(ExtensionBounds, AWrappedCollectionStartsItsTimingsInsideTheHeader) {
  bytes_t bytes = without_bound(0, 128);
  bytes[3] = 0x40;
  test_support::mend_checksum(bytes, 0);
  scoped_edid_t edid;
  EXPECT_EQ(output_of([&] { EXPECT_EQ(decode_extension(bytes, edid.get()), 0); }), malformed(0, 0, 124, -4));
  const auto timings = elements_of<detailed_timing_t>(edid->dtd_list);
  // Slots at 0, 18, 36, ...: the first is 02 03 00 40, the second holds the reserved block as its bytes 8 and 9.
  ASSERT_EQ(timings.size(), 1u);
  EXPECT_EQ(timings[0].pixel_clock, 0x0302u * 10000);
  EXPECT_EQ(timings[0].h_active, 0u);
  EXPECT_EQ(timings[0].h_blanking, 0x40u);
  EXPECT_EQ(edid->basic_audio, 1);
}

TEST(ExtensionBounds, AWrappedCollectionThatABlockRunsPastEndsAtTheNextHeader) {
  // The reserved block at byte 126 has a payload of 5 bytes, four of which are missing.
  bytes_t bytes = without_bound(3, 128);
  bytes[26] = 0;
  bytes[27] = 0;
  bytes[126] = 0x05;
  test_support::mend_checksum(bytes, 0);
  const outcome_t outcome = checked_outcome(bytes);
  EXPECT_EQ(outcome.result, 0);
  EXPECT_EQ(test_support::count_of(outcome.output, malformed(0, 0, 128, -1)), 1);
}

TEST(ExtensionBounds, AWrappedCollectionOfThreeBlocksGoesOnToTheLastByte) {
  bytes_t bytes = without_bound(3, 128);
  bytes.resize(256, 0);
  bytes[200] = 0x42;
  bytes[201] = 0x10;
  bytes[202] = 0x04;
  const outcome_t outcome = checked_outcome(bytes);
  EXPECT_EQ(outcome.result, 0);
  EXPECT_EQ(test_support::count_of(outcome.output, malformed(0, 0, 252, -1)), 1);
  EXPECT_EQ(outcome.fields.at("video_list[0].vic"), "16");
  EXPECT_EQ(outcome.fields.at("video_list[1].vic"), "4");
}

}  // namespace codec_test
