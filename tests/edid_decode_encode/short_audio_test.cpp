// The short audio descriptor, both directions.
#include "edid_decode_encode/short_audio.h"

#include <cstring>

#include "codec_fixture.h"

namespace codec_test {
namespace {

using test_support::audio_words_t;
using test_support::words_of;

// The seven words of a descriptor: type, channels, frequencies, pcm_bits, max_bitrate, value, wma_profile.
audio_words_t decoded(u8 byte_1, u8 byte_2, u8 byte_3) {
  short_audio_desc_t audio;
  std::memset(&audio, 0xA5, sizeof(audio));
  EXPECT_EQ(output_of([&] { EXPECT_EQ(decode_edid_short_audio(byte_1, byte_2, byte_3, &audio), 1); }), "");
  return words_of(audio);
}

u8 first_byte(u32 code, u32 channels) {
  return byte_of(code << 3 | (channels - 1));
}

}  // namespace

TEST(ShortAudioDecoder, DecodesTheUsualFormats) {
  EXPECT_EQ(decoded(0x09, 0x07, 0x07), (audio_words_t{1, 2, 0x07, 7, 0, 0, 0}));
  EXPECT_EQ(decoded(0x15, 0x07, 0x50), (audio_words_t{2, 6, 0x07, 0, 640, 0, 0}));
  EXPECT_EQ(decoded(0x3D, 0x1E, 0xC0), (audio_words_t{7, 6, 0x1E, 0, 1536, 0, 0}));
  EXPECT_EQ(decoded(0x57, 0x06, 0x03), (audio_words_t{10, 8, 0x06, 0, 0, 3, 0}));
  EXPECT_EQ(decoded(0x67, 0x54, 0x01), (audio_words_t{12, 8, 0x54, 0, 0, 1, 0}));
}

TEST(ShortAudioDecoder, DecodesTheChannelsOfEveryFormat) {
  for (u32 code = 1; code < 15; ++code) {
    for (u32 channels = 1; channels <= 8; ++channels) {
      SCOPED_TRACE(std::to_string(code) + " with " + std::to_string(channels));
      EXPECT_EQ(decoded(first_byte(code, channels), 0, 0), (audio_words_t{code, channels, 0, 0, 0, 0, 0}));
    }
  }
}

TEST(ShortAudioDecoder, DecodesEachSampleRateBit) {
  for (u32 bit = 0; bit < 7; ++bit) {
    EXPECT_EQ(decoded(0x08, byte_of(1u << bit), 0), (audio_words_t{1, 1, 1u << bit, 0, 0, 0, 0})) << bit;
  }
}

TEST(ShortAudioDecoder, IgnoresTheReservedBits) {
  EXPECT_EQ(decoded(0x88, 0x80, 0x00), (audio_words_t{1, 1, 0, 0, 0, 0, 0}));
  EXPECT_EQ(decoded(0xFF, 0xFF, 0x08), (audio_words_t{16, 8, 0x7F, 0, 0, 0, 0}));
}

TEST(ShortAudioDecoder, ReadsTheThirdByteByFormat) {
  for (u32 byte_3 = 0; byte_3 < 256; ++byte_3) {
    SCOPED_TRACE(byte_3);
    EXPECT_EQ(decoded(0x08, 0, byte_of(byte_3)), (audio_words_t{1, 1, 0, byte_3 & 7, 0, 0, 0}));
    for (u32 code = 2; code <= 8; ++code) {
      EXPECT_EQ(decoded(first_byte(code, 1), 0, byte_of(byte_3)), (audio_words_t{code, 1, 0, 0, byte_3 * 8, 0, 0}));
    }
    for (u32 code = 9; code <= 13; ++code) {
      EXPECT_EQ(decoded(first_byte(code, 1), 0, byte_of(byte_3)), (audio_words_t{code, 1, 0, 0, 0, byte_3, 0}));
    }
    EXPECT_EQ(decoded(0x70, 0, byte_of(byte_3)), (audio_words_t{14, 1, 0, 0, 0, 0, byte_3 & 7}));
  }
}

TEST(ShortAudioDecoder, TakesTheTypeOfExtendedFormatsFromTheirExtensionCode) {
  for (u32 extension = 0; extension < 32; ++extension) {
    const u32 type = extension >= 1 && extension <= 3 ? 15 + extension : 0;
    for (u32 low = 0; low < 8; low += 7) {
      SCOPED_TRACE(extension);
      EXPECT_EQ(decoded(0x79, 0x06, byte_of(extension << 3 | low)), (audio_words_t{type, 2, 6, 0, 0, 0, 0}));
    }
  }
}

TEST(ShortAudioDecoder, RefusesFormat0ButFillsWhatTheFormatsShare) {
  short_audio_desc_t audio;
  std::memset(&audio, 0xA5, sizeof(audio));
  EXPECT_EQ(output_of([&] { EXPECT_EQ(decode_edid_short_audio(0x83, 0xC5, 0xFF, &audio), 0); }),
            codec_error("decode_edid_short_audio",
                        "Unrecognized audio type found in audio format. Expected:1-15 Received:0"));
  EXPECT_EQ(words_of(audio), (audio_words_t{0, 4, 0x45, 0, 0, 0, 0}));
}

TEST(ShortAudioDecoder, RefusesAMissingDescriptorFirst) {
  const std::string message =
      codec_error("decode_edid_short_audio", "Function called with \"audio\" parameter set to NULL. audio=(nil)");
  EXPECT_EQ(output_of([] { EXPECT_EQ(decode_edid_short_audio(0x09, 0x07, 0x07, nullptr), 0); }), message);
  EXPECT_EQ(output_of([] { EXPECT_EQ(decode_edid_short_audio(0x00, 0x00, 0x00, nullptr), 0); }), message);
}

TEST(ShortAudioDecoder, PrintsNothingWhileTracing) {
  short_audio_desc_t audio;
  EXPECT_EQ(traced_output_of([&] { EXPECT_EQ(decode_edid_short_audio(0x09, 0x07, 0x07, &audio), 1); }), "");
}

namespace {

bytes_t encoded_audio(short_audio_desc_t audio) {
  const exact_bytes_t block(bytes_t(3, 0xA5));
  EXPECT_EQ(traced_output_of([&] { EXPECT_TRUE(edid_composer::_encode_edid_short_audio(block.data(), &audio)); }), "");
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
    EXPECT_TRUE(edid_composer::_encode_edid_short_audio(block.data(), &audio));
    EXPECT_EQ(test_support::words_of(audio), (test_support::audio_words_t{type < 15 ? type : 15, 2, 6, 1, 8, 2, 3}));
  }
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
    EXPECT_EQ(output_of([&] { EXPECT_FALSE(edid_composer::_encode_edid_short_audio(block.data(), &audio)); }),
              codec_error("_encode_edid_short_audio", message));
    EXPECT_EQ(audio.type, type);
  }
}

TEST(ShortAudio, ReturnsToTheBytesThatItWasReadFromWithoutTheirReservedBits) {
  for (u32 byte_1 = 0x08; byte_1 < 0x80; ++byte_1) {
    const u32 code = byte_1 >> 3;
    for (u32 byte_3 = 0; byte_3 < 256; ++byte_3) {
      const u32 extension = byte_3 >> 3;
      if (code == 15 && (extension < 1 || extension > 3)) continue;  // Has no type.
      const u32 used = code == 1 || code == 14 ? 0x07 : code == 15 ? 0xF8 : 0xFF;
      short_audio_desc_t audio{};
      ASSERT_EQ(decode_edid_short_audio(byte_of(byte_1), 0x2A, byte_of(byte_3), &audio), 1);
      ASSERT_EQ(edid_composer::short_audio_type(byte_of(byte_1), byte_of(byte_3)), audio.type);
      bytes_t block(3, 0);
      ASSERT_TRUE(edid_composer::_encode_edid_short_audio(block.data(), &audio));
      ASSERT_EQ(block, (bytes_t{byte_of(byte_1), 0x2A, byte_of(byte_3 & used)})) << byte_1 << " " << byte_3;
    }
  }
}

}  // namespace codec_test
