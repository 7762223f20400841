// Reading of all extensions of a sink.
#include "edid_composer/hdmi2/codec/sink_reader.h"

#include "codec_cases.h"
#include "edid_composer/hdmi2/codec/cta_extensions.h"

namespace hdmi2_test {
namespace {

constexpr u32 block_size = 128;

/// A video data block with one descriptor, so that an extension that is read shows.
bytes_t mode(u8 code) {
  return test_support::video_block({code});
}

bytes_t codes_of(const hdmi2_t &record) {
  return {record.svds, record.svds + record.svd_count};
}

u32 first_of(const bytes_t &edid) {
  return edid_composer::first_cta_extension({edid.data(), static_cast<u32>(edid.size())});
}

/// A sink of three extensions with a mode each, the second of which has another byte, with a right checksum.
bytes_t sink_with(u32 extension, u32 offset, u8 value) {
  bytes_t edid = sink_of({{mode(16)}, {mode(97)}, {mode(102)}});
  edid[extension * block_size + offset] = value;
  test_support::mend_checksum(edid, extension * block_size);
  return edid;
}

}  // namespace

TEST(SinkReader, ReadsAllExtensionsInOrder) {
  const bytes_t edid = sink_of({{mode(16)}, {mode(97), {0xE2, 0, 0x40}}, {mode(102), {0xE2, 0, 0x80}}});
  const hdmi2_t record = read(edid);
  EXPECT_EQ(codes_of(record), (bytes_t{16, 97, 102}));
  EXPECT_EQ(record.rgb_quantization, 1);
  EXPECT_EQ(record.ycc_quantization, 0);
  EXPECT_EQ(first_of(edid), 1u);
}

TEST(SinkReader, PassesOverWhatIsNoExtensionOfRevision3) {
  struct row_t {
    u32 offset;
    u8 value;
  };
  for (const row_t &row : {row_t{0, 0x70}, row_t{0, 0xF0}, row_t{1, 1}, row_t{1, 2}, row_t{1, 4}, row_t{2, 128}}) {
    SCOPED_TRACE(std::to_string(row.offset) + " = " + std::to_string(row.value));
    EXPECT_EQ(codes_of(read(sink_with(1, row.offset, row.value))), (bytes_t{97, 102}));
    EXPECT_EQ(first_of(sink_with(1, row.offset, row.value)), 2u);
    EXPECT_EQ(codes_of(read(sink_with(2, row.offset, row.value))), (bytes_t{16, 102}));
  }
}

TEST(SinkReader, PassesOverAnExtensionThatFailsItsChecksum) {
  bytes_t edid = sink_of({{mode(16)}, {mode(97)}, {mode(102)}});
  ++edid[2 * block_size - 1];
  EXPECT_EQ(codes_of(read(edid)), (bytes_t{97, 102}));
  EXPECT_EQ(first_of(edid), 2u);
}

TEST(SinkReader, TakesDataBlocksUpToTheChecksum) {
  std::vector<bytes_t> blocks(3, test_support::video_block(bytes_t(31, 16)));
  blocks.push_back(test_support::video_block(bytes_t(26, 97)));
  const bytes_t edid = sink_of({blocks});
  EXPECT_EQ(edid[block_size + 2], 127);
  EXPECT_EQ(read(edid).svd_count, 119u);
}

TEST(SinkReader, TakesNoDataBlocksFromAnOffsetWithinTheHeader) {
  for (u8 offset = 0; offset < 4; ++offset)
    EXPECT_EQ(codes_of(read(sink_with(2, 2, offset))), (bytes_t{16, 102}));
}

TEST(SinkReader, EndsAnExtensionAtABlockThatCrossesItsEnd) {
  bytes_t edid = sink_of({{mode(16), {0xE2, 0, 0x40}, mode(4)}, {mode(97)}});
  edid[block_size + 6] = 0xE5;
  test_support::mend_checksum(edid, block_size);
  const hdmi2_t record =
      read(edid, warning("A data block crosses the end of the data blocks. Ignoring the rest of them. Tag:7 Len:5 "
                         "Block:1 Byte:6 End:11"));
  EXPECT_EQ(codes_of(record), (bytes_t{16, 97}));
  EXPECT_EQ(record.video_capability_present, 0);
}

TEST(SinkReader, ReadsNoMoreThanIsAnnounced) {
  bytes_t edid = sink_of({{mode(16)}, {mode(97)}});
  for (const u8 announced : {u8{0}, u8{1}, u8{2}, u8{255}}) {
    edid[126] = announced;
    test_support::mend_checksum(edid, 0);
    EXPECT_EQ(read(edid).svd_count, std::min<u32>(announced, 2));
    EXPECT_EQ(first_of(edid), announced == 0 ? 0u : 1u);
  }
}

TEST(SinkReader, ReadsNoMoreThanIsThere) {
  bytes_t edid = sink_of({{mode(16)}, {mode(97)}});
  edid.resize(2 * block_size);
  EXPECT_EQ(codes_of(read(edid)), bytes_t{16});
  edid.resize(block_size);
  edid.shrink_to_fit();
  expect_equal(read(edid), empty_record());
  EXPECT_EQ(first_of(edid), 0u);
}

TEST(SinkReader, ReadsEightExtensions) {
  std::vector<std::vector<bytes_t>> extensions;
  for (u8 i = 1; i <= 12; ++i)
    extensions.push_back({mode(i)});
  bytes_t edid = sink_of(extensions);
  EXPECT_EQ(codes_of(read(edid)), (bytes_t{1, 2, 3, 4, 5, 6, 7, 8}));
  // One that is passed over is none of them.
  edid[3 * block_size] = 0x70;
  test_support::mend_checksum(edid, 3 * block_size);
  EXPECT_EQ(codes_of(read(edid)), (bytes_t{1, 2, 4, 5, 6, 7, 8, 9}));
}

TEST(SinkReader, HasRoomForAllDescriptorsOfEightExtensions) {
  std::vector<bytes_t> blocks(3, test_support::video_block(bytes_t(31, 16)));
  blocks.push_back(test_support::video_block(bytes_t(26, 97)));
  const hdmi2_t record = read(sink_of(std::vector<std::vector<bytes_t>>(9, blocks)));
  EXPECT_EQ(record.svd_count, u32{HDMI2_MOST_SVDS});
  EXPECT_EQ(record.svds[HDMI2_MOST_SVDS - 1], 97);
}

TEST(SinkReader, FindsBlocksInLaterExtensions) {
  const hdmi2_t record = read(sink_of({{{0xE2, 0x0F, 0x01}}, {mode(97), {0xE3, 0x06, 0x05, 0x01}}}));
  EXPECT_EQ(record.y420_map[0], 1);
  EXPECT_EQ(record.hdr_static_present, 1);
}

TEST(SinkReader, SaysNothingOfWhatItDoesNotRead) {
  // An HDMI block, audio, speakers, a VESA block, reserved tags, an unknown extended tag, another vendor.
  expect_equal(read_blocks({{0x65, 3, 12, 0, 0x10, 0},
                            {0x23, 0x09, 7, 7},
                            {0x83, 1, 0, 0},
                            {0xA1, 0},
                            {0xC1, 0},
                            {0x01, 0},
                            {0xE2, 0x78, 3},
                            {0x63, 1, 2, 3}}),
               empty_record());
}

}  // namespace hdmi2_test
