// The CEA-861 extension but for its HDMI block.
#include "encoder_fixture.h"

namespace codec_test {
namespace {

const bytes_t no_speakers = {0x83, 0x00, 0x00, 0x00};
const bytes_t vic_1_alone = {0x41, 0x01};
const bytes_t default_audio = {0x23, 0x09, 0x07, 0x05};
const bytes_t plain_hdmi = {0x68, 0x03, 0x0C, 0x00, 0x00, 0x00, 0x00, 0x00, 0x00};

// An extension of which everything else is as for a minimal record.
bytes_t extension_with(const bytes_t &collection, const bytes_t &behind_timing = {}, u8 flags = 0x73) {
  bytes_t extension = all_of({{0x02, 0x03, byte_of(static_cast<u32>(4 + collection.size())), flags},
                              collection,
                              vic_1_descriptor,
                              behind_timing});
  extension.resize(127, 0);
  u32 sum = 0;
  for (const u8 byte : extension)
    sum += byte;
  extension.push_back(byte_of(0 - sum));
  return extension;
}

bytes_t extension_bytes(edid_t *edid, i32 native_bit = 0) {
  return slice(encoded(edid, native_bit), 128, 128);
}

bytes_t videos_of(const std::vector<std::pair<u32, u8>> &videos, i32 native_bit) {
  minimal_record_t record;
  for (const auto &[vic, native] : videos)
    append_video(record.get(), vic, 0, native);
  const bytes_t collection = collection_of(encoded(record.get(), native_bit));
  return slice(collection, 4, 1u + std::max<std::size_t>(videos.size(), 1));
}

std::string too_many_videos(u32 requested) {
  return codec_warning(
      "encode_edid",
      "Requested too many short video descriptions. Truncating to the maximum allowed. Max:32 Requested:" +
          std::to_string(requested));
}

std::string too_many_audios(u32 requested) {
  return codec_warning(
      "encode_edid",
      "Requested too many short audio descriptions. Truncating to the maximum allowed. Max:10 Requested:" +
          std::to_string(requested));
}

}  // namespace

TEST(ExtensionEncoder, WritesVic1AndBasicAudioForAMinimalRecord) {
  minimal_record_t record;
  EXPECT_EQ(extension_bytes(record.get()),
            extension_with(all_of({no_speakers, vic_1_alone, default_audio, plain_hdmi})));
  EXPECT_EQ(record->video_list.size, 0u);
  EXPECT_EQ(record->audio_list.size, 0u);
}

TEST(ExtensionEncoder, PrintsNothingForAMinimalRecordWhileTracing) {
  minimal_record_t record;
  EXPECT_EQ(encode(record.get(), 1, true).output, "");
}

TEST(ExtensionEncoder, DeclaresUnderscanOnlyWhenAsked) {
  minimal_record_t record;
  record->underscan = 1;
  EXPECT_EQ(extension_bytes(record.get()),
            extension_with(all_of({no_speakers, vic_1_alone, default_audio, plain_hdmi}), {}, 0xF3));
}

TEST(ExtensionEncoder, WritesTheSpeakerAllocation) {
  minimal_record_t record;
  record->speaker[0] = 0x4F;
  record->speaker[1] = 0x81;
  record->speaker[2] = 0xFF;
  EXPECT_EQ(extension_bytes(record.get()),
            extension_with(all_of({{0x83, 0x4F, 0x81, 0xFF}, vic_1_alone, default_audio, plain_hdmi})));
}

TEST(ExtensionEncoder, WritesTheVideoDescriptorsInOrder) {
  EXPECT_EQ(videos_of({{16, 0}, {4, 0}, {127, 0}, {64, 0}}, 0), (bytes_t{0x44, 0x10, 0x04, 0x7F, 0x40}));
}

TEST(ExtensionEncoder, MarksNativeModesAndTheFirstOneWhenTheNativeBitIsWanted) {
  EXPECT_EQ(videos_of({{16, 0}, {4, 0}, {5, 0}}, 1), (bytes_t{0x43, 0x90, 0x04, 0x05}));
  EXPECT_EQ(videos_of({{16, 0}, {4, 1}, {5, 0}}, 1), (bytes_t{0x43, 0x90, 0x84, 0x05}));
  EXPECT_EQ(videos_of({{16, 1}, {4, 0}, {5, 1}}, 1), (bytes_t{0x43, 0x90, 0x04, 0x85}));
  EXPECT_EQ(videos_of({{16, 1}, {4, 1}, {5, 1}}, 0), (bytes_t{0x43, 0x10, 0x04, 0x05}));
  EXPECT_EQ(videos_of({}, 1), (bytes_t{0x41, 0x81}));
}

TEST(ExtensionEncoder, LeavesTheNativeFlagsOfTheRecordAlone) {
  minimal_record_t record;
  append_video(record.get(), 16);
  append_video(record.get(), 4, 0, 1);
  const fields_t before = fields_of(*record.get());
  encoded(record.get(), 1);
  EXPECT_EQ(difference(before, fields_of(*record.get())), fields_t{});
}

TEST(ExtensionEncoder, Writes31VideoDescriptorsWithoutAWarning) {
  minimal_record_t record;
  for (u32 vic = 1; vic <= 31; ++vic)
    append_video(record.get(), vic);
  const bytes_t collection = collection_of(encoded(record.get()));
  EXPECT_EQ(collection[4], 0x5F);
  for (u32 vic = 1; vic <= 31; ++vic)
    EXPECT_EQ(collection[4 + vic], vic);
  EXPECT_EQ(slice(collection, 36, 4), default_audio);
}

TEST(ExtensionEncoder, Writes32VideoDescriptorsWithALengthThatWrapsTo0) {
  for (const u32 count : {32u, 33u, 64u}) {
    SCOPED_TRACE(count);
    minimal_record_t record;
    for (u32 vic = 1; vic <= count; ++vic)
      append_video(record.get(), vic);
    const encoding_t encoding = encode(record.get());
    EXPECT_EQ(encoding.result, 1);
    EXPECT_EQ(encoding.output, too_many_videos(count));
    const bytes_t collection = collection_of(encoding.bytes);
    EXPECT_EQ(collection[4], 0x40);
    for (u32 vic = 1; vic <= 32; ++vic)
      EXPECT_EQ(collection[4 + vic], vic);
    EXPECT_EQ(slice(collection, 37, 4), default_audio);
    EXPECT_EQ(test_support::block_sum(encoding.bytes.data() + 128), 0);
  }
}

TEST(ExtensionEncoder, WritesTheAudioDescriptorsInOrder) {
  minimal_record_t record;
  append(record->audio_list, short_audio_desc_t{2, 6, 7, 0, 640, 0, 0});
  append(record->audio_list, short_audio_desc_t{1, 8, 0x7F, 7, 0, 0, 0});
  append(record->audio_list, short_audio_desc_t{17, 2, 6, 0, 0, 0, 0});
  append(record->audio_list, short_audio_desc_t{12, 8, 0x54, 0, 0, 1, 0});
  EXPECT_EQ(extension_bytes(record.get()),
            extension_with(all_of({no_speakers,
                                   vic_1_alone,
                                   {0x2C, 0x15, 0x07, 0x50, 0x0F, 0x7F, 0x07, 0x79, 0x06, 0x10, 0x67, 0x54, 0x01},
                                   plain_hdmi})));
}

TEST(ExtensionEncoder, OverwritesExtendedAudioTypesOfTheRecordOnly) {
  minimal_record_t record;
  for (const u32 type : {1u, 16u, 17u, 18u, 14u})
    append(record->audio_list, short_audio_desc_t{type, 2, 6, 0, 0, 0, 0});
  const fields_t before = fields_of(*record.get());
  encoded(record.get());
  EXPECT_EQ(difference(before, fields_of(*record.get())),
            (fields_t{{"audio_list[1].type", "15"}, {"audio_list[2].type", "15"}, {"audio_list[3].type", "15"}}));
}

TEST(ExtensionEncoder, WritesAtMost10AudioDescriptors) {
  for (const u32 count : {10u, 11u, 15u}) {
    SCOPED_TRACE(count);
    minimal_record_t record;
    bytes_t expected = {0x3E};
    for (u32 i = 0; i < count; ++i) {
      append(record->audio_list, short_audio_desc_t{2, 2, 7, 0, 8 * i, 0, 0});
      if (i < 10) expected.insert(expected.end(), {0x11, 0x07, byte_of(i)});
    }
    const encoding_t encoding = encode(record.get());
    EXPECT_EQ(encoding.result, 1);
    EXPECT_EQ(encoding.output, count > 10 ? too_many_audios(count) : "");
    const bytes_t collection = collection_of(encoding.bytes);
    EXPECT_EQ(slice(collection, 6, 31), expected);
    EXPECT_EQ(slice(collection, 37, 9), plain_hdmi);
  }
}

TEST(ExtensionEncoder, WarnsOfVideoBeforeItWarnsOfAudio) {
  minimal_record_t record;
  for (u32 i = 0; i < 40; ++i)
    append_video(record.get(), i + 1);
  for (u32 i = 0; i < 12; ++i)
    append(record->audio_list, short_audio_desc_t{1, 2, 7, 5, 0, 0, 0});
  EXPECT_EQ(encode(record.get()).output, too_many_videos(40) + too_many_audios(12));
}

TEST(ExtensionEncoder, KeepsTypesOfAudioDescriptorsThatItDoesNotWrite) {
  minimal_record_t record;
  for (u32 i = 0; i < 11; ++i)
    append(record->audio_list, short_audio_desc_t{16, 2, 6, 0, 0, 0, 0});
  encode(record.get());
  const auto audio = test_support::audio_of(record->audio_list);
  EXPECT_EQ(audio[9][0], 15u);
  EXPECT_EQ(audio[10][0], 16u);
}

TEST(ExtensionEncoder, WritesColorimetryOnlyWhenThereIsAny) {
  const struct {
    u8 xvycc601;
    u8 xvycc709;
    bytes_t block;
  } cases[] = {
      {1, 0, {0xE3, 0x05, 0x01, 0x01}}, {0, 1, {0xE3, 0x05, 0x02, 0x01}}, {1, 1, {0xE3, 0x05, 0x03, 0x01}}, {0, 0, {}}};
  for (const auto &each : cases) {
    minimal_record_t record;
    record->xvycc601 = each.xvycc601;
    record->xvycc709 = each.xvycc709;
    EXPECT_EQ(extension_bytes(record.get()),
              extension_with(all_of({no_speakers, vic_1_alone, default_audio, plain_hdmi, each.block})));
  }
}

TEST(ExtensionEncoder, PutsTheSerialTextBehindTheTiming) {
  const bytes_t collection = all_of({no_speakers, vic_1_alone, default_audio, plain_hdmi});
  minimal_record_t record;
  set_text(record->serial_string, "SN 0042 ");
  EXPECT_EQ(extension_bytes(record.get()), extension_with(collection, test_support::text_descriptor(0xFF, "SN 0042")));

  // The line feed of a full text stays among the zeros.
  set_text(record->serial_string, "ABCDEFGHIJKLM");
  const bytes_t full = test_support::join(test_support::text_descriptor(0xFF, "ABCDEFGHIJKLM"), {0x0A});
  EXPECT_EQ(extension_bytes(record.get()), extension_with(collection, full));
  set_text(record->serial_string, "ABCDEFGHIJKLMN");
  set_text(record->data_string, "OPQ");
  EXPECT_EQ(extension_bytes(record.get()), extension_with(collection, full));

  for (const char *text : {"", "S", " SN"}) {
    set_text(record->serial_string, text);
    EXPECT_EQ(extension_bytes(record.get()), extension_with(collection));
  }
}

TEST(ExtensionEncoder, CountsTheThreeTimingsWhateverElseItWrites) {
  minimal_record_t record;
  set_text(record->serial_string, "SERIAL");
  set_text(record->monitor_name, "NAME");
  set_range_limits(record.get());
  EXPECT_EQ(encoded(record.get())[131], 0x73);
}

TEST(ExtensionEncoder, AlwaysWritesTheTimingOfVic1) {
  minimal_record_t record;
  append_video(record.get(), 31);
  const bytes_t extension = extension_bytes(record.get());
  EXPECT_EQ(slice(extension, extension[2], 18), vic_1_descriptor);
}

}  // namespace codec_test
