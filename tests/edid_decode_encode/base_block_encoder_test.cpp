#include "encoder_fixture.h"

namespace codec_test {
namespace {

using change_t = std::function<void(edid_t *)>;
using byte_values_t = std::map<u32, u32>;

// The bytes of the base block that a change of a minimal record with name and range limits changes; the checksum, which
// changes with each of them, left out.
byte_values_t changes_by(const change_t &change) {
  const auto encode_with = [](const change_t &apply) {
    minimal_record_t record;
    set_text(record->monitor_name, "NAME");
    set_range_limits(record.get());
    apply(record.get());
    return encoded(record.get());
  };
  const bytes_t before = encode_with([](edid_t *) {});
  const bytes_t after = encode_with(change);
  byte_values_t changed;
  for (u32 offset = 0; offset < 255; ++offset) {
    if (offset != 127 && before[offset] != after[offset]) changed[offset] = after[offset];
  }
  return changed;
}

// As much of the base block as no test below has a say in.
bytes_t base_block_up_to_descriptors() {
  return all_of({{0x00, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 0x00, 0x52, 0x74, 0, 0, 0, 0, 0, 0, 0, 0x22, 0x01,
                  0x03, 0x80, 0xA0, 0x5A, 0,    0x08, 0,    0,    0,    0,    0, 0, 0, 0, 0, 0, 0, 0,    0},
                 bytes_t(16, 0x01),
                 vic_16_descriptor,
                 vic_4_descriptor});
}

// Completes a base block with extension count and checksum after what there is, and zeros up to byte 127.
bytes_t completed(bytes_t block) {
  block.push_back(0x01);
  u32 sum = 0;
  for (const u8 byte : block)
    sum += byte;
  block.push_back(byte_of(0 - sum));
  block.resize(128, 0);
  return block;
}

}  // namespace

TEST(BaseBlockEncoder, WritesAMinimalRecord) {
  minimal_record_t record;
  EXPECT_EQ(slice(encoded(record.get()), 0, 128), completed(base_block_up_to_descriptors()));
}

TEST(BaseBlockEncoder, PutsCountAndChecksumAtTheEndBehindNameAndRangeLimits) {
  minimal_record_t record;
  set_text(record->monitor_name, "TEST TV");
  set_range_limits(record.get());
  const bytes_t bytes = encoded(record.get());
  EXPECT_EQ(slice(bytes, 0, 128),
            completed(all_of({base_block_up_to_descriptors(),
                              {0, 0, 0, 0xFC, 0, 'T', 'E', 'S', 'T', ' ', 'T', 'V', 0x0A, 0x20, 0x20, 0x20, 0x20, 0x20},
                              range_limits})));
  EXPECT_EQ(bytes[126], 0x01);
}

TEST(BaseBlockEncoder, PutsCountAndChecksumRightBehindTheLastDescriptor) {
  minimal_record_t without_name;
  set_range_limits(without_name.get());
  const bytes_t bytes = encoded(without_name.get());
  EXPECT_EQ(slice(bytes, 0, 128), completed(all_of({base_block_up_to_descriptors(), range_limits})));
  EXPECT_EQ(bytes[108], 0x01);
  EXPECT_NE(bytes[109], 0x00);
  EXPECT_EQ(bytes[126], 0x00);
  EXPECT_EQ(bytes[127], 0x00);

  minimal_record_t without_limits;
  set_text(without_limits->monitor_name, "TV");
  EXPECT_EQ(slice(encoded(without_limits.get()), 0, 128),
            completed(all_of({base_block_up_to_descriptors(), test_support::text_descriptor(0xFC, "TV")})));
}

TEST(BaseBlockEncoder, LetsTheNextBytesOverwriteTheLineFeedBehindAFullName) {
  minimal_record_t record;
  set_text(record->monitor_name, "ABCDEFGHIJKLM");
  const bytes_t name = test_support::text_descriptor(0xFC, "ABCDEFGHIJKLM");
  EXPECT_EQ(slice(encoded(record.get()), 0, 128), completed(all_of({base_block_up_to_descriptors(), name})));
  set_range_limits(record.get());
  EXPECT_EQ(slice(encoded(record.get()), 0, 128),
            completed(all_of({base_block_up_to_descriptors(), name, range_limits})));
}

TEST(BaseBlockEncoder, CutsANameWithoutANulAtItsField) {
  minimal_record_t record;
  set_text(record->monitor_name, "ABCDEFGHIJKLMN");
  set_range_limits(record.get());
  EXPECT_EQ(slice(encoded(record.get()), 90, 18), test_support::text_descriptor(0xFC, "ABCDEFGHIJKLM"));
}

TEST(BaseBlockEncoder, LeavesOutANameThatIsTooShortOrBeginsWithABlank) {
  for (const char *name : {"", "A", " TV"}) {
    SCOPED_TRACE(name);
    minimal_record_t record;
    set_text(record->monitor_name, name);
    set_range_limits(record.get());
    EXPECT_EQ(slice(encoded(record.get()), 0, 128), completed(all_of({base_block_up_to_descriptors(), range_limits})));
  }
}

TEST(BaseBlockEncoder, LeavesOutRangeLimitsUnlessAllFiveAreGiven) {
  const change_t missing[] = {[](edid_t *edid) { edid->min_v_rate = 0; }, [](edid_t *edid) { edid->max_v_rate = 0; },
                              [](edid_t *edid) { edid->min_h_rate = 0; }, [](edid_t *edid) { edid->max_h_rate = 0; },
                              [](edid_t *edid) { edid->max_pixel_clock = 0; }};
  for (const change_t &remove : missing) {
    minimal_record_t record;
    set_range_limits(record.get());
    remove(record.get());
    EXPECT_EQ(slice(encoded(record.get()), 0, 128), completed(base_block_up_to_descriptors()));
  }
}

TEST(BaseBlockEncoder, WritesEachRangeLimit) {
  EXPECT_EQ(changes_by([](edid_t *edid) { edid->min_v_rate = 0xC1; }), (byte_values_t{{113, 0xC1}}));
  EXPECT_EQ(changes_by([](edid_t *edid) { edid->max_v_rate = 0xC2; }), (byte_values_t{{114, 0xC2}}));
  EXPECT_EQ(changes_by([](edid_t *edid) { edid->min_h_rate = 0xC3; }), (byte_values_t{{115, 0xC3}}));
  EXPECT_EQ(changes_by([](edid_t *edid) { edid->max_h_rate = 0xC4; }), (byte_values_t{{116, 0xC4}}));
  EXPECT_EQ(changes_by([](edid_t *edid) { edid->max_pixel_clock = 2559; }), (byte_values_t{{117, 0xFF}}));
  EXPECT_EQ(changes_by([](edid_t *edid) { edid->max_pixel_clock = 9; }), (byte_values_t{{117, 0x00}}));
}

TEST(BaseBlockEncoder, PacksTheManufacturersLettersInUpperCase) {
  const auto packed = [](const std::string &letters) {
    minimal_record_t record;
    set_text(record->manufacturer, letters);
    const bytes_t bytes = encoded(record.get());
    return bytes[8] * 256u + bytes[9];
  };
  EXPECT_EQ(packed("ABC"), 0x0443u);
  EXPECT_EQ(packed("abc"), 0x0443u);
  EXPECT_EQ(packed("ZzZ"), 0x6B5Au);
  EXPECT_EQ(packed("PNP"), 0x41D0u);
  // Each character is cut to 5 bits: '1' is 0x31, '_' is 0x5F, '@' is 0x40.
  EXPECT_EQ(packed("111"), 0x4631u);
  EXPECT_EQ(packed("_@_"), 0x7C1Fu);
  EXPECT_EQ(packed(""), 0x0000u);
  EXPECT_EQ(packed("ABCD"), 0x0443u);
}

TEST(BaseBlockEncoder, WritesEachBitOfTheNumbers) {
  const struct {
    const char *name;
    u32 offset;
    u32 bits;
    void (*set)(edid_t *edid, u32 value);
  } fields[] = {
      {"product_code", 10, 16, [](edid_t *edid, u32 value) { edid->product_code = value; }},
      {"serial_number", 12, 32, [](edid_t *edid, u32 value) { edid->serial_number = value; }},
      {"week", 16, 8, [](edid_t *edid, u32 value) { edid->week = byte_of(value); }},
      {"gamma", 23, 8, [](edid_t *edid, u32 value) { edid->gamma = value; }},
      {"est_timings_1", 35, 8, [](edid_t *edid, u32 value) { edid->est_timings_1 = value; }},
      {"est_timings_2", 36, 8, [](edid_t *edid, u32 value) { edid->est_timings_2 = value; }},
      {"man_timings", 37, 8, [](edid_t *edid, u32 value) { edid->man_timings = value; }},
  };
  for (const auto &field : fields) {
    for (u32 bit = 0; bit < field.bits; ++bit) {
      SCOPED_TRACE(std::string(field.name) + " bit " + std::to_string(bit));
      EXPECT_EQ(changes_by([&](edid_t *edid) { field.set(edid, 1u << bit); }),
                (byte_values_t{{field.offset + bit / 8, 1u << bit % 8}}));
    }
  }
}

TEST(BaseBlockEncoder, WritesVersionAndRevisionAsTheyAre) {
  EXPECT_EQ(changes_by([](edid_t *edid) { edid->version = 2; }), (byte_values_t{{18, 2}}));
  EXPECT_EQ(changes_by([](edid_t *edid) { edid->revision = 4; }), (byte_values_t{{19, 4}}));
}

TEST(BaseBlockEncoder, CountsTheYearFrom1990Modulo256) {
  EXPECT_EQ(changes_by([](edid_t *edid) { edid->year = 1990; }), (byte_values_t{{17, 0}}));
  EXPECT_EQ(changes_by([](edid_t *edid) { edid->year = 2245; }), (byte_values_t{{17, 255}}));
  EXPECT_EQ(changes_by([](edid_t *edid) { edid->year = 2246; }), (byte_values_t{{17, 0}}));
  EXPECT_EQ(changes_by([](edid_t *edid) { edid->year = 1989; }), (byte_values_t{{17, 255}}));
  EXPECT_EQ(changes_by([](edid_t *edid) { edid->year = 0; }), (byte_values_t{{17, 58}}));
}

TEST(BaseBlockEncoder, ReplacesBothSizesWhenOneIsMissing) {
  EXPECT_EQ(changes_by([](edid_t *edid) {
              edid->h_size_cm = 100;
              edid->v_size_cm = 56;
            }),
            (byte_values_t{{21, 100}, {22, 56}}));
  EXPECT_EQ(changes_by([](edid_t *edid) { edid->h_size_cm = 100; }), byte_values_t{});
  EXPECT_EQ(changes_by([](edid_t *edid) { edid->v_size_cm = 56; }), byte_values_t{});
  minimal_record_t record;
  record->h_size_cm = 100;
  encoded(record.get());
  EXPECT_EQ(record->h_size_cm, 100);
  EXPECT_EQ(record->v_size_cm, 0);
}

TEST(BaseBlockEncoder, WritesEachFeatureBitBesidesTheDisplayType) {
  EXPECT_EQ(changes_by([](edid_t *edid) { edid->standby = 1; }), (byte_values_t{{24, 0x88}}));
  EXPECT_EQ(changes_by([](edid_t *edid) { edid->suspend = 1; }), (byte_values_t{{24, 0x48}}));
  EXPECT_EQ(changes_by([](edid_t *edid) { edid->active_off = 1; }), (byte_values_t{{24, 0x28}}));
  EXPECT_EQ(changes_by([](edid_t *edid) { edid->standard_colorspace = 1; }), (byte_values_t{{24, 0x0C}}));
  EXPECT_EQ(changes_by([](edid_t *edid) { edid->preferred_timing = 1; }), (byte_values_t{{24, 0x0A}}));
  EXPECT_EQ(changes_by([](edid_t *edid) { edid->gtf = 1; }), (byte_values_t{{24, 0x09}}));
}

TEST(BaseBlockEncoder, SplitsTheChromaticityIntoLowAndHighBits) {
  const struct {
    u32 edid_t::*field;
    u32 low_offset;
    u32 low_shift;
    u32 high_offset;
  } fields[] = {{&edid_t::red_x, 25, 6, 27},   {&edid_t::red_y, 25, 4, 28},  {&edid_t::green_x, 25, 2, 29},
                {&edid_t::green_y, 25, 0, 30}, {&edid_t::blue_x, 26, 6, 31}, {&edid_t::blue_y, 26, 4, 32},
                {&edid_t::white_x, 26, 2, 33}, {&edid_t::white_y, 26, 0, 34}};
  for (const auto &field : fields) {
    for (u32 bit = 0; bit < 10; ++bit) {
      SCOPED_TRACE(std::to_string(field.high_offset) + " bit " + std::to_string(bit));
      const byte_values_t expected = bit < 2 ? byte_values_t{{field.low_offset, 1u << (field.low_shift + bit)}}
                                             : byte_values_t{{field.high_offset, 1u << (bit - 2)}};
      EXPECT_EQ(changes_by([&](edid_t *edid) { edid->*field.field = 1u << bit; }), expected);
    }
  }
}

TEST(BaseBlockEncoder, TakesNothingElseFromTheRecordIntoTheBaseBlock) {
  EXPECT_EQ(changes_by([](edid_t *edid) {
              edid->valid = 1;
              edid->digital = 0;
              edid->extension_count = 9;
              edid->checksum = 0x55;
              set_text(edid->data_string, "DATA");
              edid->basic_audio = 1;
              edid->ycbcr_444 = 1;
              edid->ycbcr_422 = 1;
              edid->hdmi_present = 1;
            }),
            byte_values_t{});
}

TEST(BaseBlockEncoder, WritesStandardTimingsInOrderAndFillsTheOtherSlots) {
  EXPECT_EQ(
      changes_by([](edid_t *edid) {
        append(edid->std_timings, std_timing_t{1280, 2, 60});
        append(edid->std_timings, std_timing_t{1920, 3, 61});
        append(edid->std_timings, std_timing_t{2288, 1, 123});
        append(edid->std_timings, std_timing_t{248, 0, 60});
      }),
      (byte_values_t{{38, 0x81}, {39, 0x80}, {40, 0xD1}, {41, 0xC1}, {42, 0xFF}, {43, 0x7F}, {44, 0x00}, {45, 0x00}}));
}

TEST(BaseBlockEncoder, WrapsStandardTimingsThatTheirBitsDoNotHold) {
  EXPECT_EQ(changes_by([](edid_t *edid) {
              append(edid->std_timings, std_timing_t{240, 1, 60});
              append(edid->std_timings, std_timing_t{2296, 1, 60});
              append(edid->std_timings, std_timing_t{1287, 2, 60});
              append(edid->std_timings, std_timing_t{1280, 0, 124});
              append(edid->std_timings, std_timing_t{1280, 3, 124});
              append(edid->std_timings, std_timing_t{1280, 0, 59});
            }),
            (byte_values_t{{38, 0xFF},
                           {39, 0x40},
                           {40, 0x00},
                           {41, 0x40},
                           {42, 0x81},
                           {43, 0x80},
                           {44, 0x81},
                           {45, 0x40},
                           {46, 0x81},
                           {47, 0xC0},
                           {48, 0x81},
                           {49, 0xFF}}));
}

TEST(BaseBlockEncoder, WritesAtMost8StandardTimings) {
  minimal_record_t record;
  bytes_t expected;
  for (u32 i = 0; i < 10; ++i) {
    append(record->std_timings, std_timing_t{640 + 8 * i, 1, 60 + i});
    if (i < 8) expected.insert(expected.end(), {byte_of(0x31 + i), byte_of(0x40 + i)});
  }
  const bytes_t bytes = encoded(record.get());
  EXPECT_EQ(slice(bytes, 38, 16), expected);
  EXPECT_EQ(slice(bytes, 54, 18), vic_16_descriptor);
}

}  // namespace codec_test
