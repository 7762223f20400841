// The printers: speakers, audio descriptors, 3D masks and timing bits.
#include <gtest/gtest.h>

#include "edid_composer.h"
#include "utility/utility_lines.h"

namespace utility_tests {
namespace {

std::string speakers(u8 byte1, u8 byte2, u8 byte3 = 0) {
  return output_of([&] { print_speaker(byte1, byte2, byte3); });
}

TEST(PrintSpeaker, NamesEverySpeakerInOrder) {
  EXPECT_EQ(speakers(0xFF, 0x07), "FL/FR LFE FC RL/RR RC FLC/FRC RLC/RRC FLW/FRW FLH/FRH TC FCH\n");
}

TEST(PrintSpeaker, NamesEachBit) {
  const char *const first[] = {"FL/FR", " LFE", " FC", " RL/RR", " RC", " FLC/FRC", " RLC/RRC", " FLW/FRW"};
  for (u32 bit = 0; bit < 8; ++bit)
    EXPECT_EQ(speakers(static_cast<u8>(1u << bit), 0), first[bit] + std::string("\n"));
  const char *const second[] = {" FLH/FRH", " TC", " FCH", "", "", "", "", ""};
  for (u32 bit = 0; bit < 8; ++bit)
    EXPECT_EQ(speakers(0, static_cast<u8>(1u << bit)), second[bit] + std::string("\n"));
}

TEST(PrintSpeaker, DoesNotUseTheThirdByte) {
  EXPECT_EQ(speakers(0, 0, 0xFF), "\n");
}

std::string printed(const short_audio_desc_t &audio) {
  return output_of([&] { print_audio_structure(&audio); });
}

/// A descriptor whose every field is told apart.
short_audio_desc_t descriptor(u32 type, u32 frequencies = 0x06) {
  short_audio_desc_t audio{};
  audio.type = type;
  audio.channels = 6;
  audio.frequencies = frequencies;
  audio.pcm_bits = 5;
  audio.max_bitrate = 640;
  audio.value = 17;
  audio.wma_profile = 3;
  return audio;
}

TEST(PrintAudioStructure, PrintsSampleSizesOfPcm) {
  EXPECT_EQ(printed(descriptor(1)), "Code: 1:PCM Channels:6 Freq:44.1kHz 48kHz  Bits:16bits 24bits \n");
}

TEST(PrintAudioStructure, PrintsTheBitRateOfCompressedTypes) {
  const char *const names[] = {"AC3", "MPEG1", "MP3", "MPEG2", "AAC", "DTS", "ATRAC"};
  for (u32 type = 2; type <= 8; ++type) {
    EXPECT_EQ(printed(descriptor(type)), "Code: " + std::to_string(type) + ":" + names[type - 2] +
                                             " Channels:6 Freq:44.1kHz 48kHz  Max Rate:640kHz\n");
  }
}

TEST(PrintAudioStructure, PrintsTheStoredByteOfOtherTypes) {
  EXPECT_EQ(printed(descriptor(9)), "Code: 9:DSD Channels:6 Freq:44.1kHz 48kHz  val:17\n");
  EXPECT_EQ(printed(descriptor(10)), "Code: 10:EAC3/DD+ Channels:6 Freq:44.1kHz 48kHz  val:17\n");
  EXPECT_EQ(printed(descriptor(11)), "Code: 11:DTS HD Channels:6 Freq:44.1kHz 48kHz  val:17\n");
  EXPECT_EQ(printed(descriptor(12)), "Code: 12:MLP/TrueHD Channels:6 Freq:44.1kHz 48kHz  val:17\n");
  EXPECT_EQ(printed(descriptor(13)), "Code: 13:DST Channels:6 Freq:44.1kHz 48kHz  val:17\n");
}

TEST(PrintAudioStructure, PrintsTheProfileOfWmaPro) {
  EXPECT_EQ(printed(descriptor(14)), "Code: 14:WMA pro Channels:6 Freq:44.1kHz 48kHz  Max Profile:3\n");
}

TEST(PrintAudioStructure, PrintsExtendedTypesWithoutMore) {
  EXPECT_EQ(printed(descriptor(16)), "Code: 16:HE AAC Channels:6 Freq:44.1kHz 48kHz \n");
  EXPECT_EQ(printed(descriptor(17)), "Code: 17:HE AACv2 Channels:6 Freq:44.1kHz 48kHz \n");
  EXPECT_EQ(printed(descriptor(18)), "Code: 18:MPEG SURROUND Channels:6 Freq:44.1kHz 48kHz \n");
}

TEST(PrintAudioStructure, DoesNotRecogniseTheExtensionEscapeAndUnknownTypes) {
  EXPECT_EQ(printed(descriptor(0)), "Code:0 Unrecognized audio code.\n");
  EXPECT_EQ(printed(descriptor(15)), "Code:15 Unrecognized audio code.\n");
  EXPECT_EQ(printed(descriptor(19)), "Code:19 Unrecognized audio code.\n");
  EXPECT_EQ(printed(descriptor(0xFFFFFFFF)), "Code:-1 Unrecognized audio code.\n");
}

TEST(PrintAudioStructure, PrintsTheLongestAndTheEmptyTexts) {
  short_audio_desc_t audio = descriptor(1, 0x7F);
  audio.pcm_bits = 7;
  EXPECT_EQ(
      printed(audio),
      "Code: 1:PCM Channels:6 Freq:32kHz 44.1kHz 48kHz 88.2kHz 96kHz 176.4kHz 192kHz  Bits:16bits 20bits 24bits \n");
  EXPECT_EQ(printed(short_audio_desc_t{1, 0, 0, 0, 0, 0, 0}),
            "Code: 1:PCM Channels:0 Freq: NoFreqSpecified Bits: NoBitsSpecified\n");
}

TEST(PrintAudioStructure, PrintsNumbersAsSigned) {
  short_audio_desc_t audio = descriptor(2);
  audio.channels = 0xFFFFFFFF;
  audio.max_bitrate = 0x80000000;
  EXPECT_EQ(printed(audio), "Code: 2:AC3 Channels:-1 Freq:44.1kHz 48kHz  Max Rate:-2147483648kHz\n");
}

TEST(PrintAudioStructure, ReportsNull) {
  EXPECT_EQ(output_of([] { print_audio_structure(nullptr); }),
            error("print_audio_structure", "\"audio\" parameter is NULL. str:(nil)"));
}

std::string stereo(u32 mask) {
  return output_of([&] { print_stereo_type(mask); });
}

TEST(PrintStereoType, PrintsOneBlankForNoStructure) {
  EXPECT_EQ(stereo(0), " ");
}

TEST(PrintStereoType, NamesStructuresInBitOrderWithoutALineEnd) {
  EXPECT_EQ(stereo(0xFF), "FP SSH TBH FA LA SSF LD LD+G ");
  const char *const names[] = {"FP ", "SSH ", "TBH ", "FA ", "LA ", "SSF ", "LD ", "LD+G "};
  for (u32 bit = 0; bit < 8; ++bit)
    EXPECT_EQ(stereo(1u << bit), names[bit]);
}

TEST(PrintStereoType, PrintsNothingForOtherBits) {
  EXPECT_EQ(stereo(0xFFFFFF00), "");
  EXPECT_EQ(stereo(0x101), "FP ");
}

std::string timings(u32 bits, const char *(*name_of)(u32), const char *title) {
  return output_of([&] { print_est_man_type(bits, name_of, title); });
}

TEST(PrintEstManType, ListsSetBitsUnderATitleHighestFirst) {
  EXPECT_EQ(timings(0xA1, est_timing_1_string, "Established"),
            "\nEstablished: 0x00A1\n\t720x400p70\n\t640x480p60\n\t800x600p60\n");
  EXPECT_EQ(timings(0x03, est_timing_2_string, "More"), "\nMore: 0x0003\n\t1024x768p75\n\t1280x1024p75\n");
}

TEST(PrintEstManType, AsksForTheNameOfEveryBitOfTheByte) {
  EXPECT_EQ(
      timings(0xFF, man_timing_string, "Manufacturer"),
      "\nManufacturer: 0x00FF\n\t1152x870p75\n\tUnknown Value\n\tUnknown Value\n\tUnknown Value\n\tUnknown Value\n"
      "\tUnknown Value\n\tUnknown Value\n\tUnknown Value\n");
}

TEST(PrintEstManType, PrintsTheTitleOnlyForBitsAboveTheByte) {
  EXPECT_EQ(timings(0x0100, est_timing_1_string, "Title"), "\nTitle: 0x0100\n");
  EXPECT_EQ(timings(0x12345601, est_timing_1_string, "Title"), "\nTitle: 0x12345601\n\t800x600p60\n");
}

TEST(PrintEstManType, PrintsNothingForNoBits) {
  EXPECT_EQ(timings(0, est_timing_1_string, "Title"), "");
}

TEST(PrintEstManType, ReportsAMissingNameFunctionBeforeAMissingTitle) {
  EXPECT_EQ(timings(0, nullptr, nullptr), bug("print_est_man_type", "string_func is:(nil)"));
}

TEST(PrintEstManType, ReportsAMissingOrEmptyTitleBeforeItLooksAtTheBits) {
  EXPECT_EQ(timings(0, est_timing_1_string, nullptr), bug("print_est_man_type", "str ptr is NULL or 0 length:(nil)"));
  EXPECT_EQ(timings(1, est_timing_1_string, ""), bug("print_est_man_type", "str ptr is NULL or 0 length:PTR"));
}

}  // namespace
}  // namespace utility_tests
