// The blocks that are kept byte for byte.
#include "edid_composer/hdmi2/codec/passed_on_blocks.h"

#include <utility>

#include "codec_cases.h"

namespace hdmi2_test {
namespace {

struct row_t {
  hdmi2_block_t hdmi2_t::*member;
  u8 tag;
  bytes_t identifier;
  u32 least;
  const char *name;
};

const std::vector<row_t> &rows() {
  static const std::vector<row_t> table = {
      {&hdmi2_t::hdr_dynamic, 7, {0x07}, 4, "HDR dynamic metadata block"},
      {&hdmi2_t::hdr10plus, 7, {0x01, 0x8B, 0x84, 0x90}, 5, "HDR10+ block"},
      {&hdmi2_t::dolby_vision, 7, {0x01, 0x46, 0xD0, 0x00}, 9, "Dolby Vision block"},
      {&hdmi2_t::freesync, 3, {0x1A, 0x00, 0x00}, 8, "FreeSync block"},
  };
  return table;
}

/// A payload that begins as the block must, and has other bytes after that.
bytes_t payload_of(const row_t &row, u32 length, u8 first_byte = 0x51) {
  bytes_t payload = row.identifier;
  while (payload.size() < length)
    payload.push_back(first_byte++);
  return payload;
}

}  // namespace

TEST(PassedOnBlocks, AreKeptWithAllTheirBytes) {
  for (const row_t &row : rows()) {
    for (const u32 length : {row.least, row.least + 1, 31u}) {
      SCOPED_TRACE(std::string(row.name) + " of " + std::to_string(length));
      const bytes_t payload = payload_of(row, length);
      expect_both_ways(test_support::data_block(row.tag, payload), [&](hdmi2_t *record) {
        hdmi2_block_t &kept = record->*row.member;
        kept.length = static_cast<u8>(length);
        std::copy(payload.begin(), payload.end(), kept.payload);
      });
    }
  }
}

TEST(PassedOnBlocks, ThatAreTooShortCountAsNone) {
  for (const row_t &row : rows()) {
    const u32 length = row.least - 1;
    const bytes_t payload = payload_of(row, length);
    expect_equal(read_blocks({test_support::data_block(row.tag, payload)},
                             warning("The " + std::string(row.name) +
                                     " is too short. Ignoring it. Expected at least:" + std::to_string(row.least) +
                                     " Received:" + std::to_string(length) + " Block:1 Byte:4")),
                 empty_record());
    hdmi2_t record = empty_record();
    (record.*row.member).length = static_cast<u8>(length);
    std::copy(payload.begin(), payload.end(), (record.*row.member).payload);
    EXPECT_EQ(written(record), bytes_t());
  }
}

TEST(PassedOnBlocks, AreKnownByEveryByteOfTheirIdentifier) {
  for (const row_t &row : rows()) {
    for (std::size_t byte = 0; byte < row.identifier.size(); ++byte) {
      bytes_t payload = payload_of(row, 20);
      payload[byte] ^= 0x40;
      expect_equal(read_blocks({test_support::data_block(row.tag, payload)}), empty_record());
    }
  }
}

TEST(PassedOnBlocks, CountOnce) {
  for (const row_t &row : rows()) {
    const hdmi2_t record = read_blocks({test_support::data_block(row.tag, payload_of(row, 10, 0x20)),
                                        test_support::data_block(row.tag, payload_of(row, 12, 0x60))});
    EXPECT_EQ((record.*row.member).length, 10);
    EXPECT_EQ((record.*row.member).payload[9], payload_of(row, 10, 0x20)[9]);
  }
}

TEST(DolbyVision, Announces2160p60InItsFirstTwoVersions) {
  for (u32 version = 0; version < 8; ++version) {
    for (const bool bit : {false, true}) {
      hdmi2_block_t block{};
      block.payload[4] = static_cast<u8>(version << 5 | (bit ? 0x02 : 0xFD & 0x1F));
      EXPECT_EQ(edid_composer::dolby_vision_version(block), version);
      EXPECT_EQ(edid_composer::dolby_vision_has_2160p60(block), bit && version < 2);
    }
  }
}

}  // namespace hdmi2_test
