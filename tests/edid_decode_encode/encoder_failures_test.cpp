// What the encoder refuses, in which order, and what is written by then.
#include "encoder_fixture.h"

namespace codec_test {
namespace {

const bytes_t untouched(256, 0xA5);

std::string error(const std::string &message) {
  return codec_error("encode_edid", message);
}

// Calls with bad arguments, on a buffer that must stay as it is.
std::string refusal_of(bool with_blocks, i32 size, edid_t *edid, bool with_values) {
  const exact_bytes_t block(untouched);
  platform_values_t values{};
  u8 spa_offset = 0x5A;
  const std::string output = output_of([&] {
    EXPECT_EQ(
        encode_edid(with_blocks ? block.data() : nullptr, size, edid, &spa_offset, with_values ? &values : nullptr), 0);
  });
  EXPECT_EQ(bytes_t(block.data(), block.data() + 256), untouched);
  EXPECT_EQ(spa_offset, 0x5A);
  return output;
}

const std::string no_blocks = error("Function called with edid_blocks set to NULL.");
const std::string no_edid = error("Function called with edid set to NULL.");
const std::string no_values = error("Function called with values set to NULL.");

std::string unsupported_size(const std::string &size) {
  return error("Function called with an unsupported block size. val:" + size + " expected:256");
}

// Encodes what must fail.
encoding_t failed(edid_t *edid) {
  const encoding_t encoding = encode(edid);
  EXPECT_EQ(encoding.result, 0);
  return encoding;
}

}  // namespace

TEST(EncoderFailures, RefusesMissingArgumentsInOrderAndBeforeTheSize) {
  minimal_record_t record;
  EXPECT_EQ(refusal_of(false, 256, record.get(), true), no_blocks);
  EXPECT_EQ(refusal_of(false, 128, nullptr, false), no_blocks);
  EXPECT_EQ(refusal_of(true, 256, nullptr, true), no_edid);
  EXPECT_EQ(refusal_of(true, 128, nullptr, false), no_edid);
  EXPECT_EQ(refusal_of(true, 256, record.get(), false), no_values);
  EXPECT_EQ(refusal_of(true, 128, record.get(), false), no_values);
}

TEST(EncoderFailures, RefusesEverySizeBut256) {
  minimal_record_t record;
  for (const i32 size : {128, 0, -1, 255, 257, 512, -256}) {
    EXPECT_EQ(refusal_of(true, size, record.get(), true), unsupported_size(std::to_string(size)));
  }
}

TEST(EncoderFailures, RefusesARecordStraightFromPreparation) {
  scoped_edid_t edid;
  EXPECT_EQ(failed(edid.get()).output, error("The function expects there to be at least 2 DTDs. Total DTDs:0"));
}

TEST(EncoderFailures, RefusesARecordWithOneTimingBeforeTheExtensionIsWritten) {
  minimal_record_t record;
  append(record->std_timings, std_timing_t{1280, 2, 60});
  ASSERT_TRUE(ll_delete_entry_at(&record->dtd_list, 1));
  const encoding_t encoding = failed(record.get());
  EXPECT_EQ(encoding.output, error("The function expects there to be at least 2 DTDs. Total DTDs:1"));
  EXPECT_EQ(slice(encoding.bytes, 0, 20),
            (bytes_t{0x00, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 0x00, 0x52, 0x74, 0, 0, 0, 0, 0, 0, 0, 0x22, 1, 3}));
  EXPECT_EQ(slice(encoding.bytes, 38, 3), (bytes_t{0x81, 0x80, 0x01}));
  EXPECT_EQ(slice(encoding.bytes, 128, 128), bytes_t(128, 0));
  EXPECT_EQ(encoding.spa_offset, 0xA5);
}

TEST(EncoderFailures, RefusesARecordWithThreeTimingsOnceTheDataBlocksAreWritten) {
  minimal_record_t record;
  append(record->dtd_list, test_support::timing_of_vic(1));
  const bytes_t of_two = [] {
    minimal_record_t two;
    return encoded(two.get());
  }();
  const encoding_t encoding = failed(record.get());
  EXPECT_EQ(encoding.output,
            codec_bug("encode_edid", "This function is only designed to handle up to 2 DTDs. num of dtds:3"));
  EXPECT_EQ(slice(encoding.bytes, 0, 131), slice(of_two, 0, 131));
  EXPECT_EQ(slice(encoding.bytes, 132, 19), slice(of_two, 132, 19));
  EXPECT_EQ(encoding.spa_offset, 146);
}

TEST(EncoderFailures, NamesATimingThatCannotBeEncoded) {
  for (u32 index = 0; index < 2; ++index) {
    SCOPED_TRACE(index);
    minimal_record_t record;
    auto &timing = element_at<detailed_timing_t>(record->dtd_list, index);
    timing.valid = 0;
    const std::string consequence = error("Failed encoding DTD. index:" + std::to_string(index) + " Len:2");
    EXPECT_EQ(failed(record.get()).output,
              codec_error("_encode_edid_dtd", "Called encode DTD with an invalid timing structure.") + consequence);
    timing.valid = 1;
    timing.pixel_clock = 25174999;
    const encoding_t encoding = failed(record.get());
    EXPECT_EQ(encoding.output,
              codec_error("_encode_edid_dtd", "Called encode DTD with an invalid pixel clock:25174999") + consequence);
    EXPECT_EQ(slice(encoding.bytes, 54, 18) == vic_16_descriptor, index == 1);
    EXPECT_EQ(slice(encoding.bytes, 128, 128), bytes_t(128, 0));
  }
}

TEST(EncoderFailures, NamesATimingByItsPositionAmongThree) {
  minimal_record_t record;
  append(record->dtd_list, detailed_timing_t{});
  EXPECT_EQ(failed(record.get()).output,
            codec_bug("encode_edid", "This function is only designed to handle up to 2 DTDs. num of dtds:3"));
  ASSERT_TRUE(ll_delete_entry_at(&record->dtd_list, 0));
  append(record->dtd_list, detailed_timing_t{});
  EXPECT_EQ(failed(record.get()).output,
            codec_error("_encode_edid_dtd", "Called encode DTD with an invalid timing structure.") +
                error("Failed encoding DTD. index:1 Len:3"));
}

TEST(EncoderFailures, NamesAnAudioFormatThatCannotBeEncoded) {
  const std::pair<u32, const char *> cases[] = {{0, "Audio type is not recognied. Type:0"},
                                                {15, "Audio type is not recognied. Type:15"},
                                                {19, "Invalid extended audio type:0"}};
  for (const auto &[type, message] : cases) {
    SCOPED_TRACE(type);
    minimal_record_t record;
    append_video(record.get(), 16);
    append(record->audio_list, short_audio_desc_t{1, 2, 7, 5, 0, 0, 0});
    append(record->audio_list, short_audio_desc_t{type, 2, 7, 5, 0, 0, 0});
    const encoding_t encoding = failed(record.get());
    EXPECT_EQ(encoding.output, codec_error("_encode_edid_short_audio", message) +
                                   error("Failed encoding short audio. Index:1 Type:" + std::to_string(type)));
    EXPECT_EQ(slice(encoding.bytes, 132, 4), (bytes_t{0x83, 0, 0, 0}));
    EXPECT_EQ(encoding.bytes[137], 0x10);
    EXPECT_EQ(encoding.spa_offset, 0xA5);
  }
}

TEST(EncoderFailures, WarnsOfTooManyFormatsOnlyBehindThem) {
  minimal_record_t record;
  for (u32 i = 0; i < 40; ++i)
    append_video(record.get(), i + 1);
  for (u32 i = 0; i < 12; ++i)
    append(record->audio_list, short_audio_desc_t{i == 9 ? 0u : 2u, 2, 7, 0, 640, 0, 0});
  const std::string too_many_videos = codec_warning(
      "encode_edid",
      "Requested too many short video descriptions. Truncating to the maximum allowed. Max:32 Requested:40");
  EXPECT_EQ(failed(record.get()).output,
            too_many_videos + codec_error("_encode_edid_short_audio", "Audio type is not recognied. Type:0") +
                error("Failed encoding short audio. Index:9 Type:0"));
}

TEST(EncoderFailures, LooksAtTheFirst10AudioFormatsOnly) {
  minimal_record_t record;
  for (u32 i = 0; i < 11; ++i)
    append(record->audio_list, short_audio_desc_t{i == 10 ? 0u : 2u, 2, 7, 0, 640, 0, 0});
  const encoding_t encoding = encode(record.get());
  EXPECT_EQ(encoding.result, 1);
  EXPECT_EQ(encoding.output,
            codec_warning("encode_edid",
                          "Requested too many short audio descriptions. Truncating to the maximum allowed. Max:10 "
                          "Requested:11"));
}

TEST(EncoderFailures, ARecordThatWasRefusedMayBeEncodedOnceMended) {
  minimal_record_t record;
  append(record->audio_list, short_audio_desc_t{15, 2, 7, 0, 0, 0, 0});
  failed(record.get());
  ASSERT_TRUE(ll_delete_entry_at(&record->audio_list, 0));
  minimal_record_t fresh;
  EXPECT_EQ(encoded(record.get()), encoded(fresh.get()));
}

TEST(EncoderFailures, ARecordWithExtendedAudioCannotBeEncodedTwice) {
  minimal_record_t record;
  append(record->audio_list, short_audio_desc_t{17, 2, 6, 0, 0, 0, 0});
  encoded(record.get());
  EXPECT_EQ(failed(record.get()).output,
            codec_error("_encode_edid_short_audio", "Audio type is not recognied. Type:15") +
                error("Failed encoding short audio. Index:0 Type:15"));
}

}  // namespace codec_test
