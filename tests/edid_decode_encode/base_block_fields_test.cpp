// Each field of the base block, bit by bit.
#include "codec_fixture.h"

namespace codec_test {
namespace {

using byte_values_t = std::vector<std::pair<u32, u8>>;

// What the given bytes change in the record, against a block without them.
fields_t changes_by(const byte_values_t &values) {
  scoped_edid_t before;
  EXPECT_EQ(decode_base_block(blank_base_block().build(), before.get()), 1);
  test_support::base_block_builder_t builder = blank_base_block();
  for (const auto &[offset, value] : values)
    builder.byte(offset, value);
  scoped_edid_t after;
  EXPECT_EQ(decode_base_block(builder.build(), after.get()), 1);
  return changes(fields_of(*before.get()), fields_of(*after.get()));
}

fields_t one_field(const std::string &name, u32 value) {
  return {{name, std::to_string(value)}};
}

struct number_byte_t {
  const char *field;
  u32 offset;
  u32 weight;  // of the byte's lowest bit
  u32 base;    // the field's value when the byte is 0
};

constexpr number_byte_t number_bytes[] = {
    {"product_code", 10, 1, 0},
    {"product_code", 11, 0x100, 0},
    {"serial_number", 12, 1, 0},
    {"serial_number", 13, 0x100, 0},
    {"serial_number", 14, 0x10000, 0},
    {"serial_number", 15, 0x1000000, 0},
    {"week", 16, 1, 0},
    {"year", 17, 1, 1990},
    {"h_size_cm", 21, 1, 0},
    {"v_size_cm", 22, 1, 0},
    {"gamma", 23, 1, 0},
    {"red_x", 27, 4, 0},
    {"red_y", 28, 4, 0},
    {"green_x", 29, 4, 0},
    {"green_y", 30, 4, 0},
    {"blue_x", 31, 4, 0},
    {"blue_y", 32, 4, 0},
    {"white_x", 33, 4, 0},
    {"white_y", 34, 4, 0},
    {"est_timings_1", 35, 1, 0},
    {"est_timings_2", 36, 1, 0},
    {"man_timings", 37, 1, 0},
    {"extension_count", 126, 1, 0},
};

}  // namespace

TEST(BaseBlockFields, DecodesEachBitOfTheNumbers) {
  for (const number_byte_t &each : number_bytes) {
    for (u32 bit = 0; bit < 8; ++bit) {
      SCOPED_TRACE(std::string(each.field) + " bit " + std::to_string(bit));
      EXPECT_EQ(changes_by({{each.offset, byte_of(1u << bit)}}),
                one_field(each.field, each.base + (each.weight << bit)));
    }
    EXPECT_EQ(changes_by({{each.offset, 0xFF}}), one_field(each.field, each.base + each.weight * 0xFF));
  }
}

TEST(BaseBlockFields, PutsTheBytesOfNumbersInLittleEndianOrder) {
  EXPECT_EQ(changes_by({{10, 0x12}, {11, 0x34}}), one_field("product_code", 0x3412));
  EXPECT_EQ(changes_by({{12, 0x12}, {13, 0x34}, {14, 0x56}, {15, 0x98}}), one_field("serial_number", 0x98563412));
}

TEST(BaseBlockFields, DecodesTheLowBitsOfTheChromaticity) {
  const char *const fields[2][4] = {{"red_x", "red_y", "green_x", "green_y"},
                                    {"blue_x", "blue_y", "white_x", "white_y"}};
  for (u32 byte = 0; byte < 2; ++byte) {
    for (u32 field = 0; field < 4; ++field) {
      SCOPED_TRACE(fields[byte][field]);
      const u32 shift = 6 - 2 * field;
      for (u32 value = 1; value < 4; ++value) {
        EXPECT_EQ(changes_by({{25 + byte, byte_of(value << shift)}}), one_field(fields[byte][field], value));
      }
    }
  }
}

TEST(BaseBlockFields, JoinsHighAndLowBitsOfTheChromaticity) {
  // 0x28F = 0.640 and 0x152 = 0.330, the red of sRGB.
  EXPECT_EQ(changes_by({{27, 0xA3}, {28, 0x54}, {25, 0xE0}}), (fields_t{{"red_x", "655"}, {"red_y", "338"}}));
  EXPECT_EQ(changes_by({{34, 0xFF}, {26, 0x03}}), one_field("white_y", 1023));
}

TEST(BaseBlockFields, DecodesEachFeatureBit) {
  const char *const fields[8] = {"gtf",     "preferred_timing", "standard_colorspace", nullptr, nullptr, "active_off",
                                 "suspend", "standby"};
  for (u32 bit = 0; bit < 8; ++bit) {
    SCOPED_TRACE(bit);
    const fields_t expected = fields[bit] == nullptr ? fields_t{} : one_field(fields[bit], 1);
    EXPECT_EQ(changes_by({{24, byte_of(1u << bit)}}), expected);
  }
}

TEST(BaseBlockFields, IgnoresTheVideoInputBitsBelowTheDigitalOne) {
  for (u32 bit = 0; bit < 7; ++bit) {
    SCOPED_TRACE(bit);
    EXPECT_EQ(changes_by({{20, byte_of(0x80u | 1u << bit)}}), fields_t{});
  }
}

TEST(BaseBlockFields, UnpacksTheManufacturersLettersWithoutARangeTest) {
  const struct {
    u8 high;
    u8 low;
    const char *letters;
  } cases[] = {{0x04, 0x43, "ABC"},   // 1, 2, 3
               {0x69, 0xFA, "ZOZ"},   // 26, 15, 26
               {0x10, 0xAC, "DEL"},   // 4, 5, 12
               {0x7F, 0xFF, "___"},   // 31, 31, 31
               {0x6F, 0x7C, "[[\\"},  // 27, 27, 28
               {0x77, 0xC0, "]^@"}};  // 29, 30, 0
  for (const auto &each : cases) {
    EXPECT_EQ(changes_by({{8, each.high}, {9, each.low}}), (fields_t{{"manufacturer", each.letters}}));
  }
  scoped_edid_t edid;
  ASSERT_EQ(decode_base_block(blank_base_block().build(), edid.get()), 1);
  EXPECT_EQ(std::string(edid->manufacturer, 4), std::string("@@@\0", 4));
}

TEST(BaseBlockFields, EndsTheManufacturersLettersWithANul) {
  scoped_edid_t edid;
  std::fill_n(edid->manufacturer, 4, 'x');
  ASSERT_EQ(decode_base_block(blank_base_block().byte(8, 0x04).byte(9, 0x43).build(), edid.get()), 1);
  EXPECT_EQ(std::string(edid->manufacturer, 4), std::string("ABC\0", 4));
}

TEST(BaseBlockFields, TakesEachBitOfTheManufacturersWord) {
  for (u32 bit = 0; bit < 15; ++bit) {
    SCOPED_TRACE(bit);
    std::string letters = "@@@";
    letters[2 - bit / 5] = static_cast<char>('@' + (1 << bit % 5));
    const u32 word = 1u << bit;
    EXPECT_EQ(changes_by({{8, byte_of(word >> 8)}, {9, byte_of(word)}}), (fields_t{{"manufacturer", letters}}));
  }
}

TEST(BaseBlockFields, IgnoresTheTopBitOfTheManufacturersWord) {
  EXPECT_EQ(changes_by({{8, 0x80}}), fields_t{});
  EXPECT_EQ(changes_by({{8, 0x84}, {9, 0x43}}), (fields_t{{"manufacturer", "ABC"}}));
}

namespace {

using std_timings_t = std::vector<test_support::std_timing_words_t>;

std_timings_t standard_timings_of(const test_support::base_block_builder_t &builder) {
  scoped_edid_t edid;
  EXPECT_EQ(decode_base_block(builder.build(), edid.get()), 1);
  return test_support::std_timings_of(edid->std_timings);
}

}  // namespace

TEST(BaseBlockStandardTimings, DecodesTheSlotsInOrderAndSkipsTheFiller) {
  EXPECT_EQ(standard_timings_of(blank_base_block()), std_timings_t{});
  EXPECT_EQ(standard_timings_of(blank_base_block()
                                    .standard_timing(0, 0x31, 0x59)
                                    .standard_timing(1, 0x45, 0x59)
                                    .standard_timing(2, 0x61, 0x59)
                                    .standard_timing(3, 0x71, 0x4F)
                                    .standard_timing(4, 0x81, 0x8F)
                                    .standard_timing(5, 0x95, 0x00)
                                    .standard_timing(6, 0xA9, 0x40)
                                    .standard_timing(7, 0xD1, 0xC0)),
            (std_timings_t{{640, 1, 85},
                           {800, 1, 85},
                           {1024, 1, 85},
                           {1152, 1, 75},
                           {1280, 2, 75},
                           {1440, 0, 60},
                           {1600, 1, 60},
                           {1920, 3, 60}}));
  EXPECT_EQ(standard_timings_of(blank_base_block().standard_timing(1, 0x81, 0x80).standard_timing(6, 0xD1, 0xC0)),
            (std_timings_t{{1280, 2, 60}, {1920, 3, 60}}));
}

TEST(BaseBlockStandardTimings, DecodesEachBitInEachSlot) {
  for (u32 slot = 0; slot < 8; ++slot) {
    SCOPED_TRACE(slot);
    for (u32 bit = 0; bit < 8; ++bit) {
      EXPECT_EQ(standard_timings_of(blank_base_block().standard_timing(slot, byte_of(1u << bit), 0)),
                (std_timings_t{{248 + (8u << bit), 0, 60}}));
    }
    for (u32 bit = 0; bit < 6; ++bit) {
      EXPECT_EQ(standard_timings_of(blank_base_block().standard_timing(slot, 0, byte_of(1u << bit))),
                (std_timings_t{{248, 0, 60 + (1u << bit)}}));
    }
    for (u32 code = 1; code < 4; ++code) {
      EXPECT_EQ(standard_timings_of(blank_base_block().standard_timing(slot, 0, byte_of(code << 6))),
                (std_timings_t{{248, code, 60}}));
    }
  }
}

TEST(BaseBlockStandardTimings, RejectsNothingButTheFiller) {
  EXPECT_EQ(standard_timings_of(blank_base_block().standard_timing(0, 0x00, 0x00)), (std_timings_t{{248, 0, 60}}));
  EXPECT_EQ(standard_timings_of(blank_base_block().standard_timing(0, 0x01, 0x00)), (std_timings_t{{256, 0, 60}}));
  EXPECT_EQ(standard_timings_of(blank_base_block().standard_timing(0, 0x00, 0x01)), (std_timings_t{{248, 0, 61}}));
  EXPECT_EQ(standard_timings_of(blank_base_block().standard_timing(0, 0xFF, 0xFF)), (std_timings_t{{2288, 3, 123}}));
}

}  // namespace codec_test
