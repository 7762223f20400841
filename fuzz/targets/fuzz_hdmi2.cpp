// Whole EDIDs of several extensions: byte 0 says what is mended, the rest is the EDID. What is read is encoded and read
// again.
#include <cstring>

#include "fuzz_input.h"
#include "fuzz_target.h"
#include "sink_bytes.h"

namespace {

constexpr std::size_t longest_edid = 12 * fuzz::block_size;
/// Every block at its longest: 31 of video descriptors, ten others.
constexpr u32 most_encoded = 41 * (1 + HDMI2_MOST_BLOCK_BYTES);

void mend(u8 *edid, u32 size) {
  if (size < fuzz::block_size) return;
  edid[126] = static_cast<u8>(size / fuzz::block_size - 1);
  fuzz::mend_base_block(edid);
  for (u32 at = fuzz::block_size; at + fuzz::block_size <= size; at += fuzz::block_size)
    fuzz::mend_extension(edid + at);
}

/// The first of the data blocks, as many as an extension has room for, in an EDID of their own.
void read_again(const u8 *blocks, u32 used) {
  u8 edid[2 * fuzz::block_size] = {};
  u8 *const extension = edid + fuzz::block_size;
  u32 size = 0;
  while (size < used && size + 1 + (blocks[size] & 0x1F) <= 123)
    size += 1 + (blocks[size] & 0x1F);
  extension[2] = static_cast<u8>(4 + size);
  std::memcpy(extension + 4, blocks, size);
  mend(edid, sizeof edid);
  hdmi2_t hdmi2;
  hdmi2.size = sizeof hdmi2;
  FUZZ_REQUIRE(decode_hdmi2(edid, sizeof edid, &hdmi2));
  u8 again[most_encoded];
  u32 used_again = 0;
  FUZZ_REQUIRE(encode_hdmi2(&hdmi2, again, sizeof again, &used_again));
  // A map may have lost the bits of descriptors that had no room; its size stays.
  FUZZ_REQUIRE(used_again == size);
}

}  // namespace

int LLVMFuzzerTestOneInput(const u8 *data, std::size_t size) {
  fuzz::fuzz_input_t input(data, size);
  const u8 options = input.byte();
  debug_enable((options & 2) != 0);
  hdmi2_t hdmi2;
  if ((options & 4) != 0) {
    // Any record at all.
    const auto record = input.block(sizeof hdmi2);
    std::memcpy(&hdmi2, record.bytes.get(), sizeof hdmi2);
  } else {
    const auto edid = input.rest(longest_edid);
    if ((options & 1) != 0) mend(edid.bytes.get(), edid.size);
    hdmi2.size = sizeof hdmi2;
    decode_hdmi2(edid.bytes.get(), edid.size, &hdmi2);
    FUZZ_REQUIRE(hdmi2.svd_count <= HDMI2_MOST_SVDS);
  }
  hdmi2.size = sizeof hdmi2;
  print_hdmi2(&hdmi2, "fuzz");

  u8 blocks[most_encoded];
  u32 used = 0;
  FUZZ_REQUIRE(encode_hdmi2(&hdmi2, blocks, sizeof blocks, &used));
  read_again(blocks, used);
  const auto exact = input.block(used);
  FUZZ_REQUIRE(encode_hdmi2(&hdmi2, exact.bytes.get(), exact.size, &used));
  if (used > 0) FUZZ_REQUIRE(!encode_hdmi2(&hdmi2, exact.bytes.get(), used - 1, &used));
  return 0;
}
