// Going through the data blocks of an extension.
#include "edid_decode_encode/data_blocks.h"

#include <array>

#include "codec_fixture.h"

namespace codec_test {
namespace {

using edid_composer::byte_view_t;
using edid_composer::data_blocks_t;

/// Offset, tag and length of a block.
using block_t = std::array<u32, 3>;

struct walk_t {
  std::vector<block_t> blocks;
  bool overruns;
  block_t last;
};

walk_t walk_of(const bytes_t &extension) {
  const exact_bytes_t bytes(extension);
  data_blocks_t blocks(byte_view_t(bytes.data(), bytes.size()));
  walk_t walk{};
  while (blocks.next())
    walk.blocks.push_back({blocks->offset, blocks->tag, blocks->length});
  walk.overruns = blocks.overruns();
  walk.last = {blocks->offset, blocks->tag, blocks->length};
  EXPECT_FALSE(blocks.next());
  return walk;
}

/// The first bytes of an extension, up to the end of its collection.
bytes_t collection(const bytes_t &blocks) {
  return test_support::join({2, 3, byte_of(4 + static_cast<u32>(blocks.size())), 0}, blocks);
}

}  // namespace

TEST(DataBlocks, AreGoneThroughOneAfterTheOther) {
  const walk_t walk = walk_of(collection({0x42, 16, 4, 0xE0, 0x61, 1}));
  EXPECT_EQ(walk.blocks, (std::vector<block_t>{{4, 2, 2}, {7, 7, 0}, {8, 3, 1}}));
  EXPECT_FALSE(walk.overruns);
}

TEST(DataBlocks, OfAnEmptyCollectionAreNone) {
  const walk_t walk = walk_of(collection({}));
  EXPECT_TRUE(walk.blocks.empty());
  EXPECT_FALSE(walk.overruns);
}

TEST(DataBlocks, EndAtTheOneThatOverruns) {
  const walk_t walk = walk_of(collection({0x41, 16, 0x24, 1, 2, 3}));
  EXPECT_EQ(walk.blocks, (std::vector<block_t>{{4, 2, 1}}));
  EXPECT_TRUE(walk.overruns);
  EXPECT_EQ(walk.last, (block_t{6, 1, 4}));
}

TEST(DataBlocks, MayReachToTheTimingsAndNoFurther) {
  for (u32 length = 0; length < 32; ++length) {
    bytes_t block(1 + length);
    block[0] = byte_of(0x40 | length);
    EXPECT_FALSE(walk_of(collection(block)).overruns) << length;
    if (length == 0) continue;
    block.pop_back();
    EXPECT_TRUE(walk_of(collection(block)).overruns) << length;
  }
}

TEST(DataBlocks, WithoutAPlaceForTimingsAreBoundedByTheBytesThatAreThere) {
  for (u32 offset = 0; offset < 4; ++offset) {
    bytes_t extension = collection({0x41, 16, 0x40});
    extension[2] = byte_of(offset);
    const walk_t walk = walk_of(extension);
    EXPECT_EQ(walk.blocks, (std::vector<block_t>{{4, 2, 1}, {6, 2, 0}})) << offset;
    EXPECT_TRUE(walk.overruns);
    EXPECT_EQ(walk.last, (block_t{7, 0, 0}));
  }
}

TEST(DataBlocks, ThatAreNotThereReadAsZero) {
  // The collection goes on after the bytes that are there.
  bytes_t extension = collection({0x41, 16});
  extension[2] = 9;
  const walk_t walk = walk_of(extension);
  EXPECT_EQ(walk.blocks, (std::vector<block_t>{{4, 2, 1}, {6, 0, 0}, {7, 0, 0}, {8, 0, 0}}));
  EXPECT_FALSE(walk.overruns);
}

}  // namespace codec_test
