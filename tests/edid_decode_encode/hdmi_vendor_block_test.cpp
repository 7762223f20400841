// The HDMI vendor-specific data block up to its latencies.
#include "vendor_block_decoding.h"

namespace codec_test {
namespace {

using test_support::data_block;
using test_support::hdmi_block;

constexpr const char *function = "_decode_edid_vendor_block";

// What an HDMI block with this payload after its OUI changes in a prepared record.
fields_t changes_by(const bytes_t &payload_behind_oui) {
  scoped_edid_t edid;
  EXPECT_EQ(output_of([&] { EXPECT_TRUE(decode_vendor_block(hdmi_block(payload_behind_oui), edid.get())); }), "");
  return difference(fields_of(edid_t{}), fields_of(*edid.get()));
}

const fields_t present = {{"hdmi_present", "1"}};

fields_t latencies(const char *video, const char *audio, const char *i_video, const char *i_audio) {
  return {{"hdmi_present", "1"},
          {"video_latency", video},
          {"audio_latency", audio},
          {"i_video_latency", i_video},
          {"i_audio_latency", i_audio}};
}

std::string refusal_of(const bytes_t &block) {
  scoped_edid_t edid;
  const std::string output = output_of([&] { EXPECT_FALSE(decode_vendor_block(block, edid.get())); });
  EXPECT_EQ(fields_of(*edid.get()), fields_of(edid_t{}));
  return output;
}

}  // namespace

TEST(HdmiVendorBlock, RefusesOtherTags) {
  for (const u32 tag : {0u, 1u, 2u, 4u, 5u, 6u, 7u}) {
    EXPECT_EQ(refusal_of(data_block(byte_of(tag), {0x03})),
              codec_error(function, "Failed decoding the vendor block. Tag is not correct. Expected=0x3 Received=0x" +
                                        std::to_string(tag)));
  }
}

TEST(HdmiVendorBlock, RefusesABlockWithoutRoomForAVendor) {
  for (const u32 length : {0u, 1u, 2u}) {
    EXPECT_EQ(
        refusal_of(data_block(3, bytes_t(length, 0x03))),
        codec_error(function,
                    "Failed decoding the vendor block. Length not long enough to contain the vendor's id. Length=" +
                        std::to_string(length)));
  }
}

TEST(HdmiVendorBlock, IgnoresOtherVendorsWithATrace) {
  const struct {
    bytes_t payload;
    const char *vendor;
  } cases[] = {{{0xD8, 0x5D, 0xC4, 0x01, 0x78}, "C45DD8"},
               {{0x00, 0x0C, 0x03}, "30C00"},
               {{0x02, 0x0C, 0x00, 0x10, 0x00}, "C02"},
               {{0x03, 0x0C, 0x01, 0x10, 0x00}, "10C03"},
               {{0x00, 0x00, 0x00}, "0"}};
  for (const auto &each : cases) {
    SCOPED_TRACE(each.vendor);
    scoped_edid_t edid;
    const bytes_t block = data_block(3, each.payload);
    EXPECT_EQ(traced_output_of([&] { EXPECT_TRUE(decode_vendor_block(block, edid.get())); }),
              trace_line(function, std::string("Unrecognized vendor block. Ignoring. Vendor=0x") + each.vendor));
    EXPECT_EQ(output_of([&] { EXPECT_TRUE(decode_vendor_block(block, edid.get())); }), "");
    EXPECT_EQ(fields_of(*edid.get()), fields_of(edid_t{}));
  }
}

TEST(HdmiVendorBlock, RefusesAnHdmiBlockWithoutAPhysicalAddress) {
  EXPECT_EQ(
      refusal_of(hdmi_block({})),
      codec_error(function,
                  "Failed decoding the hdmi block. The length is required to be at least 5 bytes long. Length=3"));
  EXPECT_EQ(
      refusal_of(hdmi_block({0x10})),
      codec_error(function,
                  "Failed decoding the hdmi block. The length is required to be at least 5 bytes long. Length=4"));
}

TEST(HdmiVendorBlock, OfLength5GivesThePhysicalAddressAlone) {
  EXPECT_EQ(changes_by({0x12, 0x3F}), together(present, {{"physical_address[0]", "1"},
                                                         {"physical_address[1]", "2"},
                                                         {"physical_address[2]", "3"},
                                                         {"physical_address[3]", "15"}}));
}

TEST(HdmiVendorBlock, TakesNoFlagFromTheBytesBehindABlockOfLength5) {
  scoped_edid_t edid;
  EXPECT_TRUE(decode_vendor_block(test_support::join(hdmi_block({0x00, 0x00}), bytes_t(20, 0xFF)), edid.get()));
  EXPECT_EQ(difference(fields_of(edid_t{}), fields_of(*edid.get())), present);
  EXPECT_TRUE(decode_vendor_block(test_support::join(hdmi_block({0x00, 0x00, 0x00}), bytes_t(20, 0xFF)), edid.get()));
  EXPECT_EQ(difference(fields_of(edid_t{}), fields_of(*edid.get())), present);
  EXPECT_TRUE(
      decode_vendor_block(test_support::join(hdmi_block({0x00, 0x00, 0x00, 0x00}), bytes_t(20, 0xFF)), edid.get()));
  EXPECT_EQ(difference(fields_of(edid_t{}), fields_of(*edid.get())), present);
}

TEST(HdmiVendorBlock, DecodesEachBitOfThePhysicalAddress) {
  for (u32 nibble = 0; nibble < 4; ++nibble) {
    for (u32 bit = 0; bit < 4; ++bit) {
      SCOPED_TRACE(std::to_string(nibble) + " bit " + std::to_string(bit));
      bytes_t address(2, 0);
      address[nibble / 2] = byte_of(1u << bit << (nibble % 2 == 0 ? 4 : 0));
      EXPECT_EQ(changes_by(address),
                together(present, {{"physical_address[" + std::to_string(nibble) + "]", std::to_string(1u << bit)}}));
    }
  }
}

TEST(HdmiVendorBlock, DecodesEachCapabilityBit) {
  const char *const fields[8] = {"dvi_dual", nullptr,    nullptr,    "dc_y444",
                                 "dc_30bit", "dc_36bit", "dc_48bit", "supports_ai"};
  for (u32 bit = 0; bit < 8; ++bit) {
    SCOPED_TRACE(bit);
    EXPECT_EQ(changes_by({0x00, 0x00, byte_of(1u << bit)}),
              fields[bit] == nullptr ? present : together(present, {{fields[bit], "1"}}));
  }
}

TEST(HdmiVendorBlock, DecodesTheMaximumTmdsClockInUnitsOf5Mhz) {
  for (u32 bit = 0; bit < 8; ++bit) {
    EXPECT_EQ(changes_by({0x00, 0x00, 0x00, byte_of(1u << bit)}),
              together(present, {{"max_tmds_clock", std::to_string(5u << bit)}}));
  }
  EXPECT_EQ(changes_by({0x00, 0x00, 0x00, 0xFF}), together(present, {{"max_tmds_clock", "1275"}}));
}

TEST(HdmiVendorBlock, DecodesEachContentTypeAndTheVideoFlag) {
  const char *const fields[6] = {"cnc0", "cnc1", "cnc2", "cnc3", nullptr, "hdmi_video_present"};
  for (u32 bit = 0; bit < 6; ++bit) {
    SCOPED_TRACE(bit);
    EXPECT_EQ(changes_by({0x00, 0x00, 0x00, 0x00, byte_of(1u << bit)}),
              fields[bit] == nullptr ? present : together(present, {{fields[bit], "1"}}));
  }
}

TEST(HdmiVendorBlock, GivesInterlacedLatenciesOfTheirOwnOrThoseOfProgressiveVideo) {
  EXPECT_EQ(changes_by({0x00, 0x00, 0x00, 0x00, 0x80, 0x0B, 0x15}), latencies("20", "40", "20", "40"));
  EXPECT_EQ(changes_by({0x00, 0x00, 0x00, 0x00, 0xC0, 0x0B, 0x15, 0x1F, 0x29}), latencies("20", "40", "60", "80"));
  EXPECT_EQ(changes_by({0x00, 0x00, 0x00, 0x00, 0x40, 0x0B, 0x15, 0x1F, 0x29}), present);
}

TEST(HdmiVendorBlock, ConvertsEachLatencyByte) {
  for (u32 value = 0; value < 256; ++value) {
    scoped_edid_t edid;
    ASSERT_EQ(
        decode_vendor_block(hdmi_block({0, 0, 0, 0, 0xC0, byte_of(value), 0, 0, byte_of(255 - value)}), edid.get()), 1);
    EXPECT_EQ(edid->video_latency, value == 0 ? 0 : 2 * value - 2) << value;
    EXPECT_EQ(edid->audio_latency, 0);
    EXPECT_EQ(edid->i_video_latency, 0);
    EXPECT_EQ(edid->i_audio_latency, value == 255 ? 0 : 2 * (255 - value) - 2) << value;
  }
}

TEST(HdmiVendorBlock, HasNoSpecialCaseForALatencyOf255) {
  EXPECT_EQ(changes_by({0x00, 0x00, 0x00, 0x00, 0x80, 0xFF, 0xFB}), latencies("508", "500", "508", "500"));
}

TEST(HdmiVendorBlock, ReadsLatenciesThatAreAnnouncedBeyondItsLength) {
  scoped_edid_t edid;
  const bytes_t bytes =
      test_support::join(hdmi_block({0x00, 0x00, 0x00, 0x00, 0xC0}), {0x02, 0x03, 0x04, 0x05, 0x06, 0x07});
  EXPECT_TRUE(decode_vendor_block(bytes, edid.get()));
  EXPECT_EQ(difference(fields_of(edid_t{}), fields_of(*edid.get())), latencies("2", "4", "6", "8"));
  scoped_edid_t of_block_alone;
  EXPECT_TRUE(decode_vendor_block(hdmi_block({0x00, 0x00, 0x00, 0x00, 0xC0}), of_block_alone.get()));
  EXPECT_EQ(difference(fields_of(edid_t{}), fields_of(*of_block_alone.get())), present);
}

TEST(HdmiVendorBlock, ThatOccursAgainOverwritesTheFirst) {
  scoped_edid_t edid;
  ASSERT_EQ(decode_vendor_block(hdmi_block({0x12, 0x34, 0xF9, 0x3C, 0xCF, 0x0B, 0x15, 0x1F, 0x29}), edid.get()), 1);
  ASSERT_EQ(decode_vendor_block(hdmi_block({0x20, 0x00, 0x00, 0x00, 0x80, 0x02, 0x03}), edid.get()), 1);
  EXPECT_EQ(difference(fields_of(edid_t{}), fields_of(*edid.get())),
            together(latencies("2", "4", "2", "4"), {{"physical_address[0]", "2"}}));
}

TEST(HdmiVendorBlock, ReadsNothingBehindTheLastByte) {
  const bytes_t whole = hdmi_block({0x12, 0x34, 0xF9, 0x3C, 0xEF, 0x0B, 0x15, 0x1F, 0x29, 0x80, 0x7F, 0x01});
  for (std::size_t size = 1; size <= whole.size(); ++size) {
    SCOPED_TRACE(size);
    const bytes_t cut(whole.begin(), whole.begin() + static_cast<std::ptrdiff_t>(size));
    bytes_t padded = cut;
    padded.resize(whole.size() + 64, 0);
    scoped_edid_t of_cut;
    scoped_edid_t of_padded;
    u8 results[2] = {};
    EXPECT_EQ(output_of([&] { results[0] = decode_vendor_block(cut, of_cut.get()); }),
              output_of([&] { results[1] = decode_vendor_block(padded, of_padded.get()); }));
    EXPECT_EQ(results[0], results[1]);
    EXPECT_EQ(fields_of(*of_cut.get()), fields_of(*of_padded.get()));
  }
}

}  // namespace codec_test
