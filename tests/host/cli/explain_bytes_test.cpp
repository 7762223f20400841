// The names of the bytes of EDIDs, also of such as nobody would compose.
#include <gmock/gmock.h>

#include <array>
#include <random>

#include "composition/composition.h"
#include "composition/library_line.h"
#include "config_store.h"
#include "edid_input/edid_file.h"
#include "explain/byte_names.h"

namespace edid_cli {
namespace {

using testing::AllOf;
using testing::Field;

std::vector<u8> composed_for(const std::string &sink) {
  EXPECT_TRUE(config_store_load_default());
  composition_options_t options;
  options.settings.audio_mask = 0xFFFFFFFF;
  options.settings.hdmi_3d_mode = follow_sink_3d_mode;
  const composition_t composition =
      compose(options, 0, read_edid_file(std::string(SAMPLE_SINKS_DIRECTORY) + "/" + sink + ".txt"),
              [](const compose_log_line_t &line) { ADD_FAILURE() << printed(line); });
  EXPECT_TRUE(composition.is_composed);
  return {composition.new_edid.begin(), composition.new_edid.end()};
}

/// Each byte in one field, in order, with a name and a meaning.
void expect_complete(const std::vector<byte_field_t> &fields) {
  std::size_t position = 0;
  for (const byte_field_t &field : fields) {
    EXPECT_EQ(field.offset, position);
    EXPECT_GT(field.size, 0U);
    EXPECT_FALSE(field.name.empty());
    EXPECT_FALSE(field.meaning.empty()) << field.name;
    position += field.size;
  }
  EXPECT_EQ(position, 256U);
}

const byte_field_t &field_at(const std::vector<byte_field_t> &fields, std::size_t offset) {
  const auto found = std::find_if(fields.begin(), fields.end(), [offset](const byte_field_t &field) {
    return offset >= field.offset && offset < field.offset + field.size;
  });
  return *found;
}

class ByteNames : public testing::Test {
 protected:
  void expect(std::size_t offset, byte_block_t block, const std::string &name, const std::string &meaning) {
    const byte_field_t &field = field_at(fields_, offset);
    EXPECT_EQ(byte_block_id(field.block), std::string(byte_block_id(block))) << offset;
    EXPECT_EQ(field.name, name) << offset;
    EXPECT_EQ(field.meaning, meaning) << offset;
  }

  std::vector<u8> edid_ = composed_for("tv_4k");
  std::vector<byte_field_t> fields_ = name_bytes(edid_);
};

TEST_F(ByteNames, CoverEveryByteOnce) {
  for (const char *sink : {"tv_4k", "tv_1080p_3d", "tv_720p_50hz", "av_receiver", "monitor_base_block"}) {
    expect_complete(name_bytes(composed_for(sink)));
  }
}

TEST_F(ByteNames, OfTheBaseBlock) {
  expect(0, byte_block_t::identity, "Header", "fixed: an EDID begins here");
  expect(9, byte_block_t::identity, "Manufacturer", "YYY");
  expect(17, byte_block_t::identity, "Year of manufacture", "2024");
  expect(21, byte_block_t::display, "Width", "160 cm");
  expect(23, byte_block_t::display, "Gamma", "2.20");
  expect(35, byte_block_t::timings, "Established timings I", "640x480p60, 800x600p60");
  expect(38, byte_block_t::timings, "Standard timing 1", "1280x720, 60 Hz");
  expect(52, byte_block_t::timings, "Standard timing 8", "unused");
  expect(126, byte_block_t::extension, "Extension blocks", "1");
  expect(127, byte_block_t::extension, "Checksum", "right: the block's bytes add up to 0");
}

TEST_F(ByteNames, OfDescriptors) {
  expect(54, byte_block_t::descriptor, "Pixel clock", "148.50 MHz");
  expect(56, byte_block_t::descriptor, "Horizontal active", "1920 pixels");
  expect(57, byte_block_t::descriptor, "Horizontal blanking", "280 pixels");
  expect(59, byte_block_t::descriptor, "Vertical active", "1080 lines");
  expect(62, byte_block_t::descriptor, "Horizontal front porch", "88 pixels");
  expect(64, byte_block_t::descriptor, "Vertical front porch and sync width", "4 and 5 lines");
  expect(71, byte_block_t::descriptor, "Flags", "progressive, horizontal sync +, vertical sync +");
  expect(93, byte_block_t::descriptor, "Descriptor tag", "0xFC: Monitor name");
  expect(95, byte_block_t::descriptor, "Monitor name", "\"Media Box\"");
  expect(113, byte_block_t::descriptor, "Lowest vertical rate", "49 Hz");
}

TEST_F(ByteNames, OfTheExtension) {
  expect(128, byte_block_t::extension, "Extension tag", "2: CEA-861");
  expect(131, byte_block_t::extension, "Flags", "basic audio, YCbCr 4:4:4, YCbCr 4:2:2, 3 native timings");
  expect(132, byte_block_t::speakers, "Speaker allocation data block", "3 bytes follow");
  expect(136, byte_block_t::video, "Video data block", "14 bytes follow");
  expect(137, byte_block_t::video, "Video descriptor 1", "1920x1080p60 16:9 (VIC 16), native");
  expect(152, byte_block_t::audio, "Audio descriptor 1: format and channels", "PCM, 2 channels");
  expect(154, byte_block_t::audio, "Audio descriptor 1: detail", "16 bits, 20 bits, 24 bits");
  expect(255, byte_block_t::extension, "Checksum", "right: the block's bytes add up to 0");
}

TEST_F(ByteNames, OfTheHdmiBlock) {
  expect(168, byte_block_t::hdmi, "IEEE identifier", "00-0C-03: HDMI");
  expect(172, byte_block_t::hdmi, "Physical address", "2.1.0.0");
  expect(174, byte_block_t::hdmi, "Highest TMDS clock", "300 MHz");
  expect(176, byte_block_t::hdmi, "Video latency", "90 ms");
  expect(179, byte_block_t::hdmi, "Interlaced audio latency", "100 ms");
  expect(182, byte_block_t::hdmi, "4Kx2K mode 1", "3840x2160p30 (4k:1)");
}

TEST_F(ByteNames, OfADataBlockOfNoKnownKind) {
  edid_[132] &= 0x1F;
  fields_ = name_bytes(edid_);
  expect(132, byte_block_t::other, "Reserved data block", "3 bytes follow");
  for (const std::size_t offset : {133U, 135U}) {
    expect(offset, byte_block_t::other, "Not known", "not looked at");
  }
  expect(136, byte_block_t::video, "Video data block", "14 bytes follow");
}

TEST_F(ByteNames, OfTheDataBlocksOfHdmi2) {
  edid_ = read_edid_file(std::string(SAMPLE_SINKS_DIRECTORY) + "/tv_4k_hdr.txt");
  fields_ = name_bytes(edid_);
  expect_complete(fields_);
  expect(133, byte_block_t::video, "Video descriptor 1", "3840x2160p60 16:9 (VIC 97)");
  expect(182, byte_block_t::forum, "HDMI Forum data block", "7 bytes follow");
  expect(187, byte_block_t::forum, "Highest TMDS rate", "600 MHz");
  expect(189, byte_block_t::forum, "Fixed rate link, UHD and deep colour in 4:2:0",
         "fixed rate link: none; VICs of the modes that have an HDMI_VIC, 36 bits in 4:2:0, 30 bits in 4:2:0");
  expect(192, byte_block_t::colorimetry, "Colorimetry", "BT2020YCC, BT2020RGB");
  expect(196, byte_block_t::hdr, "Transfer functions", "SDR, PQ (SMPTE ST 2084), HLG");
  expect(198, byte_block_t::hdr, "Highest luminance", "644.20 cd/m2");
  expect(200, byte_block_t::hdr, "Lowest luminance", "0.1431 cd/m2");
  expect(206, byte_block_t::y420, "Video descriptors 1 to 8", "in 4:2:0 too: video descriptor 1, 2, 6, 7");
  expect(213, byte_block_t::hdr, "Dolby Vision data block", "11 bytes follow");
}

TEST_F(ByteNames, OfEveryExtension) {
  const std::vector<u8> two = read_edid_file(std::string(SAMPLE_SINKS_DIRECTORY) + "/gaming_monitor.txt");
  edid_ = two;
  edid_.insert(edid_.end(), two.begin() + 128, two.end());
  edid_.insert(edid_.end(), 128, 0x70);
  fields_ = name_bytes(edid_);
  std::size_t named = 0;
  for (const byte_field_t &field : fields_) {
    EXPECT_EQ(field.offset, named);
    named += field.size;
  }
  EXPECT_EQ(named, edid_.size());
  EXPECT_EQ(field_at(fields_, 128 + 5).meaning, field_at(fields_, 256 + 5).meaning);
  expect(256 + 5, byte_block_t::video, "Video descriptor 1", "3840x2160p60 16:9 (VIC 97)");
  expect(384, byte_block_t::extension, "Extension tag", "0x70: not CTA-861");
}

TEST_F(ByteNames, AWrongChecksumIsToldAsWrong) {
  edid_[20] ^= 1;
  fields_ = name_bytes(edid_);
  expect(127, byte_block_t::extension, "Checksum", "wrong: the block's bytes don't add up to 0");
}

TEST_F(ByteNames, AnUnusedRestIsToldAsUnused) {
  EXPECT_EQ(field_at(fields_, 254).block, byte_block_t::unused);
}

TEST_F(ByteNames, CoverEveryByteOfAnythingOnce) {
  std::mt19937 random(1);
  for (int round = 0; round < 2000; ++round) {
    std::vector<u8> edid = round % 2 == 0 ? edid_ : std::vector<u8>(256);
    for (std::size_t change = 0; change < (round % 2 == 0 ? 3U : 256U); ++change) {
      edid[random() % edid.size()] = static_cast<u8>(random());
    }
    expect_complete(name_bytes(edid));
    ASSERT_FALSE(HasFailure()) << round;
  }
}

}  // namespace
}  // namespace edid_cli
