// Encoding of detailed timings, short audio descriptors, texts and latencies.
#include "edid_decode_encode/descriptor_encoder.h"

#include <cstdio>

#include "codec_fixture.h"
#include "timing_layout.h"

namespace codec_test {
namespace {

// The 18 bytes of a timing; the block is exactly as long, and full of something else beforehand.
bytes_t encoded(const detailed_timing_t &timing) {
  const exact_bytes_t block(bytes_t(18, 0xA5));
  EXPECT_EQ(traced_output_of([&] { EXPECT_EQ(edid_composer::_encode_edid_dtd(block.data(), &timing), 1); }), "");
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
  return output_of([&] { EXPECT_EQ(edid_composer::_encode_edid_dtd(block, timing), 0); });
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

TEST(DetailedTimingEncoder, RefusesMissingArgumentsWithTheSameWords) {
  const exact_bytes_t block(bytes_t(18, 0));
  const detailed_timing_t timing = smallest_timing();
  const std::string message = codec_error("_encode_edid_dtd", "Function called with dtd_block set to NULL.");
  EXPECT_EQ(dtd_refusal(nullptr, &timing), message);
  EXPECT_EQ(dtd_refusal(block.data(), nullptr), message);
  EXPECT_EQ(dtd_refusal(nullptr, nullptr), message);
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

bytes_t encoded_audio(short_audio_desc_t audio) {
  const exact_bytes_t block(bytes_t(3, 0xA5));
  EXPECT_EQ(traced_output_of([&] { EXPECT_EQ(edid_composer::_encode_edid_short_audio(block.data(), &audio), 1); }), "");
  return bytes_t(block.data(), block.data() + 3);
}

}  // namespace

TEST(ShortAudioEncoder, EncodesTheThirdByteByType) {
  EXPECT_EQ(encoded_audio({1, 2, 0x07, 5, 0, 0, 0}), (bytes_t{0x09, 0x07, 0x05}));
  EXPECT_EQ(encoded_audio({1, 8, 0x7F, 7, 0, 0, 0}), (bytes_t{0x0F, 0x7F, 0x07}));
  for (u32 type = 2; type <= 8; ++type) {
    EXPECT_EQ(encoded_audio({type, 6, 0x07, 7, 640, 99, 7}), (bytes_t{byte_of(type << 3 | 5), 0x07, 0x50})) << type;
  }
  for (u32 type = 9; type <= 13; ++type) {
    EXPECT_EQ(encoded_audio({type, 1, 0x04, 7, 640, 0xC3, 7}), (bytes_t{byte_of(type << 3), 0x04, 0xC3})) << type;
  }
  EXPECT_EQ(encoded_audio({14, 3, 0x06, 7, 640, 99, 5}), (bytes_t{0x72, 0x06, 0x05}));
  EXPECT_EQ(encoded_audio({16, 2, 0x06, 7, 640, 99, 5}), (bytes_t{0x79, 0x06, 0x08}));
  EXPECT_EQ(encoded_audio({17, 2, 0x06, 0, 0, 0, 0}), (bytes_t{0x79, 0x06, 0x10}));
  EXPECT_EQ(encoded_audio({18, 8, 0x06, 0, 0, 0, 0}), (bytes_t{0x7F, 0x06, 0x18}));
}

TEST(ShortAudioEncoder, CutsEachFieldToItsBits) {
  EXPECT_EQ(encoded_audio({1, 10, 0xFF, 0xFD, 0, 0, 0}), (bytes_t{0x09, 0x7F, 0x05}));
  EXPECT_EQ(encoded_audio({1, 0, 0, 0, 0, 0, 0}), (bytes_t{0x0F, 0x00, 0x00}));
  EXPECT_EQ(encoded_audio({2, 1, 0, 0, 647, 0, 0}), (bytes_t{0x10, 0x00, 0x50}));
  EXPECT_EQ(encoded_audio({2, 1, 0, 0, 2040, 0, 0}), (bytes_t{0x10, 0x00, 0xFF}));
  EXPECT_EQ(encoded_audio({9, 1, 0, 0, 0, 0x1234, 0}), (bytes_t{0x48, 0x00, 0x34}));
  EXPECT_EQ(encoded_audio({14, 1, 0, 0, 0, 0, 0x1F5}), (bytes_t{0x70, 0x00, 0xF5}));
}

TEST(ShortAudioEncoder, OverwritesTheExtendedTypesOfTheRecordWith15) {
  for (u32 type = 1; type <= 18; ++type) {
    if (type == 15) continue;
    SCOPED_TRACE(type);
    bytes_t block(3, 0);
    short_audio_desc_t audio{type, 2, 6, 1, 8, 2, 3};
    EXPECT_EQ(edid_composer::_encode_edid_short_audio(block.data(), &audio), 1);
    EXPECT_EQ(test_support::words_of(audio), (test_support::audio_words_t{type < 15 ? type : 15, 2, 6, 1, 8, 2, 3}));
  }
}

TEST(ShortAudioEncoder, RefusesMissingArgumentsInOrder) {
  bytes_t block(3, 0);
  short_audio_desc_t audio{1, 2, 7, 5, 0, 0, 0};
  const auto refusal = [](u8 *bytes, short_audio_desc_t *record) {
    return output_of([&] { EXPECT_EQ(edid_composer::_encode_edid_short_audio(bytes, record), 0); });
  };
  EXPECT_EQ(refusal(nullptr, &audio),
            codec_error("_encode_edid_short_audio", "Function called with cea_block set to NULL."));
  EXPECT_EQ(refusal(nullptr, nullptr),
            codec_error("_encode_edid_short_audio", "Function called with cea_block set to NULL."));
  EXPECT_EQ(refusal(block.data(), nullptr),
            codec_error("_encode_edid_short_audio", "Function called with audio set to NULL."));
}

TEST(ShortAudioEncoder, RefusesTypesWithoutAnEncoding) {
  const std::pair<u32, const char *> cases[] = {{0, "Audio type is not recognied. Type:0"},
                                                {15, "Audio type is not recognied. Type:15"},
                                                {19, "Invalid extended audio type:0"},
                                                {33, "Invalid extended audio type:0"},
                                                {0xFFFFFFFF, "Invalid extended audio type:0"}};
  for (const auto &[type, message] : cases) {
    SCOPED_TRACE(type);
    const exact_bytes_t block(bytes_t(3, 0));
    short_audio_desc_t audio{type, 2, 7, 5, 0, 0, 0};
    EXPECT_EQ(output_of([&] { EXPECT_EQ(edid_composer::_encode_edid_short_audio(block.data(), &audio), 0); }),
              codec_error("_encode_edid_short_audio", message));
    EXPECT_EQ(audio.type, type);
  }
}

namespace {

// The 18 bytes of a text descriptor and the one behind it, out of a block of 19 that was full of 0xA5.
bytes_t encoded_text(u8 tag, const std::string &text, u8 result = 18) {
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
    EXPECT_EQ(encoded_text(0xFC, text, 0), untouched) << text;
  }
}

TEST(LatencyEncoder, EncodesUpTo500MillisecondsInStepsOf2) {
  EXPECT_EQ(traced_output_of([] {
              for (u32 latency = 0; latency <= 500; ++latency) {
                EXPECT_EQ(encode_edid_latency_value(static_cast<u16>(latency)), latency / 2 + 1) << latency;
              }
            }),
            "");
  EXPECT_EQ(encode_edid_latency_value(0), 1);
  EXPECT_EQ(encode_edid_latency_value(20), 11);
  EXPECT_EQ(encode_edid_latency_value(21), 11);
  EXPECT_EQ(encode_edid_latency_value(500), 251);
}

TEST(LatencyEncoder, TakesLongerOnesAs500MillisecondsAndTracesThem) {
  for (const u32 latency : {501u, 600u, 65534u}) {
    EXPECT_EQ(traced_output_of([&] { EXPECT_EQ(encode_edid_latency_value(static_cast<u16>(latency)), 251); }),
              trace_line("encode_edid_latency_value", "latency = " + std::to_string(latency) + " exceed 500ms"));
    EXPECT_EQ(output_of([&] { EXPECT_EQ(encode_edid_latency_value(static_cast<u16>(latency)), 251); }), "");
  }
}

TEST(LatencyEncoder, TakesTheLargestAsNotSupported) {
  EXPECT_EQ(traced_output_of([] { EXPECT_EQ(encode_edid_latency_value(65535), 255); }), "");
}

}  // namespace codec_test
