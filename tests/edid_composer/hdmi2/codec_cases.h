// What the tests of the data blocks of HDMI 2 share: sinks made of data blocks, records, and reading both.
#pragma once

#include <gtest/gtest.h>

#include <cstring>
#include <functional>
#include <string>
#include <vector>

#include "edid_composer.h"
#include "support/edid_builder.h"
#include "support/output_capture.h"

namespace hdmi2_test {

using test_support::bytes_t;

/// An EDID whose extensions hold these data blocks, one extension for each list.
inline bytes_t sink_of(const std::vector<std::vector<bytes_t>> &extensions) {
  bytes_t edid = test_support::base_block_builder_t().extensions(static_cast<u8>(extensions.size())).build();
  for (const auto &blocks : extensions) {
    test_support::extension_builder_t extension;
    for (const bytes_t &block : blocks)
      extension.block(block);
    edid = test_support::join(edid, extension.build());
  }
  return edid;
}

/// Padding included, so that records can be compared as bytes.
inline hdmi2_t empty_record() {
  hdmi2_t record;
  std::memset(&record, 0, sizeof record);
  record.size = sizeof record;
  return record;
}

inline std::string warning(const std::string &message) {
  return test_support::warning_line("edid_composer", "decode_hdmi2", message);
}

/// What an EDID holds. The record's earlier content must not show. @p lines are all that may be printed.
inline hdmi2_t read(const bytes_t &edid, const std::string &lines = "") {
  hdmi2_t record;
  std::memset(&record, 0xA5, sizeof record);
  record.size = sizeof record;
  EXPECT_EQ(
      test_support::output_of([&] { EXPECT_TRUE(decode_hdmi2(edid.data(), static_cast<u32>(edid.size()), &record)); }),
      lines);
  EXPECT_EQ(record.size, sizeof record);
  return record;
}

/// What a sink with these data blocks holds.
inline hdmi2_t read_blocks(const std::vector<bytes_t> &blocks, const std::string &lines = "") {
  return read(sink_of({blocks}), lines);
}

/// The data blocks that a record is written as.
inline bytes_t written(const hdmi2_t &record) {
  bytes_t blocks(2048);
  u32 used = 0;
  EXPECT_EQ(test_support::output_of(
                [&] { EXPECT_TRUE(encode_hdmi2(&record, blocks.data(), static_cast<u32>(blocks.size()), &used)); }),
            "");
  blocks.resize(used);
  return blocks;
}

/// Members and their values, for all that a record must say; the others must be 0.
using fill_t = std::function<void(hdmi2_t *)>;

/// Where records differ, the report shows most of it.
inline void expect_equal(const hdmi2_t &actual, const hdmi2_t &expected) {
  const auto report = [](const hdmi2_t &record) { return test_support::output_of([&] { print_hdmi2(&record, ""); }); };
  EXPECT_EQ(report(actual), report(expected));
  EXPECT_EQ(0, std::memcmp(&actual, &expected, sizeof actual));
}

/// A block is read as a record with just these members, and that is written as the block.
inline void expect_both_ways(const bytes_t &block, const fill_t &fill) {
  hdmi2_t record = empty_record();
  fill(&record);
  expect_equal(read_blocks({block}), record);
  EXPECT_EQ(written(record), block);
}

}  // namespace hdmi2_test
