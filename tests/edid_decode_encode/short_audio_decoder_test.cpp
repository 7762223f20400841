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

}  // namespace codec_test
