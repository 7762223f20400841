// The payloads of the data blocks of an extension.
#include <cstdio>

#include "extension_lines.h"
#include "support/failing_allocation.h"

namespace codec_test {
namespace {

using extension_lines::error;
using extension_lines::function;
using extension_lines::trace;
using test_support::audio_block;
using test_support::audio_of;
using test_support::audio_words_t;
using test_support::data_block;
using test_support::video_block;

const std::string unrecognised_format =
    codec_error("decode_edid_short_audio", "Unrecognized audio type found in audio format. Expected:1-15 Received:0");

const std::string no_memory_for_entry =
    test_support::bug_line("linked_list", "ll_create_entry", "calloc failed to allocate memory for the entry. ptr:PTR");

// What a collection changes in a prepared record.
fields_t changes_by(const bytes_t &collection) {
  scoped_edid_t edid;
  EXPECT_EQ(output_of([&] { EXPECT_EQ(decode_extension(extension_of(collection), edid.get()), 1); }), "");
  return difference(fields_of(edid_t{}), fields_of(*edid.get()));
}

}  // namespace

TEST(VideoDataBlock, DecodesEachDescriptorInOrder) {
  scoped_edid_t edid;
  EXPECT_EQ(decode_extension(extension_of(video_block({0x90, 0x04, 0x85, 0x7F, 0xFF, 0x00, 0x80})), edid.get()), 1);
  fields_t expected;
  const std::pair<u8, u32> videos[] = {{1, 16}, {0, 4}, {1, 5}, {0, 127}, {1, 127}, {0, 0}, {1, 0}};
  for (std::size_t i = 0; i < std::size(videos); ++i) {
    expected.merge(prefixed("video_list[" + std::to_string(i) + "].",
                            fields_of(short_video_desc_t{videos[i].first, videos[i].second, 0})));
  }
  EXPECT_EQ(difference(fields_of(edid_t{}), fields_of(*edid.get())), expected);
}

TEST(VideoDataBlock, DecodesEachBit) {
  for (u32 bit = 0; bit < 7; ++bit) {
    EXPECT_EQ(changes_by(video_block({byte_of(1u << bit)})),
              prefixed("video_list[0].", fields_of(short_video_desc_t{0, 1u << bit, 0})));
  }
  EXPECT_EQ(changes_by(video_block({0x80})), prefixed("video_list[0].", fields_of(short_video_desc_t{1, 0, 0})));
}

TEST(VideoDataBlock, MayOccurSeveralTimesAndBeEmpty) {
  scoped_edid_t edid;
  EXPECT_EQ(traced_output_of([&] {
              const bytes_t collection = all_of({video_block({1}), video_block({}), video_block({2, 3})});
              EXPECT_EQ(decode_extension(extension_of(collection), edid.get()), 1);
            }),
            trace("Video Data Block. Len=1") + trace("Video Data Block. Len=0") + trace("Video Data Block. Len=2"));
  EXPECT_EQ(test_support::modes_of(edid->video_list), (std::vector<test_support::mode_pair_t>{{1, 0}, {2, 0}, {3, 0}}));
}

TEST(VideoDataBlock, StopsTheDecodingWhenItsListRefusesAnEntry) {
  scoped_edid_t edid;
  const mistyped_list_t mistyped(edid->video_list);
  const bytes_t collection = all_of({data_block(4, {7, 0, 0}), video_block({16, 4}), data_block(7, {5, 3})});
  EXPECT_EQ(traced_output_of([&] { EXPECT_EQ(decode_extension(extension_of(collection), edid.get()), 0); }),
            trace("Speaker Allocation Data Block. Len=3") + trace("Video Data Block. Len=2") +
                mistyped_list_t::refusal(short_video_tag) + error("Failed adding entry to the back."));
  EXPECT_EQ(edid->speaker[0], 7);
  EXPECT_EQ(edid->xvycc601, 0);
}

TEST(VideoDataBlock, StopsTheDecodingWhenAnEntryCannotBeAllocated) {
  scoped_edid_t edid;
  EXPECT_EQ(output_of([&] {
              const test_support::failing_allocation_t failing(3);
              EXPECT_EQ(decode_extension(extension_of(video_block({16, 4})), edid.get()), 0);
            }),
            no_memory_for_entry + error("Failed creating new entry."));
  EXPECT_EQ(test_support::modes_of(edid->video_list), (std::vector<test_support::mode_pair_t>{{16, 0}}));
}

TEST(AudioDataBlock, DecodesEachDescriptorInOrder) {
  scoped_edid_t edid;
  const bytes_t collection =
      all_of({audio_block({0x09, 0x07, 0x05, 0x15, 0x07, 0x50}), audio_block({0x79, 0x06, 0x10})});
  EXPECT_EQ(output_of([&] { EXPECT_EQ(decode_extension(extension_of(collection), edid.get()), 1); }), "");
  EXPECT_EQ(audio_of(edid->audio_list),
            (std::vector<audio_words_t>{{1, 2, 7, 5, 0, 0, 0}, {2, 6, 7, 0, 640, 0, 0}, {17, 2, 6, 0, 0, 0, 0}}));
}

TEST(AudioDataBlock, SkipsADescriptorOfFormat0WithAWarning) {
  scoped_edid_t edid;
  const bytes_t collection = audio_block({0x09, 0x07, 0x05, 0x02, 0xAB, 0xC0, 0x15, 0x07, 0x50});
  EXPECT_EQ(traced_output_of([&] { EXPECT_EQ(decode_extension(extension_of(collection), edid.get()), 1); }),
            trace("Audio Data Block. Len=9") + unrecognised_format +
                codec_warning(function, "Failed to decode audio format. Index:3 byte3:0x02 byte2:0xAB byte1:0xC0"));
  EXPECT_EQ(audio_of(edid->audio_list), (std::vector<audio_words_t>{{1, 2, 7, 5, 0, 0, 0}, {2, 6, 7, 0, 640, 0, 0}}));
}

TEST(AudioDataBlock, KeepsAnExtendedFormatOfUnknownCodeAsType0) {
  EXPECT_EQ(changes_by(audio_block({0x7A, 0x06, 0x20})),
            prefixed("audio_list[0].", fields_of(short_audio_desc_t{0, 3, 6, 0, 0, 0, 0})));
}

TEST(AudioDataBlock, ReadsALastDescriptorThatIsCutFromTheBytesBehind) {
  scoped_edid_t of_4;
  // The second descriptor is 15, and then the header and the payload of the video block.
  ASSERT_EQ(
      decode_extension(extension_of(all_of({audio_block({0x09, 0x07, 0x05, 0x15}), video_block({0x10})})), of_4.get()),
      1);
  EXPECT_EQ(audio_of(of_4->audio_list),
            (std::vector<audio_words_t>{{1, 2, 7, 5, 0, 0, 0}, {2, 6, 0x41, 0, 128, 0, 0}}));
  EXPECT_EQ(test_support::modes_of(of_4->video_list), (std::vector<test_support::mode_pair_t>{{16, 0}}));

  scoped_edid_t of_5;
  ASSERT_EQ(decode_extension(extension_of(all_of({audio_block({0x09, 0x07, 0x05, 0x15, 0x02}), video_block({0x10})})),
                             of_5.get()),
            1);
  EXPECT_EQ(audio_of(of_5->audio_list),
            (std::vector<audio_words_t>{{1, 2, 7, 5, 0, 0, 0}, {2, 6, 2, 0, 0x41 * 8, 0, 0}}));
}

TEST(AudioDataBlock, OfNoBytesHoldsNoDescriptor) {
  scoped_edid_t edid;
  EXPECT_EQ(traced_output_of([&] { EXPECT_EQ(decode_extension(extension_of(audio_block({})), edid.get()), 1); }),
            trace("Audio Data Block. Len=0"));
  EXPECT_EQ(edid->audio_list.size, 0u);
}

TEST(AudioDataBlock, StopsTheDecodingWhenItsListRefusesAnEntry) {
  scoped_edid_t edid;
  const mistyped_list_t mistyped(edid->audio_list);
  EXPECT_EQ(output_of([&] {
              const bytes_t collection = all_of({audio_block({0x09, 0x07, 0x05, 0x15, 0x07, 0x50}), video_block({4})});
              EXPECT_EQ(decode_extension(extension_of(collection), edid.get()), 0);
            }),
            mistyped_list_t::refusal(short_audio_tag) + error("Failed adding entry to the back of the list."));
  EXPECT_EQ(edid->video_list.size, 0u);
}

TEST(AudioDataBlock, StopsTheDecodingWhenAnEntryCannotBeAllocated) {
  scoped_edid_t edid;
  EXPECT_EQ(output_of([&] {
              const bytes_t extension = extension_of(audio_block({0x09, 0x07, 0x05, 0x15, 0x07, 0x50}));
              const test_support::failing_allocation_t failing(3);
              EXPECT_EQ(decode_extension(extension, edid.get()), 0);
            }),
            no_memory_for_entry + error("Failed creating entry."));
  EXPECT_EQ(audio_of(edid->audio_list), (std::vector<audio_words_t>{{1, 2, 7, 5, 0, 0, 0}}));
}

TEST(SpeakerDataBlock, StoresItsThreeBytes) {
  EXPECT_EQ(changes_by(data_block(4, {0x4F, 0x81, 0xFF})),
            (fields_t{{"speaker[0]", "79"}, {"speaker[1]", "129"}, {"speaker[2]", "255"}}));
}

TEST(SpeakerDataBlock, OfAnotherLengthIsLeftOutWithAWarning) {
  for (const u32 length : {0u, 1u, 2u, 4u, 31u}) {
    SCOPED_TRACE(length);
    scoped_edid_t edid;
    EXPECT_EQ(traced_output_of([&] {
                EXPECT_EQ(decode_extension(extension_of(data_block(4, bytes_t(length, 0x01))), edid.get()), 1);
              }),
              trace("Speaker Allocation Data Block. Len=" + std::to_string(length)) +
                  codec_warning(function, "Speaker allocation block is longer than expected. Expected=3 Actual=" +
                                              std::to_string(length) + " Continuing..."));
    EXPECT_EQ(fields_of(*edid.get()), fields_of(edid_t{}));
  }
}

TEST(ColorimetryDataBlock, DecodesItsTwoBits) {
  EXPECT_EQ(changes_by(data_block(7, {0x05, 0x01, 0x00})), (fields_t{{"xvycc601", "1"}}));
  EXPECT_EQ(changes_by(data_block(7, {0x05, 0x02, 0x00})), (fields_t{{"xvycc709", "1"}}));
  EXPECT_EQ(changes_by(data_block(7, {0x05, 0xFF, 0xFF})), (fields_t{{"xvycc601", "1"}, {"xvycc709", "1"}}));
  EXPECT_EQ(changes_by(data_block(7, {0x05, 0xFC, 0xFF})), fields_t{});
}

TEST(ColorimetryDataBlock, PrintsNothingWhileTracing) {
  scoped_edid_t edid;
  EXPECT_EQ(traced_output_of([&] {
              EXPECT_EQ(decode_extension(extension_of(data_block(7, {0x05, 0x03, 0x00})), edid.get()), 1);
            }),
            "");
}

TEST(ColorimetryDataBlock, TakesTagAndBitsFromTheBytesBehindAShortBlock) {
  EXPECT_EQ(changes_by(all_of({data_block(7, {0x05}), data_block(0, {0x00, 0x00, 0x00})})),
            (fields_t{{"xvycc601", "1"}, {"xvycc709", "1"}}));
  EXPECT_EQ(changes_by(all_of({data_block(7, {}), data_block(0, {0x02, 0x00, 0x00, 0x00, 0x00})})),
            (fields_t{{"xvycc709", "1"}}));
}

TEST(ExtendedDataBlock, OfAnyOtherTagIsSkippedWithATrace) {
  for (u32 tag = 0; tag < 256; ++tag) {
    if (tag == 5) continue;
    scoped_edid_t edid;
    char digits[8];
    std::snprintf(digits, sizeof(digits), "%x", tag);
    EXPECT_EQ(traced_output_of([&] {
                EXPECT_EQ(decode_extension(extension_of(data_block(7, {byte_of(tag), 0x03, 0x03})), edid.get()), 1);
              }),
              trace(std::string("Extended Data block. Ignoring. ExtTag:0x") + digits + " Len=3"));
    EXPECT_EQ(fields_of(*edid.get()), fields_of(edid_t{}));
  }
}

TEST(VendorDataBlock, ThatIsRefusedDoesNotStopTheDecoding) {
  scoped_edid_t edid;
  const bytes_t collection = all_of({data_block(3, {0x03, 0x0C, 0x00, 0x10}), data_block(3, {0x03}), video_block({4})});
  EXPECT_EQ(
      traced_output_of([&] { EXPECT_EQ(decode_extension(extension_of(collection), edid.get()), 1); }),
      trace("Vendor Specific Data Block. Len=4") +
          codec_error("_decode_edid_vendor_block",
                      "Failed decoding the hdmi block. The length is required to be at least 5 bytes long. Length=4") +
          trace("Vendor Specific Data Block. Len=1") +
          codec_error("_decode_edid_vendor_block",
                      "Failed decoding the vendor block. Length not long enough to contain the vendor's id. "
                      "Length=1") +
          trace("Video Data Block. Len=1"));
  EXPECT_EQ(edid->hdmi_present, 0);
  EXPECT_EQ(edid->video_list.size, 1u);
}

}  // namespace codec_test
