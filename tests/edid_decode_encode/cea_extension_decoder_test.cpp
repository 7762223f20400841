// The course of decoding an extension: header, flags, trailing timings, and the walk over the data blocks.
#include <cstdio>

#include "extension_lines.h"

namespace codec_test {
namespace {

using extension_lines::error;
using extension_lines::malformed;
using extension_lines::trace;
using test_support::data_block;
using test_support::join;
using test_support::video_block;

std::string output_of_decoding(const bytes_t &extension, edid_t *edid, u8 result) {
  return output_of([&] { EXPECT_EQ(decode_extension(extension, edid), result); });
}
std::string traced_output_of_decoding(const bytes_t &extension, edid_t *edid, u8 result) {
  return traced_output_of([&] { EXPECT_EQ(decode_extension(extension, edid), result); });
}

bytes_t with_byte(bytes_t extension, std::size_t offset, u8 value) {
  extension[offset] = value;
  test_support::mend_checksum(extension, 0);
  return extension;
}

bytes_t timing(u8 clock) {
  bytes_t descriptor(18, 0);
  descriptor[0] = clock;
  descriptor[17] = 0x18;
  return descriptor;
}

std::vector<u32> clocks_of(const edid_t &edid) {
  std::vector<u32> clocks;
  for (const auto &each : elements_of<detailed_timing_t>(edid.dtd_list))
    clocks.push_back(each.pixel_clock / 10000);
  return clocks;
}

std::vector<u32> vics_of(const edid_t &edid) {
  std::vector<u32> vics;
  for (const auto &each : elements_of<short_video_desc_t>(edid.video_list))
    vics.push_back(each.vic);
  return vics;
}

}  // namespace

TEST(ExtensionDecoder, DecodesAnEmptyCollectionToNothing) {
  scoped_edid_t edid;
  const bytes_t extension = extension_of({});
  ASSERT_EQ(extension[2], 4);
  EXPECT_EQ(traced_output_of_decoding(extension, edid.get(), 1), "");
  EXPECT_EQ(fields_of(*edid.get()), fields_of(edid_t{}));
}

TEST(ExtensionDecoder, RefusesAMissingExtensionFirst) {
  scoped_edid_t edid;
  const std::string message = error("Function called with edid_extension set to NULL.");
  EXPECT_EQ(output_of([&] { EXPECT_EQ(decode_edid_extensions(nullptr, 128, edid.get()), 0); }), message);
  EXPECT_EQ(output_of([&] { EXPECT_EQ(decode_edid_extensions(nullptr, 0, nullptr), 0); }), message);
}

TEST(ExtensionDecoder, RefusesAMissingRecordBeforeItLooksAtTheBytes) {
  EXPECT_EQ(output_of_decoding(bytes_t(128, 0xFF), nullptr, 0), error("Function called with edid set to NULL."));
}

TEST(ExtensionDecoder, RefusesOtherTagsThanCea) {
  scoped_edid_t edid;
  EXPECT_EQ(output_of_decoding(with_byte(extension_of({}), 0, 0x00), edid.get(), 0),
            error("The extension is not a CEA extension. Expected=0x2 Received=0x0"));
  EXPECT_EQ(output_of_decoding(with_byte(extension_of({}), 0, 0xF0), edid.get(), 0),
            error("The extension is not a CEA extension. Expected=0x2 Received=0xF0"));
  EXPECT_EQ(output_of_decoding(bytes_t(128, 0xFF), edid.get(), 0),
            error("The extension is not a CEA extension. Expected=0x2 Received=0xFF"));
}

TEST(ExtensionDecoder, RefusesOtherRevisionsThan3) {
  const std::pair<u8, const char *> revisions[] = {{0, "0"}, {1, "1"}, {2, "2"}, {4, "4"}, {0xAB, "AB"}};
  for (const auto &[revision, digits] : revisions) {
    SCOPED_TRACE(digits);
    scoped_edid_t edid;
    EXPECT_EQ(output_of_decoding(with_byte(extension_of({}), 1, revision), edid.get(), 0),
              error(std::string("Extension is the wrong version. Expected=0x3 Received=0x") + digits));
  }
}

TEST(ExtensionDecoder, TestsTagThenRevisionThenChecksumThenOffset) {
  scoped_edid_t edid;
  bytes_t extension(128, 0);
  extension[2] = 111;
  EXPECT_EQ(output_of_decoding(extension, edid.get(), 0),
            error("The extension is not a CEA extension. Expected=0x2 Received=0x0"));
  extension[0] = 2;
  EXPECT_EQ(output_of_decoding(extension, edid.get(), 0),
            error("Extension is the wrong version. Expected=0x3 Received=0x0"));
  extension[1] = 3;
  // 2 + 3 + 111 = 0x74.
  EXPECT_EQ(output_of_decoding(extension, edid.get(), 0),
            error("Edid failed the checksum. Calculated:0x8C Received:0x00"));
  extension[127] = 0x8C;
  EXPECT_EQ(output_of_decoding(extension, edid.get(), 0),
            error("EDID DTD offset value is larger than the block. Offset:111\n"));
  EXPECT_EQ(fields_of(*edid.get()), fields_of(edid_t{}));
}

TEST(ExtensionDecoder, AcceptsADtdOffsetUpTo110) {
  // A collection of reserved blocks with 106 bytes.
  const bytes_t collection = all_of({data_block(0, bytes_t(31, 0)), data_block(0, bytes_t(31, 0)),
                                     data_block(0, bytes_t(31, 0)), data_block(0, bytes_t(9, 0))});
  const bytes_t extension = extension_of(collection);
  ASSERT_EQ(extension[2], 110);
  scoped_edid_t edid;
  EXPECT_EQ(output_of_decoding(extension, edid.get(), 1), "");
  for (const u32 offset : {111u, 128u, 255u}) {
    EXPECT_EQ(output_of_decoding(with_byte(extension, 2, byte_of(offset)), edid.get(), 0),
              error("EDID DTD offset value is larger than the block. Offset:" + std::to_string(offset) + "\n"));
  }
}

TEST(ExtensionDecoder, DecodesEachFlag) {
  const char *const fields[8] = {nullptr,     nullptr,     nullptr,       nullptr,
                                 "ycbcr_422", "ycbcr_444", "basic_audio", "underscan"};
  for (u32 bit = 0; bit < 8; ++bit) {
    SCOPED_TRACE(bit);
    scoped_edid_t edid;
    EXPECT_EQ(output_of_decoding(extension_of({}, byte_of(1u << bit)), edid.get(), 1), "");
    EXPECT_EQ(difference(fields_of(edid_t{}), fields_of(*edid.get())),
              fields[bit] == nullptr ? fields_t{} : (fields_t{{fields[bit], "1"}}));
  }
}

TEST(ExtensionTimings, AreAppendedInByteOrder) {
  scoped_edid_t edid;
  ASSERT_EQ(decode_base_block(blank_base_block().descriptor(0, timing(1)).descriptor(1, timing(2)).build(), edid.get()),
            1);
  EXPECT_EQ(traced_output_of_decoding(extension_of({}, 0, all_of({timing(3), timing(4), timing(5)})), edid.get(), 1),
            trace_line("_decode_edid_dtd", "Added DTD: WxH=0x0p pixel:30000") +
                trace_line("_decode_edid_dtd", "Added DTD: WxH=0x0p pixel:40000") +
                trace_line("_decode_edid_dtd", "Added DTD: WxH=0x0p pixel:50000"));
  EXPECT_EQ(clocks_of(*edid.get()), (std::vector<u32>{1, 2, 3, 4, 5}));
}

TEST(ExtensionTimings, AreDecodedBeforeTheDataBlocks) {
  scoped_edid_t edid;
  EXPECT_EQ(traced_output_of_decoding(extension_of(video_block({16}), 0, timing(3)), edid.get(), 1),
            trace_line("_decode_edid_dtd", "Added DTD: WxH=0x0p pixel:30000") + trace("Video Data Block. Len=1"));
}

TEST(ExtensionTimings, AreDecodedBehindAnEmptySlotToo) {
  scoped_edid_t edid;
  EXPECT_EQ(decode_extension(extension_of({}, 0, all_of({bytes_t(18, 0), timing(7)})), edid.get()), 1);
  EXPECT_EQ(clocks_of(*edid.get()), (std::vector<u32>{7}));
}

TEST(ExtensionTimings, EndBeforeTheChecksum) {
  // Slots from byte d on are looked at while byte d + 18 exists.
  const auto clocks_at = [](u8 offset, u32 length) {
    bytes_t extension(length, 0);
    extension[0] = 2;
    extension[1] = 3;
    extension[2] = offset;
    extension[4] = byte_of(offset - 5u) & 0x1F;
    for (u32 i = 5; i < offset; ++i)
      extension[i] = 0;
    const bytes_t descriptor = timing(9);
    for (u32 i = 0; i < 18 && offset + i < 127; ++i)
      extension[offset + i] = descriptor[i];
    test_support::mend_checksum(extension, 0);
    scoped_edid_t edid;
    EXPECT_EQ(decode_extension(extension, edid.get()), 1);
    return clocks_of(*edid.get());
  };
  EXPECT_EQ(clocks_at(109, 128), (std::vector<u32>{9}));
  EXPECT_EQ(clocks_at(110, 128), (std::vector<u32>{}));
  EXPECT_EQ(clocks_at(110, 129), (std::vector<u32>{9}));
}

TEST(ExtensionTimings, AreLookedForInTheBytesBehindTheBlock) {
  bytes_t bytes = extension_of({});
  bytes.resize(256, 0);
  // Slots start at bytes 4, 22, ..., 112, 130, ...: the last that ends before the last byte is at 220.
  bytes[130] = 0x21;
  bytes[220] = 0x22;
  bytes[238] = 0x23;
  scoped_edid_t edid;
  EXPECT_EQ(decode_extension(bytes, edid.get()), 1);
  EXPECT_EQ(clocks_of(*edid.get()), (std::vector<u32>{0x21, 0x22}));

  scoped_edid_t of_one_block;
  EXPECT_EQ(decode_edid_extensions(bytes.data(), 128, of_one_block.get()), 1);
  EXPECT_EQ(clocks_of(*of_one_block.get()), (std::vector<u32>{}));
}

TEST(ExtensionTimings, ThatAreMalformedOnlyLog) {
  bytes_t malformed_slot(18, 0);
  malformed_slot[2] = 0x12;
  bytes_t unknown_slot(18, 0);
  unknown_slot[3] = 0x05;
  scoped_edid_t edid;
  EXPECT_EQ(output_of_decoding(extension_of(video_block({4}), 0, all_of({malformed_slot, unknown_slot, timing(6)})),
                               edid.get(), 1),
            codec_error("_decode_edid_dtd",
                        "Malformed DTD: The DTD's pixel clock is 0 indicating that the byte 0x2 and byte 0x4 should be "
                        "zero, but they are not. Byte2:0x12 Byte4:0x00") +
                codec_warning("_decode_edid_dtd", "Unknown data tag within DTD timing. Ignoring. tag=0x5"));
  EXPECT_EQ(clocks_of(*edid.get()), (std::vector<u32>{6}));
  EXPECT_EQ(vics_of(*edid.get()), (std::vector<u32>{4}));
}

TEST(ExtensionTimings, ThatTheirListRefusesOnlyLog) {
  scoped_edid_t edid;
  const mistyped_list_t mistyped(edid->dtd_list);
  EXPECT_EQ(output_of_decoding(extension_of(video_block({4}), 0, timing(6)), edid.get(), 1),
            mistyped_list_t::refusal(detailed_timing_tag) +
                codec_error("_decode_edid_dtd", "Failed adding entry to the back."));
  EXPECT_EQ(vics_of(*edid.get()), (std::vector<u32>{4}));
}

TEST(ExtensionTimings, MayHoldTextDescriptors) {
  scoped_edid_t edid;
  EXPECT_EQ(decode_extension(extension_of({}, 0, test_support::text_descriptor(0xFF, "SN 42")), edid.get()), 1);
  EXPECT_STREQ(edid->serial_string, "SN 42");
}

TEST(DataBlockWalk, AcceptsABlockThatEndsTheCollection) {
  for (u32 length = 0; length < 32; ++length) {
    SCOPED_TRACE(length);
    scoped_edid_t edid;
    EXPECT_EQ(traced_output_of_decoding(extension_of(data_block(0, bytes_t(length, 0xFF))), edid.get(), 1),
              trace("Reserved code. Len=" + std::to_string(length)));
  }
}

TEST(DataBlockWalk, RefusesABlockThatRunsOneByteOver) {
  for (u32 tag = 0; tag < 8; ++tag) {
    SCOPED_TRACE(tag);
    scoped_edid_t edid;
    const bytes_t block = {byte_of(tag << 5 | 4), 1, 2, 3};
    EXPECT_EQ(traced_output_of_decoding(extension_of(block), edid.get(), 0), malformed(tag, 4, 0, 4));
    EXPECT_EQ(fields_of(*edid.get()), fields_of(edid_t{}));
  }
}

TEST(DataBlockWalk, KeepsTheBlocksBeforeTheOneThatItRefuses) {
  scoped_edid_t edid;
  EXPECT_EQ(output_of_decoding(extension_of(all_of({video_block({16, 4}), {0x25, 0x09, 0x07}}), 0x80, timing(3)),
                               edid.get(), 0),
            malformed(1, 5, 3, 6));
  EXPECT_EQ(edid->underscan, 1);
  EXPECT_EQ(vics_of(*edid.get()), (std::vector<u32>{16, 4}));
  EXPECT_EQ(clocks_of(*edid.get()), (std::vector<u32>{3}));
  EXPECT_EQ(edid->audio_list.size, 0u);
}

TEST(DataBlockWalk, GoesThroughBlocksOfEveryTag) {
  scoped_edid_t edid;
  const bytes_t collection =
      all_of({data_block(0, {1, 2}), data_block(1, {0x09, 0x07, 0x05}), data_block(2, {0x10}),
              data_block(3, {0x01, 0x02, 0x03}), data_block(4, {0x01, 0x00, 0x00}), data_block(5, {1, 2, 3, 4}),
              data_block(6, {}), data_block(7, {0x06, 0x01}), data_block(7, {0x05, 0x03})});
  EXPECT_EQ(traced_output_of_decoding(extension_of(collection), edid.get(), 1),
            trace("Reserved code. Len=2") + trace("Audio Data Block. Len=3") + trace("Video Data Block. Len=1") +
                trace("Vendor Specific Data Block. Len=3") +
                trace_line("_decode_edid_vendor_block", "Unrecognized vendor block. Ignoring. Vendor=0x30201") +
                trace("Speaker Allocation Data Block. Len=3") + trace("VESA DTC Data Block. Ignoring. Len=4") +
                trace("Reserved Code:6. Ignoring. Len=0") + trace("Extended Data block. Ignoring. ExtTag:0x6 Len=2"));
  EXPECT_EQ(difference(fields_of(edid_t{}), fields_of(*edid.get())),
            (together({{"speaker[0]", "1"}, {"xvycc601", "1"}, {"xvycc709", "1"}},
                      together(prefixed("audio_list[0].", fields_of(short_audio_desc_t{1, 2, 7, 5, 0, 0, 0})),
                               prefixed("video_list[0].", fields_of(short_video_desc_t{0, 16, 0}))))));
}

}  // namespace codec_test
