// Encoding a record and decoding the bytes gives the record back when its values are such as bytes can hold.
#include <gtest/gtest.h>

#include "plain_record.h"
#include "property_runs.h"
#include "support/edid_builder.h"
#include "support/output_capture.h"
#include "support/patterns.h"
#include "support/records.h"

namespace properties {
namespace {

using test_support::bytes_t;

struct encoder_run_t {
  u8 result = 0;
  bytes_t bytes = bytes_t(256, 0xA5);
  std::string output;
};

encoder_run_t encode(const plain_record_t &record) {
  encoder_run_t run;
  platform_values_t values{};
  values.native_bit = 1;
  test_support::scoped_edid_t edid;
  write_to(edid.get(), record);
  run.output = test_support::raw_output_of(
      [&] { run.result = encode_edid(run.bytes.data(), 256, edid.get(), nullptr, &values); });
  return run;
}

codec_test::fields_t decoded(const bytes_t &bytes) {
  const bytes_t base(bytes.begin(), bytes.begin() + 128);
  const bytes_t extension(bytes.begin() + 128, bytes.end());
  test_support::scoped_edid_t edid;
  EXPECT_EQ(test_support::raw_output_of([&] {
              EXPECT_EQ(decode_edid_block_0(base.data(), edid.get()), 1);
              EXPECT_EQ(decode_edid_extensions(extension.data(), 128, edid.get()), 1);
            }),
            "");
  return codec_test::fields_of(*edid.get());
}

TEST(CanonicalRecord, ComesBackFromItsBytes) {
  for_each_run(3000, [](random_source_t &random) {
    plain_record_t record = random_canonical_record(random);
    const encoder_run_t run = encode(record);
    ASSERT_EQ(run.result, 1);
    ASSERT_EQ(run.output, "");
    // What the encoder adds.
    record.scalars.checksum = run.bytes[127];
    record.timings.push_back(test_support::timing_of_vic(1));
    EXPECT_EQ(codec_test::difference(fields_of(record), decoded(run.bytes)), codec_test::fields_t{});
  });
}

TEST(RandomRecord, IsEncodedAndSaysWhatThereWasNoRoomFor) {
  u32 overflows = 0;
  for_each_run(4000, [&](random_source_t &random) {
    const plain_record_t record = random_record(random);
    const encoder_run_t run = encode(record);
    ASSERT_EQ(run.result, 1);
    EXPECT_EQ(test_support::block_sum(run.bytes.data()), 0);
    EXPECT_EQ(test_support::block_sum(run.bytes.data() + 128), 0);

    std::vector<std::string> lines = test_support::lines_in(run.output);
    const auto overflow = test_support::first_match(
        run.output, "^edid_decode_encode:[0-9]+:encode_edid\\(\\) ERROR: [^0-9\n]* ([0-9]+) [^0-9\n]* 127 ");
    if (!overflow.empty()) {
      EXPECT_GT(std::stoul(overflow[1]), 127U);
      lines.pop_back();
      ++overflows;
    }
    const std::size_t truncations = (record.video.size() > 31 ? 1u : 0u) + (record.audio.size() > 10 ? 1u : 0u);
    EXPECT_EQ(lines.size(), truncations) << run.output;
    for (const std::string &line : lines)
      EXPECT_NE(line.find(" WARNING: Requested too many short "), std::string::npos) << line;
  });
  expect_at_least(5, overflows, "records without room");
}

}  // namespace
}  // namespace properties
