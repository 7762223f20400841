// The video capability, colorimetry and HDR static metadata data blocks, byte by byte.
#include "codec_cases.h"

namespace hdmi2_test {
namespace {

std::string too_short(const std::string &name, u32 expected, u32 received) {
  return warning("The " + name + " is too short. Ignoring it. Expected at least:" + std::to_string(expected) +
                 " Received:" + std::to_string(received) + " Block:1 Byte:4");
}

}  // namespace

TEST(VideoCapabilityBlock, HasTwoFlagsAndThreeFieldsOfTwoBits) {
  struct row_t {
    u8 byte;
    u8 hdmi2_t::*member;
    u8 value;
  };
  constexpr row_t rows[] = {
      {0x80, &hdmi2_t::ycc_quantization, 1}, {0x40, &hdmi2_t::rgb_quantization, 1}, {0x30, &hdmi2_t::preferred_scan, 3},
      {0x10, &hdmi2_t::preferred_scan, 1},   {0x0C, &hdmi2_t::it_scan, 3},          {0x08, &hdmi2_t::it_scan, 2},
      {0x03, &hdmi2_t::ce_scan, 3},          {0x01, &hdmi2_t::ce_scan, 1},
  };
  for (const row_t &row : rows) {
    expect_both_ways({0xE2, 0x00, row.byte}, [&](hdmi2_t *record) {
      record->video_capability_present = 1;
      record->*row.member = row.value;
    });
  }
}

TEST(VideoCapabilityBlock, ThatIsTooShortCountsAsNone) {
  expect_equal(read_blocks({{0xE1, 0x00}}, too_short("video capability block", 2, 1)), empty_record());
}

TEST(ColorimetryBlock, HasTwoBytes) {
  expect_both_ways({0xE3, 0x05, 0xC3, 0x01}, [](hdmi2_t *record) {
    record->colorimetry_present = 1;
    record->colorimetry = HDMI2_BT2020_RGB | HDMI2_BT2020_YCC | HDMI2_XVYCC709 | HDMI2_XVYCC601;
    record->gamut_metadata = 1;
  });
  expect_both_ways({0xE3, 0x05, 0x3C, 0xFE}, [](hdmi2_t *record) {
    record->colorimetry_present = 1;
    record->colorimetry = HDMI2_BT2020_CYCC | HDMI2_OPRGB | HDMI2_OPYCC601 | HDMI2_SYCC601;
    record->gamut_metadata = 0xFE;
  });
}

TEST(ColorimetryBlock, ThatIsTooShortCountsAsNone) {
  expect_equal(read_blocks({{0xE2, 0x05, 0xFF}}, too_short("colorimetry block", 3, 2)), empty_record());
}

TEST(HdrStaticBlock, HasUpToThreeLuminances) {
  const bytes_t luminance = {115, 90, 18};
  for (u8 count = 0; count <= 3; ++count) {
    bytes_t block = {static_cast<u8>(0xE3 + count), 0x06, 0x0D, 0x01};
    block.insert(block.end(), luminance.begin(), luminance.begin() + count);
    expect_both_ways(block, [&](hdmi2_t *record) {
      record->hdr_static_present = 1;
      record->eotfs = HDMI2_EOTF_SDR | HDMI2_EOTF_PQ | HDMI2_EOTF_HLG;
      record->metadata_types = 1;
      record->luminance_count = count;
      std::copy_n(luminance.begin(), count, record->luminance);
    });
  }
}

TEST(HdrStaticBlock, MayHoldMoreThanIsKnown) {
  const hdmi2_t record = read_blocks({{0xE8, 0x06, 0xFF, 0xFE, 1, 2, 3, 4, 5}});
  EXPECT_EQ(record.eotfs, 0xFF);
  EXPECT_EQ(record.metadata_types, 0xFE);
  EXPECT_EQ(record.luminance_count, 3);
  EXPECT_EQ(record.luminance[2], 3);
}

TEST(HdrStaticBlock, ThatIsTooShortCountsAsNone) {
  expect_equal(read_blocks({{0xE2, 0x06, 0x0F}}, too_short("HDR static metadata block", 3, 2)), empty_record());
}

TEST(PictureBlocks, CountOnce) {
  const hdmi2_t record = read_blocks(
      {{0xE2, 0, 0x40}, {0xE2, 0, 0x80}, {0xE3, 5, 1, 0}, {0xE3, 5, 2, 1}, {0xE4, 6, 5, 1, 90}, {0xE3, 6, 9, 1}});
  EXPECT_EQ(record.rgb_quantization, 1);
  EXPECT_EQ(record.ycc_quantization, 0);
  EXPECT_EQ(record.colorimetry, 1);
  EXPECT_EQ(record.gamut_metadata, 0);
  EXPECT_EQ(record.eotfs, 5);
  EXPECT_EQ(record.luminance_count, 1);
}

TEST(PictureBlocks, AreFoundAfterOnesThatAreTooShort) {
  const hdmi2_t record = read_blocks({{0xE1, 0}, {0xE2, 0, 0x40}}, too_short("video capability block", 2, 1));
  EXPECT_EQ(record.rgb_quantization, 1);
}

TEST(PictureBlocks, WithoutAnExtendedTagAreNone) {
  expect_equal(read_blocks({{0xE0}, {0xE0}}), empty_record());
}

}  // namespace hdmi2_test
