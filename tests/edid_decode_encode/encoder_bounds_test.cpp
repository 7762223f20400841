// Writes of the encoder stay inside the 256 bytes, whatever the record holds.
#include "encoder_fixture.h"

namespace codec_test {
namespace {

constexpr std::size_t canaries = 64;

// As encode(), with bytes before and after the 256 that must stay as they are.
encoding_t encode_between_canaries(edid_t *edid) {
  platform_values_t values{};
  bytes_t block(canaries + 256 + canaries, 0xC3);
  encoding_t encoding{{}, 0, "", 0};
  encoding.output = output_of(
      [&] { encoding.result = encode_edid(block.data() + canaries, 256, edid, &encoding.spa_offset, &values); });
  EXPECT_EQ(slice(block, 0, canaries), bytes_t(canaries, 0xC3));
  EXPECT_EQ(slice(block, canaries + 256, canaries), bytes_t(canaries, 0xC3));
  encoding.bytes = slice(block, canaries, 256);
  return encoding;
}

void add_videos(edid_t *edid, u32 count, u32 stereo = 0) {
  for (u32 i = 0; i < count; ++i)
    append_video(edid, 33, stereo);
}

void add_audios(edid_t *edid, u32 count) {
  for (u32 i = 0; i < count; ++i)
    append(edid->audio_list, short_audio_desc_t{1, 2, 7, 5, 0, 0, 0});
}

// 4 bytes of header, 4 for the speakers, 1 + 31 and 1 + 30 for video and audio, 9 for HDMI, 4 for its latencies, 4 for
// the colorimetry, 18 for the timing and 18 for the serial text: 124; and what the video part needs.
void fill_to_124(edid_t *edid) {
  add_videos(edid, 31);
  add_audios(edid, 10);
  edid->i_video_latency = 20;
  edid->xvycc601 = 1;
  set_text(edid->serial_string, "ABCDEFGHIJKL");
}

// The video part needs 2 bytes and one for each code.
void add_video_part(edid_t *edid, u32 codes) {
  edid->hdmi_video_present = 1;
  edid->hdmi_vic_len = byte_of(codes);
  for (u32 i = 0; i < codes; ++i)
    edid->hdmi_vic[i] = i + 1;
}

// The line that tells of @p needed bytes, which is the only one, or the one after @p before.
void expect_overflow_line(const std::string &output, u32 needed, const std::string &before = "") {
  ASSERT_EQ(output.substr(0, before.size()), before);
  const std::string line = output.substr(before.size());
  const std::string prefix = "edid_decode_encode:N:encode_edid() ERROR: ";
  EXPECT_EQ(line.substr(0, prefix.size()), prefix);
  EXPECT_EQ(test_support::count_of(line, "\n"), 1);
  EXPECT_EQ(line.back(), '\n');
  EXPECT_EQ(test_support::count_of(line, " " + std::to_string(needed) + " "), 1) << line;
  EXPECT_EQ(test_support::count_of(line, " 127 "), 1) << line;
}

void expect_checksums(const bytes_t &bytes) {
  EXPECT_EQ(test_support::block_sum(bytes.data()), 0);
  EXPECT_EQ(test_support::block_sum(bytes.data() + 128), 0);
}

}  // namespace

TEST(EncoderBounds, AnExtensionThatIsJustFullIsWrittenSilently) {
  minimal_record_t record;
  fill_to_124(record.get());
  add_video_part(record.get(), 1);
  const encoding_t encoding = encode_between_canaries(record.get());
  EXPECT_EQ(encoding.result, 1);
  EXPECT_EQ(encoding.output, "");
  expect_checksums(encoding.bytes);
  EXPECT_EQ(encoding.bytes[130], 127 - 36);
  EXPECT_EQ(slice(encoding.bytes, 128 + 127 - 36, 18), vic_1_descriptor);
  EXPECT_EQ(slice(encoding.bytes, 128 + 127 - 18, 18), test_support::text_descriptor(0xFF, "ABCDEFGHIJKL"));
}

TEST(EncoderBounds, TheLineFeedBehindAFullSerialTextDoesNotCount) {
  minimal_record_t record;
  fill_to_124(record.get());
  add_video_part(record.get(), 1);
  set_text(record->serial_string, "ABCDEFGHIJKLM");
  const encoding_t encoding = encode_between_canaries(record.get());
  EXPECT_EQ(encoding.result, 1);
  EXPECT_EQ(encoding.output, "");
  expect_checksums(encoding.bytes);
  EXPECT_EQ(slice(encoding.bytes, 128 + 127 - 18, 18), test_support::text_descriptor(0xFF, "ABCDEFGHIJKLM"));
}

TEST(EncoderBounds, OneByteMoreIsReportedAndTheResultStays) {
  for (const char *serial : {"ABCDEFGHIJKL", "ABCDEFGHIJKLM"}) {
    SCOPED_TRACE(serial);
    minimal_record_t record;
    fill_to_124(record.get());
    add_video_part(record.get(), 2);
    set_text(record->serial_string, serial);
    const encoding_t encoding = encode_between_canaries(record.get());
    EXPECT_EQ(encoding.result, 1);
    expect_overflow_line(encoding.output, 128);
    expect_checksums(encoding.bytes);
    EXPECT_EQ(encoding.bytes[130], 128 - 36);
    EXPECT_EQ(encoding.bytes[131], 0x73);
    EXPECT_EQ(slice(encoding.bytes, 128 + 128 - 36, 18), vic_1_descriptor);
  }
}

TEST(EncoderBounds, WithoutASerialTextThereIsRoomFor18BytesMore) {
  for (u32 structures = 14; structures < 18; ++structures) {
    SCOPED_TRACE(structures);
    minimal_record_t record;
    fill_to_124(record.get());
    set_text(record->serial_string, "");
    add_video_part(record.get(), 3);
    // One byte for each frame packing: 124 - 18 + 2 + 3 + structures.
    record->hdmi_3d_present = 1;
    for (u32 index = 0; index < structures && index < 16; ++index)
      element_at<short_video_desc_t>(record->video_list, index).stereo = 0x01;
    if (structures > 16) element_at<short_video_desc_t>(record->video_list, 0).stereo = 0x09;
    const encoding_t encoding = encode_between_canaries(record.get());
    EXPECT_EQ(encoding.result, 1);
    expect_checksums(encoding.bytes);
    const u32 needed = 111 + structures;
    if (needed <= 127) {
      EXPECT_EQ(encoding.output, "");
    } else {
      expect_overflow_line(encoding.output, needed);
    }
  }
}

TEST(EncoderBounds, ARichRecordWritesNothingOutsideOfItsBlocks) {
  minimal_record_t record;
  add_videos(record.get(), 40, 0xFF);
  add_audios(record.get(), 15);
  add_video_part(record.get(), 7);
  record->hdmi_3d_present = 1;
  record->i_audio_latency = 600;
  record->xvycc601 = 1;
  record->xvycc709 = 1;
  set_text(record->serial_string, "ABCDEFGHIJKLM");
  set_text(record->monitor_name, "ABCDEFGHIJKLM");
  set_range_limits(record.get());
  for (u32 i = 0; i < 12; ++i)
    append(record->std_timings, std_timing_t{1280, 2, 60});
  const encoding_t encoding = encode_between_canaries(record.get());
  EXPECT_EQ(encoding.result, 1);
  // 4 + 4 + 33 + 31, 9 + 4 + 2 + 7 + 16 x 9, 4, 18 and 18.
  const std::string warnings =
      codec_warning("encode_edid",
                    "Requested too many short video descriptions. Truncating to the maximum allowed. Max:32 "
                    "Requested:40") +
      codec_warning("encode_edid",
                    "Requested too many short audio descriptions. Truncating to the maximum allowed. Max:10 "
                    "Requested:15");
  expect_overflow_line(encoding.output, 278, warnings);
  expect_checksums(encoding.bytes);
  EXPECT_EQ(encoding.bytes[130], 242);
  EXPECT_EQ(encoding.bytes[131], 0x73);
  EXPECT_EQ(encoding.bytes[126], 0x01);
  // The HDMI block lies at 128 + 72; its last entry before the checksum is that of video entry 3.
  EXPECT_EQ(slice(encoding.bytes, 200, 22),
            (bytes_t{byte_of(0x60 | (165 & 31)),   0x03, 0x0C, 0x00, 0, 0, 0, 0, 0xE0, 1, 1, 1, 251, 0x80,
                     byte_of(7 << 5 | (144 & 31)), 1,    2,    3,    4, 5, 6, 7}));
  EXPECT_EQ(slice(encoding.bytes, 222, 9), (bytes_t{0x00, 0x01, 0x02, 0x03, 0x04, 0x05, 0x08, 0x00, 0x06}));
  EXPECT_EQ(slice(encoding.bytes, 249, 6), (bytes_t{0x30, 0x31, 0x32, 0x33, 0x34, 0x35}));
  EXPECT_EQ(encoding.spa_offset, 204);
}

TEST(EncoderBounds, TracesAreWrittenAsIfEverythingFitted) {
  minimal_record_t record;
  add_videos(record.get(), 16, 0xFF);
  record->hdmi_video_present = 1;
  record->hdmi_3d_present = 1;
  const encoding_t encoding = encode(record.get(), 0, true);
  EXPECT_EQ(test_support::count_of(encoding.output, " \t\t\tencode_edid():N\n"), 16 * 8);
  EXPECT_EQ(test_support::count_of(encoding.output, "order[15] TBH, f6 \t\t\tencode_edid():N\n"), 1);
}

TEST(EncoderBounds, ThreeTimingsEndTheEncodingBeforeTheOverflowIsReported) {
  minimal_record_t record;
  fill_to_124(record.get());
  add_video_part(record.get(), 7);
  append(record->dtd_list, test_support::timing_of_vic(1));
  const encoding_t encoding = encode_between_canaries(record.get());
  EXPECT_EQ(encoding.result, 0);
  EXPECT_EQ(encoding.output,
            codec_bug("encode_edid", "This function is only designed to handle up to 2 DTDs. num of dtds:3"));
}

TEST(EncoderBounds, EveryNumberOfEntriesStaysInsideExactly256Bytes) {
  for (u32 videos = 0; videos <= 34; videos += 2) {
    for (const u32 stereo : {0x00u, 0x01u, 0xFFu}) {
      for (u32 codes = 0; codes <= 7; codes += 7) {
        SCOPED_TRACE(std::to_string(videos) + " " + std::to_string(stereo) + " " + std::to_string(codes));
        minimal_record_t record;
        add_videos(record.get(), videos, stereo);
        add_audios(record.get(), 11);
        add_video_part(record.get(), codes);
        record->hdmi_3d_present = 1;
        record->video_latency = 2;
        record->xvycc709 = 1;
        set_text(record->serial_string, "ABCDEFGHIJKLM");
        const encoding_t encoding = encode(record.get());
        EXPECT_EQ(encoding.result, 1);
        expect_checksums(encoding.bytes);
        EXPECT_EQ(encode_between_canaries(record.get()).bytes, encoding.bytes);
      }
    }
  }
}

TEST(EncoderBounds, WhatFitsOfAnOverflowingRecordIsAsInOneThatFits) {
  minimal_record_t fitting;
  add_videos(fitting.get(), 20);
  add_audios(fitting.get(), 10);
  fitting->speaker[0] = 1;
  minimal_record_t overflowing;
  add_videos(overflowing.get(), 20);
  add_audios(overflowing.get(), 10);
  overflowing->speaker[0] = 1;
  overflowing->hdmi_3d_present = 1;
  add_video_part(overflowing.get(), 7);
  for (u32 index = 0; index < 20; ++index)
    element_at<short_video_desc_t>(overflowing->video_list, index).stereo = 0xFF;
  const bytes_t expected = encoded(fitting.get());
  const encoding_t encoding = encode_between_canaries(overflowing.get());
  EXPECT_EQ(slice(encoding.bytes, 0, 130), slice(expected, 0, 130));
  // Speakers, video and audio, up to the header of the HDMI block.
  EXPECT_EQ(slice(encoding.bytes, 132, 4 + 21 + 31), slice(expected, 132, 4 + 21 + 31));
}

}  // namespace codec_test
