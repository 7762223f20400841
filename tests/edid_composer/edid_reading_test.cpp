// The hexadecimal dump of EDID blocks.
#include "edid_composer/edid_reading.h"

#include <gtest/gtest.h>

#include <cstdio>
#include <string>
#include <vector>

#include "support/output_capture.h"

namespace {

using edid_composer::_dump_raw_edid_block;
using test_support::output_of;
using test_support::traced_output_of;

std::vector<u8> counting_bytes(std::size_t count) {
  std::vector<u8> bytes(count);
  for (std::size_t i = 0; i < count; ++i)
    bytes[i] = static_cast<u8>(i);
  return bytes;
}

/// One block of 8 lines, of which the first holds the values from @p first on.
std::string block_from(unsigned first) {
  std::string text;
  for (unsigned value = first; value < first + 128; ++value) {
    char byte[8];
    std::snprintf(byte, sizeof byte, "%02X ", value & 0xFF);
    text += byte;
    if (value % 16 == 15) text += "\n";
  }
  return text;
}

TEST(RawDump, PrintsABlockAsEightLinesThatEndInABlank) {
  const std::vector<u8> bytes = counting_bytes(128);
  const std::string output = traced_output_of([&] { _dump_raw_edid_block(bytes.data(), 1); });
  EXPECT_EQ(output.substr(0, 98),
            "00 01 02 03 04 05 06 07 08 09 0A 0B 0C 0D 0E 0F \n10 11 12 13 14 15 16 17 18 19 1A 1B 1C 1D 1E 1F \n");
  EXPECT_EQ(output, block_from(0));
}

TEST(RawDump, SeparatesBlocksByAnEmptyLine) {
  const std::vector<u8> bytes = counting_bytes(384);
  EXPECT_EQ(traced_output_of([&] { _dump_raw_edid_block(bytes.data(), 2); }), block_from(0) + "\n" + block_from(128));
  EXPECT_EQ(traced_output_of([&] { _dump_raw_edid_block(bytes.data(), 3); }),
            block_from(0) + "\n" + block_from(128) + "\n" + block_from(256));
}

TEST(RawDump, PrintsNothingForNoBlocks) {
  const std::vector<u8> bytes = counting_bytes(1);
  EXPECT_EQ(traced_output_of([&] { _dump_raw_edid_block(bytes.data(), 0); }), "");
  EXPECT_EQ(traced_output_of([&] { _dump_raw_edid_block(bytes.data(), -1); }), "");
}

TEST(RawDump, PrintsNothingWhileTracingIsOff) {
  const std::vector<u8> bytes = counting_bytes(256);
  EXPECT_EQ(output_of([&] { _dump_raw_edid_block(bytes.data(), 2); }), "");
}

}  // namespace
