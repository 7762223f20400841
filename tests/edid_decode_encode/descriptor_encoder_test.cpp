// Encoding of detailed timings and texts.
#include "edid_decode_encode/descriptor.h"

#include <cstdio>

#include "codec_fixture.h"
#include "timing_layout.h"

namespace codec_test {
namespace {

// The 18 bytes of a timing; the block is exactly as long, and full of something else beforehand.
bytes_t encoded(const detailed_timing_t &timing) {
  const exact_bytes_t block(bytes_t(18, 0xA5));
  EXPECT_EQ(traced_output_of([&] { EXPECT_TRUE(edid_composer::_encode_edid_dtd(block.data(), &timing)); }), "");
  return bytes_t(block.data(), block.data() + 18);
}

detailed_timing_t smallest_timing() {
  detailed_timing_t timing{};
  timing.valid = 1;
  timing.pixel_clock = 40960000;  // 0x1000 x 10 kHz
  timing.progressive = 1;
  return timing;
}

void set_field(detailed_timing_t &timing, const std::string &field, u32 value) {
  const std::pair<const char *, u32 detailed_timing_t::*> words[] = {
      {"h_active", &detailed_timing_t::h_active},           {"h_blanking", &detailed_timing_t::h_blanking},
      {"v_active", &detailed_timing_t::v_active},           {"v_blanking", &detailed_timing_t::v_blanking},
      {"h_sync_offset", &detailed_timing_t::h_sync_offset}, {"h_sync_width", &detailed_timing_t::h_sync_width},
      {"v_sync_offset", &detailed_timing_t::v_sync_offset}, {"v_sync_width", &detailed_timing_t::v_sync_width},
      {"h_image_size", &detailed_timing_t::h_image_size},   {"v_image_size", &detailed_timing_t::v_image_size}};
  const std::pair<const char *, u8 detailed_timing_t::*> bytes[] = {
      {"h_border", &detailed_timing_t::h_border},
      {"v_border", &detailed_timing_t::v_border},
      {"h_sync_positive", &detailed_timing_t::h_sync_positive},
      {"v_sync_positive", &detailed_timing_t::v_sync_positive}};
  for (const auto &[name, member] : words) {
    if (field == name) timing.*member = value;
  }
  for (const auto &[name, member] : bytes) {
    if (field == name) timing.*member = byte_of(value);
  }
}

std::string dtd_refusal(u8 *block, const detailed_timing_t *timing) {
  return output_of([&] { EXPECT_FALSE(edid_composer::_encode_edid_dtd(block, timing)); });
}

}  // namespace

TEST(DetailedTimingEncoder, WritesZerosForWhatATimingDoesNotHave) {
  EXPECT_EQ(encoded(smallest_timing()), (bytes_t{0x00, 0x10, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0x18}));
}

TEST(DetailedTimingEncoder, EncodesRealTimings) {
  EXPECT_EQ(encoded(test_support::timing_of_vic(1)), (bytes_t{0xD6, 0x09, 0x80, 0xA0, 0x20, 0xE0, 0x2D, 0x10, 0x10,
                                                              0x60, 0xA2, 0x00, 0x13, 0x8E, 0x21, 0, 0, 0x18}));
  EXPECT_EQ(encoded(test_support::timing_of_vic(5)), (bytes_t{0x01, 0x1D, 0x80, 0x18, 0x71, 0x1C, 0x16, 0x20, 0x58,
                                                              0x2C, 0x25, 0x00, 0xC4, 0x8E, 0x21, 0, 0, 0x9E}));
  EXPECT_EQ(encoded(test_support::timing_of_vic(60)), (bytes_t{0x34, 0x17, 0x00, 0xE4, 0x57, 0xD0, 0x1E, 0x20, 0xE0,
                                                               0x28, 0x55, 0x80, 0xC4, 0x8E, 0x21, 0, 0, 0x1E}));
}

TEST(DetailedTimingEncoder, EncodesEachBitOfEachField) {
  for (const timing_bits_t &each : timing_layout) {
    for (u32 bit = 0; bit < each.bits; ++bit) {
      SCOPED_TRACE(std::string(each.field) + ": byte " + std::to_string(each.byte) + " bit " +
                   std::to_string(each.lowest_bit + bit));
      detailed_timing_t timing = smallest_timing();
      set_field(timing, each.field, each.weight << bit);
      bytes_t expected = {0x00, 0x10, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0x18};
      expected[each.byte] = byte_of(expected[each.byte] | 1u << (each.lowest_bit + bit));
      EXPECT_EQ(encoded(timing), expected);
    }
  }
}

TEST(DetailedTimingEncoder, RoundsThePixelClockToUnitsOf10Khz) {
  const struct {
    u32 pixel_clock;
    u32 units;
  } cases[] = {{25175000, 2518}, {25180000, 2518}, {25184999, 2518},
               {25185000, 2519}, {74250000, 7425}, {655350000, 65535}};
  for (const auto &each : cases) {
    SCOPED_TRACE(each.pixel_clock);
    detailed_timing_t timing = smallest_timing();
    timing.pixel_clock = each.pixel_clock;
    const bytes_t bytes = encoded(timing);
    EXPECT_EQ(bytes[0] + 256u * bytes[1], each.units);
  }
}

TEST(DetailedTimingEncoder, MarksEverythingButProgressiveAs1AsInterlaced) {
  detailed_timing_t timing = smallest_timing();
  timing.progressive = 0;
  EXPECT_EQ(encoded(timing)[17], 0x98);
  timing.progressive = 2;
  EXPECT_EQ(encoded(timing)[17], 0x98);
}

TEST(DetailedTimingEncoder, NeverWritesTheStereoBits) {
  detailed_timing_t timing = smallest_timing();
  timing.stereo = 1;
  EXPECT_EQ(encoded(timing), encoded(smallest_timing()));
}

TEST(DetailedTimingEncoder, RefusesAnInvalidTimingBeforeItsClock) {
  const exact_bytes_t block(bytes_t(18, 0));
  for (const u8 valid : {u8{0}, u8{2}, u8{255}}) {
    detailed_timing_t timing = smallest_timing();
    timing.valid = valid;
    timing.pixel_clock = 0;
    EXPECT_EQ(dtd_refusal(block.data(), &timing),
              codec_error("_encode_edid_dtd", "Called encode DTD with an invalid timing structure."));
  }
}

TEST(DetailedTimingEncoder, RefusesClocksBelowThatOfVga) {
  const exact_bytes_t block(bytes_t(18, 0));
  for (const u32 clock : {0u, 1u, 25174999u}) {
    detailed_timing_t timing = smallest_timing();
    timing.pixel_clock = clock;
    EXPECT_EQ(
        dtd_refusal(block.data(), &timing),
        codec_error("_encode_edid_dtd", "Called encode DTD with an invalid pixel clock:" + std::to_string(clock)));
  }
}

namespace {

// The 18 bytes of a text descriptor and the one after it, out of a block of 19 that was full of 0xA5.
bytes_t encoded_text(u8 tag, const std::string &text, bool result = true) {
  const exact_bytes_t block(bytes_t(19, 0xA5));
  EXPECT_EQ(
      traced_output_of([&] { EXPECT_EQ(edid_composer::_encode_string(block.data(), tag, text.c_str()), result); }), "");
  return bytes_t(block.data(), block.data() + 19);
}

bytes_t text_bytes(u8 tag, const std::string &data, u8 behind = 0xA5) {
  bytes_t bytes = {0, 0, 0, tag, 0};
  bytes = test_support::join(bytes, bytes_t(data.begin(), data.end()));
  bytes.push_back(behind);
  EXPECT_EQ(bytes.size(), 19u);
  return bytes;
}

}  // namespace

TEST(TextEncoder, EndsTheTextWithALineFeedAndPadsItWithBlanks) {
  EXPECT_EQ(encoded_text(0xFC, "AB"), text_bytes(0xFC, "AB\n          "));
  EXPECT_EQ(encoded_text(0xFF, "Serial 42"), text_bytes(0xFF, "Serial 42\n   "));
  EXPECT_EQ(encoded_text(0xFE, "ABCDEFGHIJKL"), text_bytes(0xFE, "ABCDEFGHIJKL\n"));
}

TEST(TextEncoder, PutsTheLineFeedOfAFullTextBehindTheDescriptor) {
  EXPECT_EQ(encoded_text(0xFC, "ABCDEFGHIJKLM"), text_bytes(0xFC, "ABCDEFGHIJKLM", 0x0A));
}

TEST(TextEncoder, CutsTheTextTo13Characters) {
  EXPECT_EQ(encoded_text(0xFC, "ABCDEFGHIJKLMN"), text_bytes(0xFC, "ABCDEFGHIJKLM", 0x0A));
  EXPECT_EQ(encoded_text(0xFC, std::string(100, 'z')), text_bytes(0xFC, "zzzzzzzzzzzzz", 0x0A));
}

TEST(TextEncoder, RemovesTrailingBlanksOfWhatIsLeft) {
  EXPECT_EQ(encoded_text(0xFC, "AB   "), text_bytes(0xFC, "AB\n          "));
  EXPECT_EQ(encoded_text(0xFC, "ABCDEFGHIJKL "), text_bytes(0xFC, "ABCDEFGHIJKL\n"));
  EXPECT_EQ(encoded_text(0xFC, "ABCDEFGHIJ   NOT THIS"), text_bytes(0xFC, "ABCDEFGHIJ\n  "));
  EXPECT_EQ(encoded_text(0xFC, "A B  C  "), text_bytes(0xFC, "A B  C\n      "));
}

TEST(TextEncoder, NeverRemovesTheFirstCharacter) {
  EXPECT_EQ(encoded_text(0xFC, "A "), text_bytes(0xFC, "A\n           "));
  EXPECT_EQ(encoded_text(0xFC, "A            "), text_bytes(0xFC, "A\n           "));
}

TEST(TextEncoder, WritesNothingForAShortTextOrALeadingBlank) {
  const bytes_t untouched(19, 0xA5);
  for (const char *text : {"", "A", " ", "  ", " AB", "             "}) {
    EXPECT_EQ(encoded_text(0xFC, text, false), untouched) << text;
  }
}

}  // namespace codec_test
