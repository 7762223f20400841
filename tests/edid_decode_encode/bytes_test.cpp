// Bytes that aren't there read as 0; bytes without room are counted, not written.
#include "bytes.h"

#include <gtest/gtest.h>

#include <vector>

namespace edid_composer {
namespace {

TEST(ByteView, ReadsZeroBehindItsEnd) {
  const std::vector<u8> bytes{0x12, 0x34, 0x56};
  const byte_view_t view(bytes.data(), 3);
  EXPECT_EQ(view[2], 0x56);
  EXPECT_EQ(view[3], 0);
  EXPECT_EQ(view.little_endian_16(2), 0x56U);
  EXPECT_EQ(view.big_endian_16(2), 0x5600U);
  EXPECT_EQ(view.little_endian_32(1), 0x5634U);
  EXPECT_EQ(view.from(1)[0], 0x34);
  EXPECT_EQ(view.from(3).size(), 0U);
  EXPECT_EQ(view.from(0xFFFFFFFF)[0], 0);
}

TEST(ByteView, OfNothingIsEmptyWhateverItsSize) {
  const byte_view_t view(nullptr, 128);
  EXPECT_EQ(view.size(), 0U);
  EXPECT_EQ(view[0], 0);
  EXPECT_EQ(view.from(1).size(), 0U);
}

TEST(ByteView, CopiesZerosForWhatIsMissing) {
  const std::vector<u8> bytes{1, 2};
  u8 copy[4] = {0xA5, 0xA5, 0xA5, 0xA5};
  byte_view_t(bytes.data(), 2).copy(1, copy, 3);
  EXPECT_EQ(copy[0], 2);
  EXPECT_EQ(copy[1], 0);
  EXPECT_EQ(copy[2], 0);
  EXPECT_EQ(copy[3], 0xA5);
}

TEST(ByteWriter, CountsBehindItsEndAndWritesNothingThere) {
  std::vector<u8> bytes(3, 0xA5);
  byte_writer_t writer(bytes.data(), 3);
  writer.put(1);
  const u32 kept = writer.reserve();
  writer.put_little_endian_32(0x44332211);
  writer.put_at(kept, 7);
  writer.put_at(3, 8);
  EXPECT_EQ(writer.position(), 6U);
  EXPECT_EQ(bytes, (std::vector<u8>{1, 7, 0x11}));
}

}  // namespace
}  // namespace edid_composer
