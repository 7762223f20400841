// The YCbCr 4:2:0 video data block and the capability map.
#include "codec_cases.h"

namespace hdmi2_test {
namespace {

void set_descriptors(hdmi2_t *record, const bytes_t &codes) {
  record->svd_count = static_cast<u32>(codes.size());
  std::copy(codes.begin(), codes.end(), record->svds);
}

/// A video data block with @p count descriptors.
bytes_t modes(u32 count) {
  return test_support::video_block(bytes_t(count, 16));
}

std::string map_bits_ignored(u32 descriptors, u32 others) {
  return warning(
      "The YCbCr 4:2:0 capability map marks more than the short video descriptors. Ignoring the others. "
      "Descriptors:" +
      std::to_string(descriptors) + " Others:" + std::to_string(others));
}

}  // namespace

TEST(Ycbcr420VideoBlock, HoldsDescriptorsAsTheyStand) {
  for (const u32 count : {1u, 2u, 30u}) {
    const bytes_t codes(count, 96);
    bytes_t block = {static_cast<u8>(0xE1 + count), 0x0E};
    block.insert(block.end(), codes.begin(), codes.end());
    expect_both_ways(block, [&](hdmi2_t *record) {
      record->y420_count = static_cast<u8>(count);
      std::copy(codes.begin(), codes.end(), record->y420_vics);
    });
  }
}

TEST(Ycbcr420VideoBlock, WithoutDescriptorsCountsAsNone) {
  const hdmi2_t record =
      read_blocks({{0xE1, 0x0E}, {0xE2, 0x0E, 97}, {0xE2, 0x0E, 96}},
                  warning("The YCbCr 4:2:0 video block is too short. Ignoring it. Expected at least:2 Received:1 "
                          "Block:1 Byte:4"));
  EXPECT_EQ(record.y420_count, 1);
  EXPECT_EQ(record.y420_vics[0], 97);
}

TEST(Ycbcr420Map, HasABitForEachDescriptor) {
  const bytes_t codes = {16, 97, 96, 31, 4, 19, 5, 20, 102};
  hdmi2_t record = empty_record();
  set_descriptors(&record, codes);
  record.y420_map_present = 1;
  record.y420_map_bytes = 2;
  record.y420_map[0] = 0x06;
  record.y420_map[1] = 0x01;
  const bytes_t blocks = test_support::join(test_support::video_block(codes), {0xE3, 0x0F, 0x06, 0x01});
  EXPECT_EQ(written(record), blocks);
  expect_equal(read_blocks({blocks}), record);
}

TEST(Ycbcr420Map, WithoutABitIsThereAllTheSame) {
  expect_both_ways({0xE1, 0x0F}, [](hdmi2_t *record) { record->y420_map_present = 1; });
}

TEST(Ycbcr420Map, MayComeAheadOfTheDescriptors) {
  const hdmi2_t record = read_blocks({{0xE2, 0x0F, 0x03}, modes(2)});
  EXPECT_EQ(record.y420_map[0], 0x03);
}

TEST(Ycbcr420Map, CountsDescriptorsOfAllVideoBlocks) {
  const hdmi2_t record = read(sink_of({{modes(7), {0xE3, 0x0F, 0xFF, 0x01}}, {modes(2)}}));
  EXPECT_EQ(record.svd_count, 9u);
  EXPECT_EQ(record.y420_map[1], 0x01);
}

TEST(Ycbcr420Map, MarksNothingButDescriptors) {
  EXPECT_EQ(read_blocks({modes(4), {0xE2, 0x0F, 0x1F}}, map_bits_ignored(4, 1)).y420_map[0], 0x0F);
  const hdmi2_t none = read_blocks({{0xE3, 0x0F, 0xFF, 0x01}}, map_bits_ignored(0, 9));
  EXPECT_EQ(none.y420_map_bytes, 2);
  EXPECT_EQ(none.y420_map[0], 0);
  EXPECT_EQ(none.y420_map[1], 0);
}

TEST(Ycbcr420Map, MayBeLongerThanItsBits) {
  bytes_t map = {0xFF, 0x0F, 0x01};
  map.resize(32, 0);
  EXPECT_EQ(read_blocks({modes(1), map}).y420_map_bytes, 30);
}

TEST(Ycbcr420Map, CountsOnce) {
  const hdmi2_t record = read_blocks({modes(2), {0xE1, 0x0F}, {0xE2, 0x0F, 0x01}});
  EXPECT_EQ(record.y420_map_present, 1);
  EXPECT_EQ(record.y420_map_bytes, 0);
}

}  // namespace hdmi2_test
