#include "edid_decode_encode/checksum.h"

#include "codec_fixture.h"

namespace codec_test {
namespace {

u8 checksum_of(const bytes_t &bytes) {
  const exact_bytes_t exact(bytes);
  return edid_composer::_calculate_checksum(edid_composer::byte_view_t(exact.data(), exact.size()));
}

bytes_t block_with(const std::vector<std::pair<std::size_t, u8>> &values) {
  bytes_t block(128, 0);
  for (const auto &[offset, value] : values)
    block[offset] = value;
  return block;
}

}  // namespace

TEST(BlockChecksum, CompletesTheSumToAMultipleOf256) {
  EXPECT_EQ(checksum_of(block_with({})), 0x00);
  EXPECT_EQ(checksum_of(block_with({{0, 1}})), 0xFF);
  EXPECT_EQ(checksum_of(block_with({{126, 0xFF}})), 0x01);
  EXPECT_EQ(checksum_of(block_with({{0, 0x80}, {126, 0x80}})), 0x00);
  EXPECT_EQ(checksum_of(block_with({{5, 0xFF}, {6, 0xFF}, {7, 0x03}})), 0xFF);
  EXPECT_EQ(checksum_of(bytes_t(128, 0xFF)), 0x7F);
}

TEST(BlockChecksum, DependsOnEachByteBeforeItself) {
  for (std::size_t offset = 0; offset < 127; ++offset) {
    EXPECT_EQ(checksum_of(block_with({{offset, 0x10}})), 0xF0) << offset;
  }
}

TEST(BlockChecksum, LeavesOutTheStoredChecksum) {
  EXPECT_EQ(checksum_of(block_with({{127, 0x55}})), 0x00);
  EXPECT_EQ(checksum_of(block_with({{3, 0x02}, {127, 0x55}})), 0xFE);
}

TEST(BlockChecksum, TakesMissingBytesAs0) {
  EXPECT_EQ(checksum_of({}), 0x00);
  EXPECT_EQ(checksum_of({0x02, 0x03}), 0xFB);
  EXPECT_EQ(checksum_of(bytes_t(127, 0x02)), 0x02);
}

}  // namespace codec_test
