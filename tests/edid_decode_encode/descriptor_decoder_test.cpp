// Decoding of the 18-byte descriptors.
#include "edid_decode_encode/descriptor.h"

#include <cstdio>

#include "codec_fixture.h"
#include "timing_layout.h"

namespace codec_test {
namespace {

constexpr const char *function = "_decode_edid_dtd";

bool decode(const bytes_t &descriptor, edid_t *edid) {
  const exact_bytes_t bytes(descriptor);
  auto timings = edid_composer::detailed_timing_appender(edid, nullptr);
  return edid_composer::_decode_edid_dtd(edid_composer::byte_view_t(bytes.data(), bytes.size()), &timings, edid);
}

// A timing with digital separate sync and a pixel clock of 10 kHz, all else 0.
bytes_t smallest_timing() {
  bytes_t descriptor(18, 0);
  descriptor[0] = 0x01;
  descriptor[17] = 0x18;
  return descriptor;
}

fields_t decoded(const bytes_t &descriptor) {
  scoped_edid_t edid;
  EXPECT_EQ(output_of([&] { EXPECT_TRUE(decode(descriptor, edid.get())); }), "");
  const auto timings = elements_of<detailed_timing_t>(edid->dtd_list);
  EXPECT_EQ(timings.size(), 1u);
  return timings.empty() ? fields_t{} : fields_of(timings[0]);
}

// The fields of the timing that setting bits of one byte changes.
fields_t timing_changes(u32 byte, u8 value) {
  bytes_t descriptor = smallest_timing();
  descriptor[byte] = value;
  return difference(decoded(smallest_timing()), decoded(descriptor));
}

// 1920x1080 interlaced at 60 Hz with every byte in use, by hand.
const bytes_t interlaced_timing = {0x01, 0x1D, 0x80, 0x18, 0x71, 0x1C, 0x16, 0x20, 0x58,
                                   0x2C, 0x25, 0x00, 0xC4, 0x8E, 0x21, 0x05, 0x07, 0x9E};

}  // namespace

TEST(DetailedTimingDecoder, DecodesATimingWithNothingButAClock) {
  detailed_timing_t expected{};
  expected.valid = 1;
  expected.pixel_clock = 10000;
  expected.progressive = 1;
  EXPECT_EQ(decoded(smallest_timing()), fields_of(expected));
}

TEST(DetailedTimingDecoder, DecodesARealTiming) {
  detailed_timing_t expected{};
  expected.valid = 1;
  expected.pixel_clock = 74250000;
  expected.h_active = 1920;
  expected.h_blanking = 280;
  expected.h_sync_offset = 88;
  expected.h_sync_width = 44;
  expected.h_border = 5;
  expected.v_active = 540;
  expected.v_blanking = 22;
  expected.v_sync_offset = 2;
  expected.v_sync_width = 5;
  expected.v_border = 7;
  expected.h_image_size = 708;
  expected.v_image_size = 398;
  expected.progressive = 0;
  expected.stereo = 0;
  expected.h_sync_positive = 1;
  expected.v_sync_positive = 1;
  EXPECT_EQ(decoded(interlaced_timing), fields_of(expected));
}

TEST(DetailedTimingDecoder, DecodesEachBitOfEachField) {
  for (const timing_bits_t &each : timing_layout) {
    for (u32 bit = 0; bit < each.bits; ++bit) {
      SCOPED_TRACE(std::string(each.field) + ": byte " + std::to_string(each.byte) + " bit " +
                   std::to_string(each.lowest_bit + bit));
      const u32 value = smallest_timing()[each.byte] | 1u << (each.lowest_bit + bit);
      EXPECT_EQ(timing_changes(each.byte, byte_of(value)),
                (fields_t{{each.field, std::to_string(each.weight << bit)}}));
    }
  }
}

TEST(DetailedTimingDecoder, DecodesEachBitOfThePixelClock) {
  for (u32 bit = 0; bit < 16; ++bit) {
    SCOPED_TRACE(bit);
    bytes_t descriptor = smallest_timing();
    descriptor[0] = byte_of(1u << bit);
    descriptor[1] = byte_of(1u << bit >> 8);
    EXPECT_EQ(decoded(descriptor)["pixel_clock"], std::to_string(10000u << bit));
  }
  bytes_t descriptor = smallest_timing();
  descriptor[0] = 0xFF;
  descriptor[1] = 0xFF;
  EXPECT_EQ(decoded(descriptor)["pixel_clock"], "655350000");
}

TEST(DetailedTimingDecoder, DecodesTheScanAndStereoFlags) {
  EXPECT_EQ(timing_changes(17, 0x98), (fields_t{{"progressive", "0"}}));
  EXPECT_EQ(timing_changes(17, 0x38), (fields_t{{"stereo", "1"}}));
  EXPECT_EQ(timing_changes(17, 0x58), (fields_t{{"stereo", "1"}}));
  EXPECT_EQ(timing_changes(17, 0x78), (fields_t{{"stereo", "1"}}));
  EXPECT_EQ(timing_changes(17, 0x19), fields_t{});
}

TEST(DetailedTimingDecoder, KeepsTimingsWithoutDigitalSeparateSyncAndTracesThem) {
  const struct {
    u8 flags;
    const char *type;
  } cases[] = {{0x00, "0x0"}, {0x08, "0x1"}, {0x10, "0x2"}};
  for (const auto &each : cases) {
    SCOPED_TRACE(each.type);
    EXPECT_EQ(timing_changes(17, each.flags), fields_t{});
    bytes_t descriptor = interlaced_timing;
    descriptor[17] = each.flags;
    scoped_edid_t edid;
    EXPECT_EQ(
        traced_output_of([&] { EXPECT_TRUE(decode(descriptor, edid.get())); }),
        trace_line(function, std::string("Detailed timing is not set to digital. Val:") + each.type + " Continuing.") +
            trace_line(function, "Added DTD: WxH=1920x540p pixel:74250000"));
  }
}

TEST(DetailedTimingDecoder, TracesWhatItAdds) {
  scoped_edid_t edid;
  EXPECT_EQ(traced_output_of([&] { EXPECT_TRUE(decode(interlaced_timing, edid.get())); }),
            trace_line(function, "Added DTD: WxH=1920x540i pixel:74250000"));
}

TEST(DetailedTimingDecoder, AppendsInOrder) {
  scoped_edid_t edid;
  bytes_t second = smallest_timing();
  second[0] = 2;
  ASSERT_EQ(decode(smallest_timing(), edid.get()), 1);
  ASSERT_EQ(decode(second, edid.get()), 1);
  const auto timings = elements_of<detailed_timing_t>(edid->dtd_list);
  ASSERT_EQ(timings.size(), 2u);
  EXPECT_EQ(timings[0].pixel_clock, 10000u);
  EXPECT_EQ(timings[1].pixel_clock, 20000u);
}

TEST(DetailedTimingDecoder, RecoversTheTimingOfEachVic) {
  for (u32 vic = 1; vic <= 64; ++vic) {
    SCOPED_TRACE(vic);
    const detailed_timing_t timing = test_support::timing_of_vic(vic);
    detailed_timing_t expected = timing;
    // The front porches of VICs 60 to 62 have more than the 10 bits of a descriptor.
    expected.h_sync_offset %= 1024;
    EXPECT_EQ(decoded(test_support::timing_descriptor(timing)), fields_of(expected));
  }
}

TEST(DetailedTimingDecoder, TakesMissingBytesAs0) {
  for (u32 size = 0; size < 18; ++size) {
    SCOPED_TRACE(size);
    bytes_t padded(interlaced_timing.begin(), interlaced_timing.begin() + size);
    const bytes_t cut = padded;
    padded.resize(18, 0);
    scoped_edid_t of_cut;
    scoped_edid_t of_padded;
    EXPECT_TRUE(decode(cut, of_cut.get()));
    EXPECT_TRUE(decode(padded, of_padded.get()));
    EXPECT_EQ(fields_of(*of_cut.get()), fields_of(*of_padded.get()));
    EXPECT_EQ(of_cut->dtd_list.size, size == 0 ? 0u : 1u);
  }
}

namespace {

bytes_t display_descriptor(u8 tag, const bytes_t &data) {
  bytes_t descriptor = {0, 0, 0, tag, 0};
  descriptor = test_support::join(descriptor, data);
  descriptor.resize(18, 0);
  return descriptor;
}

// What one display descriptor changes in a prepared record, and what it prints.
struct outcome_t {
  fields_t changed;
  std::string output;
};

outcome_t outcome_of(const bytes_t &descriptor, u8 result = 1) {
  scoped_edid_t edid;
  const fields_t before = fields_of(*edid.get());
  const std::string output = traced_output_of([&] { EXPECT_EQ(decode(descriptor, edid.get()), result); });
  return {difference(before, fields_of(*edid.get())), output};
}

}  // namespace

TEST(DisplayDescriptorDecoder, StoresTheTextsByTag) {
  const bytes_t text = {'A', ' ', 'b', '!', '\n', ' ', ' ', ' ', ' ', ' ', ' ', ' ', ' '};
  const std::pair<u8, const char *> tags[] = {{0xFF, "serial_string"}, {0xFE, "data_string"}, {0xFC, "monitor_name"}};
  for (const auto &[tag, field] : tags) {
    SCOPED_TRACE(field);
    const outcome_t outcome = outcome_of(display_descriptor(tag, text));
    EXPECT_EQ(outcome.changed, (fields_t{{field, "A b!"}}));
    EXPECT_EQ(outcome.output, "");
  }
}

TEST(DisplayDescriptorDecoder, EndsTextsAtTheFirstLineFeed) {
  const std::pair<const char *, const char *> cases[] = {
      {"ABC\n         ", "ABC"},  {"ABCDEFGHIJKLM", "ABCDEFGHIJKLM"}, {"ABCDEFGHIJKL\n", "ABCDEFGHIJKL"},
      {"AB  \n        ", "AB  "}, {"AB           ", "AB           "}, {"\nABC         ", ""},
      {"A\nB\nC        ", "A"},   {"             ", "             "}, {"AB\rC         ", "AB\rC         "},
  };
  for (const auto &[data, text] : cases) {
    const std::string stored = data;
    ASSERT_EQ(stored.size(), 13u);
    EXPECT_EQ(outcome_of(display_descriptor(0xFC, bytes_t(stored.begin(), stored.end()))).changed,
              text[0] == '\0' ? fields_t{} : (fields_t{{"monitor_name", text}}));
  }
}

TEST(DisplayDescriptorDecoder, ReplacesEveryLineFeedAndKeepsThePaddingBehindTheText) {
  const std::string stored = "AB\nCD\n EF\n   ";
  scoped_edid_t edid;
  std::fill_n(edid->monitor_name, 14, 'x');
  ASSERT_EQ(decode(display_descriptor(0xFC, bytes_t(stored.begin(), stored.begin() + 13)), edid.get()), 1);
  EXPECT_EQ(std::string(edid->monitor_name, 14), std::string("AB\0CD\0 EF\0   ", 13) + '\0');
}

TEST(DisplayDescriptorDecoder, ALaterTextOverwritesAnEarlierOne) {
  scoped_edid_t edid;
  ASSERT_EQ(decode(test_support::text_descriptor(0xFC, "LONGER TEXT"), edid.get()), 1);
  ASSERT_EQ(decode(test_support::text_descriptor(0xFC, "NEW"), edid.get()), 1);
  EXPECT_EQ(std::string(edid->monitor_name, 14), std::string("NEW\0         \0", 14));
}

TEST(DisplayDescriptorDecoder, DecodesTheRangeLimits) {
  const outcome_t outcome =
      outcome_of(display_descriptor(0xFD, {24, 75, 15, 135, 30, 0xAA, 0xBB, 0xCC, 0xDD, 0xEE, 0xFF, 0x11, 0x22}));
  EXPECT_EQ(outcome.changed, (fields_t{{"min_v_rate", "24"},
                                       {"max_v_rate", "75"},
                                       {"min_h_rate", "15"},
                                       {"max_h_rate", "135"},
                                       {"max_pixel_clock", "300"}}));
  EXPECT_EQ(outcome.output, "");
}

TEST(DisplayDescriptorDecoder, DecodesEachBitOfTheRangeLimits) {
  const std::pair<const char *, u32> fields[5] = {
      {"min_v_rate", 1}, {"max_v_rate", 1}, {"min_h_rate", 1}, {"max_h_rate", 1}, {"max_pixel_clock", 10}};
  for (u32 byte = 0; byte < 5; ++byte) {
    for (u32 bit = 0; bit < 8; ++bit) {
      SCOPED_TRACE(std::string(fields[byte].first) + " bit " + std::to_string(bit));
      bytes_t data(13, 0);
      data[byte] = byte_of(1u << bit);
      EXPECT_EQ(outcome_of(display_descriptor(0xFD, data)).changed,
                (fields_t{{fields[byte].first, std::to_string(fields[byte].second << bit)}}));
    }
  }
}

TEST(DisplayDescriptorDecoder, IgnoresDummyAndManufacturerDescriptorsSilently) {
  for (const u8 tag : {u8{0x10}, u8{0x00}}) {
    SCOPED_TRACE(u32{tag});
    const outcome_t outcome = outcome_of(display_descriptor(tag, bytes_t(13, 0xAB)));
    EXPECT_EQ(outcome.changed, fields_t{});
    EXPECT_EQ(outcome.output, "");
  }
}

TEST(DisplayDescriptorDecoder, IgnoresColourPointsAndStandardTimingsWithAWarning) {
  const outcome_t colour_point = outcome_of(display_descriptor(0xFB, bytes_t(13, 0x55)));
  EXPECT_EQ(colour_point.changed, fields_t{});
  EXPECT_EQ(colour_point.output, codec_warning(function, "Additional monitor color point specified. Ignoring."));
  const outcome_t timings = outcome_of(display_descriptor(0xFA, bytes_t(13, 0x55)));
  EXPECT_EQ(timings.changed, fields_t{});
  EXPECT_EQ(timings.output, codec_warning(function, "Additional standard timings specified. Ignoring."));
}

TEST(DisplayDescriptorDecoder, IgnoresEveryOtherTagWithAWarning) {
  for (u32 tag = 0; tag < 256; ++tag) {
    if (tag == 0x00 || tag == 0x10 || tag >= 0xFA) continue;
    SCOPED_TRACE(tag);
    char digits[8];
    std::snprintf(digits, sizeof(digits), "%x", tag);
    const outcome_t outcome = outcome_of(display_descriptor(byte_of(tag), bytes_t(13, 0x55)));
    EXPECT_EQ(outcome.changed, fields_t{});
    EXPECT_EQ(outcome.output,
              codec_warning(function, std::string("Unknown data tag within DTD timing. Ignoring. tag=0x") + digits));
  }
}

TEST(DisplayDescriptorDecoder, RefusesNonzeroReservedBytes) {
  const std::string message =
      "Malformed DTD: The DTD's pixel clock is 0 indicating that the byte 0x2 and byte 0x4 should be zero, but they "
      "are "
      "not. ";
  const struct {
    u8 byte_2;
    u8 byte_4;
    const char *text;
  } cases[] = {{0x0A, 0x00, "Byte2:0x0A Byte4:0x00"},
               {0x00, 0xB0, "Byte2:0x00 Byte4:0xB0"},
               {0xFF, 0x01, "Byte2:0xFF Byte4:0x01"}};
  for (const auto &each : cases) {
    SCOPED_TRACE(each.text);
    bytes_t descriptor = test_support::text_descriptor(0xFC, "NAME");
    descriptor[2] = each.byte_2;
    descriptor[4] = each.byte_4;
    const outcome_t outcome = outcome_of(descriptor, 0);
    EXPECT_EQ(outcome.changed, fields_t{});
    EXPECT_EQ(outcome.output, codec_error(function, message + each.text));
  }
}

TEST(CharacterReplacement, ReplacesEveryMatchWithinTheLengthOnly) {
  bytes_t text = {'a', 'b', 'a', 0, 'a', 'a'};
  edid_composer::_replace_all_chars(text.data(), 5, 'a', 'z');
  EXPECT_EQ(text, (bytes_t{'z', 'b', 'z', 0, 'z', 'a'}));
  edid_composer::_replace_all_chars(text.data(), 6, 0, 0x0A);
  EXPECT_EQ(text, (bytes_t{'z', 'b', 'z', 0x0A, 'z', 'a'}));
  edid_composer::_replace_all_chars(text.data(), 0, 'z', 'x');
  EXPECT_EQ(text, (bytes_t{'z', 'b', 'z', 0x0A, 'z', 'a'}));
  bytes_t high = {0xFF, 0x7F};
  edid_composer::_replace_all_chars(high.data(), 2, 0xFF, 0x80);
  EXPECT_EQ(high, (bytes_t{0x80, 0x7F}));
}

}  // namespace codec_test
