// The words for subjects, verdicts, reasons and statuses, to the letter: programs compare them.
#include <gtest/gtest.h>

#include <set>
#include <string>
#include <vector>

#include "edid_composer.h"

namespace {

struct name_t {
  u32 number;
  const char *text;
};

using name_function_t = const char *(*)(u32);

void expect_names(name_function_t name_of, const std::vector<name_t> &names) {
  std::set<std::string> texts;
  for (const auto &[number, text] : names) {
    EXPECT_STREQ(name_of(number), text) << number;
    EXPECT_TRUE(texts.insert(name_of(number)).second) << "another one has the text " << text;
    EXPECT_EQ(name_of(number), name_of(number)) << "the text is a static one";
  }
  const auto behind = static_cast<u32>(names.size()) + 1;
  for (const u32 number : {0U, behind, behind + 1, 0x7FFFFFFFU, 0x80000000U, 0xFFFFFFFFU})
    EXPECT_STREQ(name_of(number), "unknown") << number;
}

TEST(ObservedNames, OfSubjects) {
  expect_names(compose_subject_string, {{1, "video mode"},
                                        {2, "sink timing"},
                                        {3, "4Kx2K mode"},
                                        {4, "audio format"},
                                        {5, "native rate"},
                                        {6, "geometry limit"},
                                        {7, "current mode"},
                                        {8, "physical address"},
                                        {9, "deep colour"},
                                        {10, "TMDS clock"},
                                        {11, "latency"},
                                        {12, "3D"},
                                        {13, "padding"},
                                        {14, "extension room"},
                                        {15, "extended mode"},
                                        {16, "link rate"},
                                        {17, "HDR"},
                                        {18, "colorimetry"},
                                        {19, "YCbCr 4:2:0"},
                                        {20, "deep colour in 4:2:0"},
                                        {21, "ALLM"},
                                        {22, "VRR"},
                                        {23, "quantization range"},
                                        {24, "passed-on block"},
                                        {25, "UHD VIC"},
                                        {26, "preferred timing"},
                                        {27, "left out for room"}});
}

TEST(ObservedNames, OfVerdicts) {
  expect_names(compose_verdict_string, {{1, "offered"}, {2, "left out"}, {3, "changed"}});
}

TEST(ObservedNames, OfReasons) {
  expect_names(compose_reason_string, {
                                          {1, "the priority list names it and the sink has it"},
                                          {2, "the priority list names it and the addition list has it"},
                                          {3, "the platform puts it out now"},
                                          {4, "it stands in for missing modes"},
                                          {5, "the priority list does not name it"},
                                          {6, "neither the sink nor the addition list has it"},
                                          {7, "only lists of the other refresh family name it"},
                                          {8, "it is taller than every short video descriptor of the sink"},
                                          {9, "the extension holds no more of its kind"},
                                          {10, "no VIC has this timing"},
                                          {11, "the platform has it"},
                                          {12, "it is passed through from the sink"},
                                          {13, "narrowed to what the sink takes"},
                                          {14, "basic audio, which no other format covers"},
                                          {15, "the entry is not an audio format"},
                                          {16, "pass-through takes the formats of the sink only"},
                                          {17, "pass-through takes the formats of the platform only"},
                                          {18, "the sink has no such format"},
                                          {19, "a format before it covers it"},
                                          {20, "the caller's audio mask excludes it"},
                                          {21, "no audio mask has a bit for its type"},
                                          {22, "that of the sink's first detailed timing at 50 or 60 Hz"},
                                          {23, "that of the sink's first standard timing at 60 Hz"},
                                          {24, "that of the sink's first short video descriptor at 50 or 60 Hz"},
                                          {25, "the platform's, as no timing of the sink is at 50 or 60 Hz"},
                                          {26, "the platform's rate is neither 50 nor 60"},
                                          {27, "the tallest short video descriptor of the sink"},
                                          {28, "the platform sets no limit"},
                                          {29, "the platform wants it first"},
                                          {30, "the platform does not want it first"},
                                          {31, "it is not a plausible mode"},
                                          {32, "no VIC has this mode"},
                                          {33, "the platform is the television"},
                                          {34, "the port stands in the first free place of the sink's"},
                                          {35, "there is no HDMI sink"},
                                          {36, "the sink's begins with 0"},
                                          {37, "the sink's has no free place"},
                                          {38, "the platform says so"},
                                          {39, "HDMI requires 36 bit where 30 bit is offered"},
                                          {40, "never offered"},
                                          {41, "the platform sets it"},
                                          {42, "the offered modes need it"},
                                          {43, "the offered 4Kx2K modes need it"},
                                          {44, "the offered modes stay below 165 MHz"},
                                          {45, "cut to the largest that can be declared"},
                                          {46, "the platform's and the sink's in sum"},
                                          {47, "neither the platform nor the sink delays"},
                                          {48, "the platform's or the sink's is longer than 500 ms"},
                                          {49, "the caller wants it always"},
                                          {50, "the caller wants it as the sink, which has it"},
                                          {51, "the caller wants it as the sink, which does not have it"},
                                          {52, "the caller does not want it"},
                                          {53, "fewer modes than an EDID has at least were chosen"},
                                          {54, "enough modes were chosen"},
                                          {55, "every byte fits"},
                                          {56, "the extension is full: what comes last is left out"},
                                          {57, "a data block is too long for its length field"},
                                          {58, "without a monitor name the extension is not announced"},
                                          {59, "in 4:2:0 only, as it is too fast for the link otherwise"},
                                          {60, "it is too fast for the link"},
                                          {61, "the sink takes it in 4:2:0 only, in which it is not offered"},
                                          {62, "the platform does not offer it"},
                                          {63, "the platform does it itself"},
                                          {64, "as the sink, which has it"},
                                          {65, "as the sink, which does not have it"},
                                          {66, "its range of refresh rates is not valid"},
                                          {67, "the link carries more than the HDMI block tells"},
                                          {68, "the offered modes above VIC 64 need it"},
                                          {69, "cut to what the platform and the sink take"},
                                          {70, "passed on from the sink"},
                                          {71, "it announces a mode that is too fast for the link"},
                                          {72, "the sink's range of refresh rates is not offered unchanged"},
                                          {73, "the platform's receiver takes no more"},
                                          {74, "the sink takes no more"},
                                          {75, "modes that the platform makes itself need it"},
                                          {76, "no offered mode may be sent in it"},
                                          {77, "no mode in 4:2:0 leaves room for it on the link"},
                                          {78, "HDMI requires 30 bit where 36 bit is offered"},
                                          {79, "a 4Kx2K mode is offered by its HDMI_VIC and by its VIC"},
                                          {80, "no 4Kx2K mode is offered by its HDMI_VIC and by its VIC"},
                                          {81, "nothing else calls for the HDMI Forum block"},
                                          {82, "the first mode above VIC 64 that a detailed timing can hold"},
                                          {83, "no offered mode above VIC 64 fits a detailed timing"},
                                      });
}

// Stored records and programs in other languages rely on the numbers.
static_assert(COMPOSE_SUBJECT_VIDEO_MODE == 1 && COMPOSE_SUBJECT_EXTENSION_ROOM == 14);
static_assert(COMPOSE_VERDICT_OFFERED == 1 && COMPOSE_VERDICT_LEFT_OUT == 2 && COMPOSE_VERDICT_CHANGED == 3);
static_assert(COMPOSE_REASON_SINK_HAS_IT == 1 && COMPOSE_REASON_NO_ROOM == 9 && COMPOSE_REASON_PLATFORM_FORMAT == 11 &&
              COMPOSE_REASON_TYPE_WITHOUT_BIT == 21 && COMPOSE_REASON_RATE_OF_DETAILED_TIMING == 22 &&
              COMPOSE_REASON_GEOMETRY_OF_SINK == 27 && COMPOSE_REASON_CURRENT_MODE_FIRST == 29 &&
              COMPOSE_REASON_ADDRESS_OF_ROOT == 33 && COMPOSE_REASON_DEEP_COLOR_OF_PLATFORM == 38 &&
              COMPOSE_REASON_TMDS_OVERRIDE == 41 && COMPOSE_REASON_LATENCY_OF_BOTH == 46 &&
              COMPOSE_REASON_3D_ALWAYS == 49 && COMPOSE_REASON_TOO_FEW_MODES == 53 &&
              COMPOSE_REASON_ROOM_ENOUGH == 55 && COMPOSE_REASON_NOT_ANNOUNCED == 58);
static_assert(COMPOSE_ORIGIN_DETAILED_TIMING == 0x1 && COMPOSE_ORIGIN_SINK_AUDIO == 0x10 &&
              COMPOSE_ORIGIN_PRIORITY_LIST == 0x20 && COMPOSE_ORIGIN_LIBRARY == 0x800);

TEST(ResultNames, OfSinkStatuses) {
  expect_names(compose_sink_status_string,
               {{COMPOSE_SINK_NONE, "none given"},
                {COMPOSE_SINK_READ, "read"},
                {COMPOSE_SINK_LENGTH_INVALID, "not read: the length is no multiple of 128 bytes"},
                {COMPOSE_SINK_HEADER_INVALID, "base block refused: header"},
                {COMPOSE_SINK_CHECKSUM_INVALID, "base block refused: checksum"},
                {COMPOSE_SINK_VERSION_UNSUPPORTED, "base block refused: version below 1.3"},
                {COMPOSE_SINK_DESCRIPTOR_INVALID, "base block read up to a malformed descriptor"},
                {COMPOSE_SINK_OUT_OF_MEMORY, "base block not read to its end: out of memory"}});
}

TEST(ResultNames, OfExtensionStatuses) {
  expect_names(compose_extension_status_string,
               {{COMPOSE_EXTENSION_NOT_LOOKED_AT, "not looked at"},
                {COMPOSE_EXTENSION_NOT_ANNOUNCED, "none announced"},
                {COMPOSE_EXTENSION_READ, "read"},
                {COMPOSE_EXTENSION_MISSING, "announced but missing"},
                {COMPOSE_EXTENSION_NOT_CEA, "refused: not a CEA-861 extension"},
                {COMPOSE_EXTENSION_REVISION_UNSUPPORTED, "refused: revision other than 3"},
                {COMPOSE_EXTENSION_CHECKSUM_INVALID, "refused: checksum"},
                {COMPOSE_EXTENSION_OFFSET_UNSUPPORTED, "refused: detailed timings after byte 110"},
                {COMPOSE_EXTENSION_MALFORMED, "read up to a data block that overruns its collection"},
                {COMPOSE_EXTENSION_OUT_OF_MEMORY, "not read to its end: out of memory"}});
}

}  // namespace
