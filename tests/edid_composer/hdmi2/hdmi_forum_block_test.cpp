// The HDMI Forum vendor-specific data block and the sink capability data structure, byte by byte.
#include "codec_cases.h"

namespace hdmi2_test {
namespace {

/// The vendor-specific block with these bytes from byte 4 on.
bytes_t forum_block(const bytes_t &after_oui) {
  return test_support::data_block(3, test_support::join({0xD8, 0x5D, 0xC4}, after_oui));
}

/// The same in a sink capability data structure.
bytes_t capability_structure(const bytes_t &after_reserved) {
  return test_support::data_block(7, test_support::join({0x79, 0, 0}, after_reserved));
}

void fill_least(hdmi2_t *record) {
  record->forum_present = 1;
  record->forum_version = 1;
}

}  // namespace

TEST(HdmiForumBlock, HasAByteForTheRateInUnitsOf5MHz) {
  for (const u32 code : {0u, 69u, 120u, 255u}) {
    expect_both_ways(forum_block({1, static_cast<u8>(code), 0, 0}), [&](hdmi2_t *record) {
      fill_least(record);
      record->max_tmds_rate = 5 * code;
    });
  }
}

TEST(HdmiForumBlock, HasABitForEachCapability) {
  struct row_t {
    u8 hdmi2_t::*member;
    u8 byte_6;
    u8 byte_7;
  };
  constexpr row_t rows[] = {
      {&hdmi2_t::scdc, 0x80, 0},         {&hdmi2_t::read_request, 0x40, 0}, {&hdmi2_t::scramble_low, 0x08, 0},
      {&hdmi2_t::uhd_vic, 0, 0x08},      {&hdmi2_t::dc_48bit_420, 0, 0x04}, {&hdmi2_t::dc_36bit_420, 0, 0x02},
      {&hdmi2_t::dc_30bit_420, 0, 0x01},
  };
  for (const row_t &row : rows) {
    expect_both_ways(forum_block({1, 0, row.byte_6, row.byte_7}), [&](hdmi2_t *record) {
      fill_least(record);
      record->*row.member = 1;
    });
  }
}

TEST(HdmiForumBlock, HasTheFixedRateLinkInTheHighBits) {
  for (u32 rate = 0; rate < 16; ++rate) {
    expect_both_ways(forum_block({1, 0, 0, static_cast<u8>(rate << 4)}), [&](hdmi2_t *record) {
      fill_least(record);
      record->frl_rate = static_cast<u8>(rate);
    });
  }
}

TEST(HdmiForumBlock, MayEndAfterTheLowLatencyMode) {
  for (const u8 allm : {u8{0}, u8{1}}) {
    expect_both_ways(forum_block({1, 120, 0x80, 0, static_cast<u8>(allm << 1)}), [&](hdmi2_t *record) {
      fill_least(record);
      record->max_tmds_rate = 600;
      record->scdc = 1;
      record->allm_present = 1;
      record->allm = allm;
    });
  }
}

TEST(HdmiForumBlock, MayEndAfterTheVariableRefreshRates) {
  struct row_t {
    u32 minimum;
    u32 maximum;
    u8 byte_9;
    u8 byte_10;
  };
  constexpr row_t rows[] = {
      {48, 120, 0x30, 120}, {1, 0, 0x01, 0}, {63, 1023, 0xFF, 0xFF}, {0, 256, 0x40, 0}, {40, 512, 0xA8, 0}};
  for (const row_t &row : rows) {
    expect_both_ways(forum_block({1, 0, 0, 0, 0x02, row.byte_9, row.byte_10}), [&](hdmi2_t *record) {
      fill_least(record);
      record->allm_present = record->allm = 1;
      record->vrr_present = 1;
      record->vrr_min = static_cast<u8>(row.minimum);
      record->vrr_max = row.maximum;
    });
  }
}

TEST(HdmiForumBlock, HasNoVariableRefreshRatesWhereOneByteIsMissing) {
  const hdmi2_t record = read_blocks({forum_block({1, 0, 0, 0, 0x02, 0x30})});
  EXPECT_EQ(record.allm, 1);
  EXPECT_EQ(record.vrr_present, 0);
  EXPECT_EQ(record.vrr_min, 0);
}

TEST(HdmiForumBlock, MayHoldMoreThanIsKnown) {
  bytes_t after_oui = {1, 120, 0xFF, 0xFF, 0xFF, 0x30, 120};
  after_oui.resize(28, 0xFF);
  const hdmi2_t record = read_blocks({forum_block(after_oui)});
  EXPECT_EQ(record.max_tmds_rate, 600u);
  EXPECT_EQ(record.frl_rate, 15);
  EXPECT_EQ(record.allm, 1);
  EXPECT_EQ(record.vrr_min, 48);
  EXPECT_EQ(record.vrr_max, 120u);
}

TEST(HdmiForumBlock, ThatIsTooShortCountsAsNone) {
  const bytes_t complete = forum_block({1, 120, 0x80, 0});
  const std::string line =
      warning("The HDMI Forum block is too short. Ignoring it. Expected at least:7 Received:6 Block:1 Byte:4");
  expect_equal(read_blocks({forum_block({1, 120, 0x80})}, line), empty_record());
  EXPECT_EQ(read_blocks({forum_block({1, 60, 0x80}), complete}, line).max_tmds_rate, 600u);
}

TEST(HdmiForumBlock, CountsOnce) {
  const hdmi2_t record = read_blocks({forum_block({1, 100, 0, 0}), forum_block({1, 120, 0x80, 0, 0x02})});
  EXPECT_EQ(record.max_tmds_rate, 500u);
  EXPECT_EQ(record.scdc, 0);
  EXPECT_EQ(record.allm_present, 0);
}

TEST(SinkCapabilityStructure, HoldsWhatTheBlockHolds) {
  const bytes_t content = {1, 118, 0xC8, 0x6F, 0x02, 0x70, 0x90};
  expect_equal(read_blocks({capability_structure(content)}), read_blocks({forum_block(content)}));
  EXPECT_EQ(read_blocks({capability_structure(content)}).max_tmds_rate, 590u);
}

TEST(SinkCapabilityStructure, CountsOnlyWithoutTheBlock) {
  const bytes_t structure = capability_structure({2, 100, 0x80, 0x10, 0x02, 0x30, 120});
  const bytes_t block = forum_block({1, 120, 0, 0});
  const hdmi2_t alone = read_blocks({block});
  expect_equal(read_blocks({structure, block}), alone);
  expect_equal(read_blocks({block, structure}), alone);
  expect_equal(read(sink_of({{structure}, {block}})), alone);
}

TEST(SinkCapabilityStructure, StandsInForABlockThatIsTooShort) {
  const std::string line =
      warning("The HDMI Forum block is too short. Ignoring it. Expected at least:7 Received:6 Block:1 Byte:4");
  EXPECT_EQ(read_blocks({forum_block({1, 120, 0}), capability_structure({1, 100, 0, 0})}, line).max_tmds_rate, 500u);
}

TEST(SinkCapabilityStructure, ThatIsTooShortCountsAsNone) {
  expect_equal(read_blocks({capability_structure({1, 120, 0})},
                           warning("The HDMI Forum sink capability structure is too short. Ignoring it. Expected at "
                                   "least:7 Received:6 Block:1 Byte:4")),
               empty_record());
}

}  // namespace hdmi2_test
