// The HDMI vendor-specific data block as the encoder writes it.
#include "encoder_fixture.h"

namespace codec_test {
namespace {

using change_t = std::function<void(edid_t *)>;
using masks_t = std::vector<u32>;

// The HDMI block of a record without video and audio entries: it lies at byte 142.
bytes_t hdmi_block_of(edid_t *edid) {
  const bytes_t bytes = encoded(edid);
  return slice(bytes, 142, 1u + (bytes[142] & 0x1Fu));
}

bytes_t hdmi_block_with(const change_t &change) {
  minimal_record_t record;
  change(record.get());
  return hdmi_block_of(record.get());
}

// Header, OUI, and what follows.
bytes_t block_of(const bytes_t &behind_oui) {
  return test_support::hdmi_block(behind_oui);
}

std::string traced(const std::string &message) {
  return trace_line("encode_edid", message);
}

}  // namespace

TEST(HdmiBlockEncoder, WritesThePhysicalAddressInNibbles) {
  EXPECT_EQ(hdmi_block_with([](edid_t *edid) {
              const u8 address[] = {1, 2, 3, 15};
              std::memcpy(edid->physical_address, address, 4);
            }),
            block_of({0x12, 0x3F, 0, 0, 0}));
  EXPECT_EQ(hdmi_block_with([](edid_t *edid) {
              const u8 address[] = {0xF1, 0xE2, 0xD3, 0xC4};
              std::memcpy(edid->physical_address, address, 4);
            }),
            block_of({0x12, 0x34, 0, 0, 0}));
}

TEST(HdmiBlockEncoder, KeepsThePhysicalAddressOfTheRecord) {
  minimal_record_t record;
  record->physical_address[1] = 0x1F;
  encoded(record.get());
  EXPECT_EQ(record->physical_address[1], 0x1F);
}

TEST(HdmiBlockEncoder, TellsWhereThePhysicalAddressIs) {
  for (const u32 videos : {0u, 1u, 5u, 31u}) {
    for (const u32 audios : {0u, 1u, 4u}) {
      SCOPED_TRACE(std::to_string(videos) + " and " + std::to_string(audios));
      minimal_record_t record;
      for (u32 i = 0; i < videos; ++i)
        append_video(record.get(), i + 1);
      for (u32 i = 0; i < audios; ++i)
        append(record->audio_list, short_audio_desc_t{1, 2, 7, 5, 0, 0, 0});
      record->physical_address[0] = 0xA;
      record->physical_address[3] = 0x7;
      const encoding_t encoding = encode(record.get());
      EXPECT_EQ(encoding.spa_offset, 142 + std::max(videos, 1u) + 3 * std::max(audios, 1u));
      EXPECT_EQ(encoding.bytes[encoding.spa_offset], 0xA0);
      EXPECT_EQ(encoding.bytes[encoding.spa_offset + 1u], 0x07);
    }
  }
}

TEST(HdmiBlockEncoder, NeedsNobodyToAskWhereThePhysicalAddressIs) {
  minimal_record_t record;
  const bytes_t expected = encoded(record.get());
  platform_values_t values{};
  const exact_bytes_t block(bytes_t(256, 0));
  EXPECT_EQ(encode_edid(block.data(), 256, record.get(), nullptr, &values), 1);
  EXPECT_EQ(bytes_t(block.data(), block.data() + 256), expected);
}

TEST(HdmiBlockEncoder, WritesEachCapabilityBit) {
  const std::pair<u8 edid_t::*, u8> flags[] = {{&edid_t::supports_ai, 0x80}, {&edid_t::dc_48bit, 0x40},
                                               {&edid_t::dc_36bit, 0x20},    {&edid_t::dc_30bit, 0x10},
                                               {&edid_t::dc_y444, 0x08},     {&edid_t::dvi_dual, 0x01}};
  for (const auto &[field, bit] : flags) {
    EXPECT_EQ(hdmi_block_with([&, &member = field](edid_t *edid) { edid->*member = 1; }), block_of({0, 0, bit, 0, 0}));
  }
}

TEST(HdmiBlockEncoder, WritesTheTmdsClockInUnitsOf5Mhz) {
  const std::pair<u32, u8> clocks[] = {{0, 0}, {5, 1}, {9, 1}, {225, 45}, {300, 60}, {1275, 255}};
  for (const auto &[clock, byte] : clocks) {
    EXPECT_EQ(hdmi_block_with([&, mhz = clock](edid_t *edid) { edid->max_tmds_clock = mhz; }),
              block_of({0, 0, 0, byte, 0}));
  }
}

TEST(HdmiBlockEncoder, WritesEachContentTypeBit) {
  const std::pair<u8 edid_t::*, u8> flags[] = {
      {&edid_t::cnc0, 0x01}, {&edid_t::cnc1, 0x02}, {&edid_t::cnc2, 0x04}, {&edid_t::cnc3, 0x08}};
  for (const auto &[field, bit] : flags) {
    EXPECT_EQ(hdmi_block_with([&, &member = field](edid_t *edid) { edid->*member = 1; }), block_of({0, 0, 0, 0, bit}));
  }
}

TEST(HdmiBlockEncoder, WritesLatenciesThatAreGiven) {
  EXPECT_EQ(hdmi_block_with([](edid_t *edid) { edid->video_latency = 20; }), block_of({0, 0, 0, 0, 0x80, 11, 1}));
  EXPECT_EQ(hdmi_block_with([](edid_t *edid) { edid->audio_latency = 20; }), block_of({0, 0, 0, 0, 0x80, 1, 11}));
  EXPECT_EQ(hdmi_block_with([](edid_t *edid) { edid->i_video_latency = 20; }),
            block_of({0, 0, 0, 0, 0xC0, 1, 1, 11, 1}));
  EXPECT_EQ(hdmi_block_with([](edid_t *edid) { edid->i_audio_latency = 20; }),
            block_of({0, 0, 0, 0, 0xC0, 1, 1, 1, 11}));
  EXPECT_EQ(hdmi_block_with([](edid_t *edid) {
              edid->video_latency = 20;
              edid->audio_latency = 40;
              edid->i_video_latency = 65535;
              edid->i_audio_latency = 600;
            }),
            block_of({0, 0, 0, 0, 0xC0, 11, 21, 255, 251}));
}

TEST(HdmiBlockEncoder, TracesLatenciesThatAreTooLong) {
  minimal_record_t record;
  record->video_latency = 502;
  record->i_audio_latency = 700;
  EXPECT_EQ(encode(record.get(), 0, true).output,
            trace_line("encode_edid_latency_value", "latency = 502 exceed 500ms") +
                trace_line("encode_edid_latency_value", "latency = 700 exceed 500ms"));
}

TEST(HdmiBlockEncoder, WritesTheVideoPartOnlyWhenItIsPresent) {
  const change_t codes_and_3d = [](edid_t *edid) {
    edid->hdmi_3d_present = 1;
    edid->image_size = 3;
    edid->hdmi_vic_len = 2;
    edid->hdmi_vic[0] = 1;
    edid->hdmi_vic[1] = 4;
  };
  EXPECT_EQ(hdmi_block_with(codes_and_3d), block_of({0, 0, 0, 0, 0}));
  EXPECT_EQ(hdmi_block_with([&](edid_t *edid) {
              codes_and_3d(edid);
              edid->hdmi_video_present = 1;
            }),
            block_of({0, 0, 0, 0, 0x20, 0x98, 0x40, 1, 4}));
}

TEST(HdmiBlockEncoder, WritesTheVideoPartBehindTheLatencies) {
  EXPECT_EQ(hdmi_block_with([](edid_t *edid) {
              edid->hdmi_video_present = 1;
              edid->i_video_latency = 20;
              edid->cnc3 = 1;
            }),
            block_of({0, 0, 0, 0, 0xE8, 1, 1, 11, 1, 0x00, 0x00}));
}

TEST(HdmiBlockEncoder, WritesEachImageSizeAndTheCodes) {
  for (u32 image_size = 0; image_size < 8; ++image_size) {
    EXPECT_EQ(hdmi_block_with([&](edid_t *edid) {
                edid->hdmi_video_present = 1;
                edid->image_size = byte_of(image_size);
              }),
              block_of({0, 0, 0, 0, 0x20, byte_of((image_size & 3) << 3), 0x00}));
  }
  for (u32 count = 0; count < 8; ++count) {
    bytes_t expected = {0, 0, 0, 0, 0x20, 0x00, byte_of(count << 5)};
    for (u32 i = 0; i < count; ++i)
      expected.push_back(byte_of(i + 1));
    EXPECT_EQ(hdmi_block_with([&](edid_t *edid) {
                edid->hdmi_video_present = 1;
                edid->hdmi_vic_len = byte_of(count);
                for (u32 i = 0; i < 7; ++i)
                  edid->hdmi_vic[i] = i + 1;
              }),
              block_of(expected));
  }
}

TEST(HdmiBlockEncoder, WritesNoMoreCodesThanTheRecordHolds) {
  const bytes_t block = hdmi_block_with([](edid_t *edid) {
    edid->hdmi_video_present = 1;
    edid->hdmi_vic_len = 255;
    for (u32 i = 0; i < 7; ++i)
      edid->hdmi_vic[i] = i + 1;
  });
  EXPECT_EQ(block.size(), 18u);
  EXPECT_EQ(slice(block, 11, 7), (bytes_t{1, 2, 3, 4, 5, 6, 7}));
}

namespace {

// The HDMI block of a record with these video entries and 3D, and what becomes of their masks.
struct encoding_3d_t {
  bytes_t entries;  // after the length byte
  u8 length_byte;
  masks_t masks;
  std::string traces;
};

encoding_3d_t encoding_3d(const std::vector<test_support::mode_pair_t> &videos, bool with_3d = true) {
  minimal_record_t record;
  record->hdmi_video_present = 1;
  record->hdmi_3d_present = with_3d ? 1 : 0;
  test_support::append_modes(record->video_list, videos);
  const encoding_t encoding = encode(record.get(), 0, true);
  EXPECT_EQ(encoding.result, 1);
  encoding_3d_t result{{}, 0, {}, encoding.output};
  // Speakers 4 bytes, audio 4 bytes, HDMI 9 bytes up to the video part.
  const bytes_t collection = collection_of(encoding.bytes);
  const std::size_t header = 4 + 1 + std::max<std::size_t>(videos.size(), 1) + 4;
  EXPECT_EQ(collection[header], 0x60 | ((collection.size() - header - 1) & 0x1F));
  EXPECT_EQ(collection[header + 9], with_3d ? 0x80 : 0x00);
  result.length_byte = collection[header + 10];
  result.entries = slice(collection, header + 11, collection.size() - header - 11);
  for (const auto &mode : test_support::modes_of(record->video_list))
    result.masks.push_back(mode.second);
  return result;
}

}  // namespace

TEST(Hdmi3dEncoder, WritesEachStructureInItsOrder) {
  const encoding_3d_t encoding = encoding_3d({{16, 0xFF}});
  EXPECT_EQ(encoding.entries, (bytes_t{0x00, 0x01, 0x02, 0x03, 0x04, 0x05, 0x08, 0x00, 0x06}));
  EXPECT_EQ(encoding.length_byte, 9);
  EXPECT_EQ(encoding.masks, (masks_t{0xFF}));
  EXPECT_EQ(encoding.traces, traced("order[0] FP, 00") + traced("order[0] FA, 01") + traced("order[0] LA, 02") +
                                 traced("order[0] SBSF, 03") + traced("order[0] LD, 04") + traced("order[0] LDGD, 05") +
                                 traced("order[0] SBSH, 08, 00") + traced("order[0] TBH, 06"));
}

TEST(Hdmi3dEncoder, WritesEachStructureAlone) {
  const struct {
    u32 mask;
    bytes_t entry;
    const char *trace;
  } cases[] = {{0x01, {0x20}, "order[2] FP, 20"},  {0x02, {0x28, 0x00}, "order[2] SBSH, 28, 00"},
               {0x04, {0x26}, "order[2] TBH, 26"}, {0x08, {0x21}, "order[2] FA, 21"},
               {0x10, {0x22}, "order[2] LA, 22"},  {0x20, {0x23}, "order[2] SBSF, 23"},
               {0x40, {0x24}, "order[2] LD, 24"},  {0x80, {0x25}, "order[2] LDGD, 25"}};
  for (const auto &each : cases) {
    SCOPED_TRACE(each.trace);
    const encoding_3d_t encoding = encoding_3d({{16, 0}, {31, 0}, {34, each.mask}});
    EXPECT_EQ(encoding.entries, each.entry);
    EXPECT_EQ(encoding.length_byte, each.entry.size());
    EXPECT_EQ(encoding.traces, traced(each.trace));
  }
}

TEST(Hdmi3dEncoder, ClearsTheMandatoryStructuresOfARecordsModes) {
  const encoding_3d_t encoding = encoding_3d({{32, 0xFF}, {4, 0x07}, {5, 0x07}, {19, 0x05}, {20, 0x02}, {16, 0x07}});
  EXPECT_EQ(encoding.masks, (masks_t{0xFA, 0x02, 0x05, 0x00, 0x00, 0x07}));
  EXPECT_EQ(encoding.entries, (bytes_t{0x01, 0x02, 0x03, 0x04, 0x05, 0x08, 0x00,  // VIC 32: all but FP and TBH
                                       0x18, 0x00,                                // VIC 4: SBSH
                                       0x20, 0x26,                                // VIC 5: FP, TBH
                                       0x50, 0x58, 0x00, 0x56}));                 // VIC 16: all three
  EXPECT_EQ(encoding.length_byte, 15);
}

TEST(Hdmi3dEncoder, LooksAtTheFirst16EntriesOnly) {
  std::vector<test_support::mode_pair_t> videos(15, {16, 0});
  videos.push_back({34, 0x01});
  videos.push_back({34, 0x01});
  videos.push_back({4, 0x07});
  const encoding_3d_t encoding = encoding_3d(videos);
  EXPECT_EQ(encoding.entries, (bytes_t{0xF0}));
  EXPECT_EQ(encoding.masks[15], 0x01u);
  EXPECT_EQ(encoding.masks[16], 0x01u);
  EXPECT_EQ(encoding.masks[17], 0x07u);
}

TEST(Hdmi3dEncoder, WritesNothingAndClearsNothingWithout3d) {
  const encoding_3d_t encoding = encoding_3d({{4, 0x07}, {16, 0xFF}}, false);
  EXPECT_EQ(encoding.entries, bytes_t{});
  EXPECT_EQ(encoding.length_byte, 0);
  EXPECT_EQ(encoding.masks, (masks_t{0x07, 0xFF}));
  EXPECT_EQ(encoding.traces, "");
}

TEST(Hdmi3dEncoder, ClearsNothingWithoutTheVideoPart) {
  minimal_record_t record;
  record->hdmi_3d_present = 1;
  append_video(record.get(), 4, 0x07);
  encoded(record.get());
  EXPECT_EQ(test_support::modes_of(record->video_list), (std::vector<test_support::mode_pair_t>{{4, 0x07}}));
}

TEST(Hdmi3dEncoder, WritesTheLengthsOfCodesAndStructuresIntoOneByte) {
  minimal_record_t record;
  record->hdmi_video_present = 1;
  record->hdmi_3d_present = 1;
  record->hdmi_vic_len = 3;
  record->hdmi_vic[0] = 3;
  record->hdmi_vic[1] = 2;
  record->hdmi_vic[2] = 1;
  append_video(record.get(), 16, 0x03);
  // One video entry, as in the record without any, so the block is where it always is.
  EXPECT_EQ(hdmi_block_of(record.get()), block_of({0, 0, 0, 0, 0x20, 0x80, 0x63, 3, 2, 1, 0x00, 0x08, 0x00}));
}

TEST(Hdmi3dEncoder, WrapsLengthsThatTheirBitsDoNotHold) {
  // 4 x 9 = 36 bytes of entries; the block's payload is 46 bytes.
  const encoding_3d_t encoding = encoding_3d({{16, 0xFF}, {31, 0xFF}, {33, 0xFF}, {34, 0xFF}});
  EXPECT_EQ(encoding.entries.size(), 36u);
  EXPECT_EQ(encoding.length_byte, 36 & 31);
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
