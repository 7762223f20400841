// The standard timing, both directions.
#include "edid_decode_encode/standard_timing.h"

#include "codec_fixture.h"

namespace codec_test {

TEST(StandardTiming, IsReadFromEachPairOfBytesUnlessItIsTheFillerAndWrittenAsTheSame) {
  for (u32 a = 0; a < 256; ++a) {
    scoped_edid_t edid;
    auto timings = edid_composer::standard_timing_appender(edid.get(), nullptr);
    bytes_t expected;
    EXPECT_EQ(traced_output_of([&] {
                for (u32 b = 0; b < 256; ++b) {
                  EXPECT_TRUE(edid_composer::_decode_edid_standard_timing(byte_of(a), byte_of(b), &timings));
                  if (a == 1 && b == 1) continue;
                  expected.push_back(byte_of(a));
                  expected.push_back(byte_of(b));
                }
              }),
              "");
    bytes_t written(expected.size());
    edid_composer::byte_writer_t writer(written.data(), static_cast<u32>(written.size()));
    for (const auto &timing : elements_of<std_timing_t>(edid->std_timings))
      edid_composer::put_standard_timing(&writer, timing);
    EXPECT_EQ(written, expected) << a;
  }
}

TEST(StandardTiming, HasItsFields) {
  scoped_edid_t edid;
  auto timings = edid_composer::standard_timing_appender(edid.get(), nullptr);
  for (const auto &[a, b] : {std::pair<u8, u8>{0xD1, 0xFB}, {0x01, 0x41}, {0x00, 0x80}, {0xFF, 0x01}})
    EXPECT_TRUE(edid_composer::_decode_edid_standard_timing(a, b, &timings));
  EXPECT_EQ(test_support::std_timings_of(edid->std_timings),
            (std::vector<test_support::std_timing_words_t>{{1920, 3, 119}, {256, 1, 61}, {248, 2, 60}, {2288, 0, 61}}));
}

}  // namespace codec_test
