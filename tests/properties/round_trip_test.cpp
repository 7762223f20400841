// Encoding a record and decoding the bytes gives the record back, but for named exceptions.
#include <gtest/gtest.h>

#include <set>

#include "property_runs.h"
#include "round_trip_exceptions.h"
#include "support/output_capture.h"
#include "support/records.h"

namespace properties {
namespace {

using test_support::bytes_t;

struct encoder_run_t {
  u8 result = 0;
  bytes_t bytes = bytes_t(256, 0xA5);
  std::string output;
};

encoder_run_t encode(const plain_record_t &record, bool native_bit) {
  encoder_run_t run;
  platform_values_t values{};
  values.native_bit = native_bit ? 1 : 0;
  test_support::scoped_edid_t edid;
  write_to(edid.get(), record);
  run.output = test_support::raw_output_of(
      [&] { run.result = encode_edid(run.bytes.data(), 256, edid.get(), nullptr, &values); });
  return run;
}

/// The record that the bytes decode to; of the extension only if it is whole.
codec_test::fields_t decoded(const bytes_t &bytes, bool with_extension) {
  const bytes_t base(bytes.begin(), bytes.begin() + 128);
  const bytes_t extension(bytes.begin() + 128, bytes.end());
  test_support::scoped_edid_t edid;
  EXPECT_EQ(test_support::raw_output_of([&] {
              EXPECT_EQ(decode_edid_block_0(base.data(), edid.get()), 1);
              if (!with_extension) return;
              EXPECT_EQ(decode_edid_extensions(extension.data(), 128, edid.get()), 1);
            }),
            "");
  return codec_test::fields_of(*edid.get());
}

/// The record with all exceptions; adds the names of those that made a difference to @p applied.
plain_record_t expected_of(const encoding_t &encoding, std::set<std::string> *applied) {
  plain_record_t expected = encoding.record;
  for (const exception_t &exception : exceptions()) {
    if (applied->count(exception.name) != 0) {
      exception.apply(encoding, expected);
      continue;
    }
    const codec_test::fields_t before = fields_of(expected);
    exception.apply(encoding, expected);
    if (fields_of(expected) != before) applied->insert(exception.name);
  }
  return expected;
}

TEST(RandomRecord, ComesBackFromItsBytesButForNamedExceptions) {
  std::set<std::string> applied;
  u32 whole = 0;
  for_each_run(3000, [&](random_source_t &random) {
    const plain_record_t record = random_record(random);
    const bool native_bit = random.flag() != 0;
    const encoder_run_t run = encode(record, native_bit);
    ASSERT_EQ(run.result, 1) << run.output;
    const bool with_extension = is_extension_decodable(record);
    whole += with_extension ? 1 : 0;
    const codec_test::fields_t expected = fields_of(expected_of({record, native_bit, run.bytes}, &applied));
    const codec_test::fields_t actual = decoded(run.bytes, with_extension);
    EXPECT_EQ(codec_test::difference(expected, actual), codec_test::fields_t{});
  });
  expect_at_least(1500, whole, "records whose extension is whole");
  // An exception that nothing needs any more has to go.
  for (const exception_t &exception : exceptions())
    expect_at_least(1, static_cast<u32>(applied.count(exception.name)), exception.name);
}

/// The line that tells of an extension without room, of which the numbers are said.
bool is_overflow_line(const std::string &line, u32 needed) {
  return line.find(":encode_edid() ERROR: ") != std::string::npos &&
         line.find(" " + std::to_string(needed) + " ") != std::string::npos && line.find(" 127 ") != std::string::npos;
}

TEST(RandomRecord, SaysWhenItHasNoRoomAndNothingElseThatWasNotOrdered) {
  for_each_run(4000, [](random_source_t &random) {
    const plain_record_t record = random_record(random);
    const encoder_run_t run = encode(record, true);
    std::vector<std::string> lines = test_support::lines_in(run.output);
    const u32 needed = extension_size(record);
    if (needed > 127) {
      ASSERT_FALSE(lines.empty()) << needed;
      EXPECT_TRUE(is_overflow_line(lines.back(), needed)) << needed << " " << lines.back();
      lines.pop_back();
    }
    const std::size_t truncations = (record.video.size() > 31 ? 1u : 0u) + (record.audio.size() > 10 ? 1u : 0u);
    EXPECT_EQ(lines.size(), truncations) << run.output;
    for (const std::string &line : lines)
      EXPECT_NE(line.find(" WARNING: Requested too many short "), std::string::npos) << line;
  });
}

TEST(RandomRecord, HasItsChecksumsWhereItsLastDescriptorAndItsExtensionEnd) {
  for_each_run(4000, [](random_source_t &random) {
    const plain_record_t record = random_record(random);
    const bytes_t bytes = encode(record, true).bytes;
    const edid_t &edid = record.scalars;
    const u32 name = is_written(text_of(edid.monitor_name, sizeof edid.monitor_name)) ? 1 : 0;
    const u32 limits = edid.min_v_rate != 0 && edid.max_v_rate != 0 && edid.min_h_rate != 0 && edid.max_h_rate != 0 &&
                               edid.max_pixel_clock != 0
                           ? 1
                           : 0;
    const u32 end = 54 + 18 * (2 + name + limits);
    EXPECT_EQ(bytes[end], 1);
    for (u32 i = end + 2; i < 128; ++i)
      EXPECT_EQ(bytes[i], 0) << i;
    // The sum is 0 only if the byte behind the extension count is its checksum: no other byte is left to make it so.
    EXPECT_EQ(test_support::block_sum(bytes.data()), 0);
    EXPECT_EQ(test_support::block_sum(bytes.data() + 128), 0);
    const u32 size = extension_size(record);
    for (u32 i = size + 1; i < 127; ++i)
      EXPECT_EQ(bytes[128 + i], 0) << i;
  });
}

}  // namespace
}  // namespace properties
