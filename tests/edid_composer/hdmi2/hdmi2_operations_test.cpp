// What the operations of the record refuse, and how.
#include "codec_cases.h"

namespace hdmi2_test {
namespace {

std::string error(const std::string &operation, const std::string &message) {
  return test_support::error_line("edid_composer", operation, message);
}

/// Decoding fails with a line, and the record says that there is nothing.
void expect_refused(const u8 *edid, u32 size, const std::string &message) {
  hdmi2_t record;
  std::memset(&record, 0xA5, sizeof record);
  record.size = sizeof record;
  EXPECT_EQ(test_support::output_of([&] { EXPECT_FALSE(decode_hdmi2(edid, size, &record)); }),
            error("decode_hdmi2", message));
  expect_equal(record, empty_record());
}

void expect_refused(const bytes_t &edid, const std::string &message) {
  expect_refused(edid.data(), static_cast<u32>(edid.size()), message);
}

bytes_t sink() {
  return sink_of({{test_support::video_block({97})}});
}

bytes_t sink_with(u32 offset, u8 value) {
  bytes_t edid = sink();
  edid[offset] = value;
  test_support::mend_checksum(edid, 0);
  return edid;
}

const std::string record_missing = "Function called with hdmi2 set to NULL.";

std::string record_too_small(std::size_t size) {
  return "The size of the record is too small. Expected at least:" + std::to_string(sizeof(hdmi2_t)) +
         " Received:" + std::to_string(size);
}

}  // namespace

TEST(DecodeHdmi2, RefusesAnEdidWithoutARightBaseBlock) {
  expect_refused(nullptr, 256, "Function called with edid set to NULL.");
  expect_refused(sink_with(0, 1),
                 "The base block does not begin with the header of an EDID. Expected:0x00FFFFFFFFFFFF00 "
                 "Received:0x01FFFFFFFFFFFF00");
  expect_refused(sink_with(18, 2), "The base block is of another version. Expected:1.3 Received:2.3");
  expect_refused(sink_with(19, 2), "The base block is of another version. Expected:1.3 Received:1.2");
  bytes_t edid = sink();
  edid[127] = static_cast<u8>(edid[127] + 1);
  hdmi2_t record = empty_record();
  const std::string lines = test_support::output_of([&] { EXPECT_FALSE(decode_hdmi2(edid.data(), 256, &record)); });
  EXPECT_NE(lines.find("ERROR: The base block failed the checksum. Calculated:0x"), std::string::npos) << lines;
  EXPECT_EQ(record.svd_count, 0u);
}

TEST(DecodeHdmi2, TakesLaterRevisionsOfEdid1) {
  EXPECT_EQ(read(sink_with(19, 4)).svd_count, 1u);
}

TEST(DecodeHdmi2, RefusesASizeThatIsNoMultipleOf128) {
  const bytes_t edid = sink();
  for (const u32 size : {0u, 1u, 127u, 129u, 255u}) {
    expect_refused(edid.data(), size,
                   "The size of the EDID is not a multiple of 128 bytes. Received:" + std::to_string(size));
  }
}

TEST(DecodeHdmi2, LeavesARecordAloneThatIsTooSmall) {
  const bytes_t edid = sink();
  hdmi2_t record;
  std::memset(&record, 0xA5, sizeof record);
  record.size = sizeof record - 1;
  hdmi2_t before;
  std::memcpy(&before, &record, sizeof record);
  EXPECT_EQ(test_support::output_of([&] { EXPECT_FALSE(decode_hdmi2(edid.data(), 256, &record)); }),
            error("decode_hdmi2", record_too_small(sizeof record - 1)));
  EXPECT_EQ(0, std::memcmp(&before, &record, sizeof record));
  EXPECT_EQ(test_support::output_of([&] { EXPECT_FALSE(decode_hdmi2(edid.data(), 256, nullptr)); }),
            error("decode_hdmi2", record_missing));
}

TEST(DecodeHdmi2, FillsWhatItKnowsOfALargerRecord) {
  struct larger_t {
    hdmi2_t known;
    u8 added[8];
  } record;
  std::memset(&record, 0xA5, sizeof record);
  record.known.size = sizeof record;
  const bytes_t edid = sink();
  EXPECT_TRUE(decode_hdmi2(edid.data(), 256, &record.known));
  EXPECT_EQ(record.known.size, sizeof(hdmi2_t));
  EXPECT_EQ(record.known.svd_count, 1u);
  for (const u8 byte : record.added)
    EXPECT_EQ(byte, 0xA5);
}

TEST(EncodeHdmi2, WritesVideoDataBlocksOf31) {
  hdmi2_t record = empty_record();
  record.svd_count = 63;
  std::memset(record.svds, 97, 63);
  const bytes_t blocks = written(record);
  ASSERT_EQ(blocks.size(), 66u);
  EXPECT_EQ(blocks[0], 0x5F);
  EXPECT_EQ(blocks[32], 0x5F);
  EXPECT_EQ(blocks[64], 0x41);
}

TEST(EncodeHdmi2, WritesTheBlocksInOrder) {
  const std::vector<bytes_t> blocks = {
      {0x42, 97, 16},
      {0x67, 0xD8, 0x5D, 0xC4, 1, 120, 0x80, 0},
      {0xE2, 0x00, 0x4F},
      {0xE3, 0x05, 0xC0, 0x00},
      {0xE3, 0x06, 0x05, 0x01},
      {0xE2, 0x0E, 96},
      {0xE2, 0x0F, 0x01},
      {0xE4, 0x07, 0x02, 0x01, 0x00},
      {0xE5, 0x01, 0x8B, 0x84, 0x90, 0x01},
      {0xE9, 0x01, 0x46, 0xD0, 0x00, 0x2A, 1, 2, 3, 4},
      {0x68, 0x1A, 0x00, 0x00, 1, 1, 48, 120, 0},
  };
  bytes_t all;
  for (const bytes_t &block : blocks)
    all = test_support::join(all, block);
  EXPECT_EQ(written(read_blocks({blocks.rbegin(), blocks.rend()})), all);
}

TEST(EncodeHdmi2, CutsValuesToTheirFields) {
  hdmi2_t record = empty_record();
  std::memset(&record.svd_count, 0xFF, sizeof record - sizeof record.size);
  const bytes_t all_set(31, 0xFF);
  const auto block_of = [&](u8 tag, bytes_t identifier) {
    identifier.resize(31, 0xFF);
    return test_support::data_block(tag, identifier);
  };
  bytes_t expected;
  for (u32 i = 0; i < 30; ++i)
    expected = test_support::join(expected, test_support::video_block(all_set));
  expected = test_support::join(expected, test_support::video_block(bytes_t(22, 0xFF)));
  for (const bytes_t &block :
       {bytes_t{0x6A, 0xD8, 0x5D, 0xC4, 0xFF, 0xFF, 0xC8, 0xFF, 0x02, 0xFF, 0xFF}, bytes_t{0xE2, 0x00, 0xFF},
        bytes_t{0xE3, 0x05, 0xFF, 0xFF}, bytes_t{0xE6, 0x06, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF}, block_of(7, {0x0E}),
        block_of(7, {0x0F}), block_of(7, {0x07}), block_of(7, {0x01, 0x8B, 0x84, 0x90}),
        block_of(7, {0x01, 0x46, 0xD0, 0x00}), block_of(3, {0x1A, 0x00, 0x00})}) {
    expected = test_support::join(expected, block);
  }
  EXPECT_EQ(written(record), expected);
}

TEST(EncodeHdmi2, RoundsTheRateDown) {
  hdmi2_t record = empty_record();
  record.forum_present = 1;
  record.max_tmds_rate = 599;
  EXPECT_EQ(written(record)[5], 119);
}

TEST(EncodeHdmi2, WritesNothingWhereThereIsTooLittleRoom) {
  hdmi2_t record = empty_record();
  record.video_capability_present = 1;
  record.colorimetry_present = 1;
  for (u32 size = 0; size < 7; ++size) {
    bytes_t blocks(7, 0xA5);
    u32 used = 0;
    EXPECT_EQ(test_support::output_of([&] { EXPECT_FALSE(encode_hdmi2(&record, blocks.data(), size, &used)); }),
              error("encode_hdmi2", "The data blocks have too little room. Needed:7 Received:" + std::to_string(size)));
    EXPECT_EQ(used, 7u);
    EXPECT_EQ(blocks, bytes_t(7, 0xA5));
  }
}

TEST(EncodeHdmi2, RefusesWhatIsMissing) {
  hdmi2_t record = empty_record();
  u8 blocks[1] = {};
  u32 used = 0;
  const auto output = [&](const hdmi2_t *from, u8 *to, u32 *count) {
    return test_support::output_of([&] { EXPECT_FALSE(encode_hdmi2(from, to, 1, count)); });
  };
  EXPECT_EQ(output(nullptr, blocks, &used), error("encode_hdmi2", record_missing));
  EXPECT_EQ(output(&record, nullptr, &used), error("encode_hdmi2", "Function called with blocks set to NULL."));
  EXPECT_EQ(output(&record, blocks, nullptr), error("encode_hdmi2", "Function called with used set to NULL."));
  record.size = 4;
  EXPECT_EQ(output(&record, blocks, &used), error("encode_hdmi2", record_too_small(4)));
}

TEST(PrintHdmi2, RefusesWhatIsMissing) {
  hdmi2_t record = empty_record();
  record.size = 0;
  EXPECT_EQ(test_support::output_of([&] { EXPECT_FALSE(print_hdmi2(&record, "TITLE")); }),
            error("print_hdmi2", record_too_small(0)));
  EXPECT_EQ(test_support::output_of([&] { EXPECT_FALSE(print_hdmi2(nullptr, "TITLE")); }),
            error("print_hdmi2", record_missing));
}

}  // namespace hdmi2_test
