// Decisions and statuses in words.
#include <iterator>

#include "edid_composer.h"

namespace edid_composer {
namespace {

/// Tables stand in the order of their numbers, from 1 on.
struct text_t {
  u32 number;
  const char *text;
};

constexpr text_t subject_texts[] = {
    {COMPOSE_SUBJECT_VIDEO_MODE, "video mode"},
    {COMPOSE_SUBJECT_SINK_TIMING, "sink timing"},
    {COMPOSE_SUBJECT_4K_MODE, "4Kx2K mode"},
    {COMPOSE_SUBJECT_AUDIO_FORMAT, "audio format"},
    {COMPOSE_SUBJECT_NATIVE_RATE, "native rate"},
    {COMPOSE_SUBJECT_GEOMETRY_LIMIT, "geometry limit"},
    {COMPOSE_SUBJECT_CURRENT_MODE, "current mode"},
    {COMPOSE_SUBJECT_PHYSICAL_ADDRESS, "physical address"},
    {COMPOSE_SUBJECT_DEEP_COLOR, "deep colour"},
    {COMPOSE_SUBJECT_TMDS_CLOCK, "TMDS clock"},
    {COMPOSE_SUBJECT_LATENCY, "latency"},
    {COMPOSE_SUBJECT_3D, "3D"},
    {COMPOSE_SUBJECT_PADDING, "padding"},
    {COMPOSE_SUBJECT_EXTENSION_ROOM, "extension room"},
    {COMPOSE_SUBJECT_EXTENDED_MODE, "extended mode"},
    {COMPOSE_SUBJECT_LINK_RATE, "link rate"},
    {COMPOSE_SUBJECT_HDR, "HDR"},
    {COMPOSE_SUBJECT_COLORIMETRY, "colorimetry"},
    {COMPOSE_SUBJECT_YCBCR_420, "YCbCr 4:2:0"},
    {COMPOSE_SUBJECT_DEEP_COLOR_420, "deep colour in 4:2:0"},
    {COMPOSE_SUBJECT_ALLM, "ALLM"},
    {COMPOSE_SUBJECT_VRR, "VRR"},
    {COMPOSE_SUBJECT_QUANTIZATION, "quantization range"},
    {COMPOSE_SUBJECT_PASSED_BLOCK, "passed-on block"},
    {COMPOSE_SUBJECT_UHD_VIC, "UHD VIC"},
    {COMPOSE_SUBJECT_PREFERRED_TIMING, "preferred timing"},
    {COMPOSE_SUBJECT_ROOM_ITEM, "left out for room"},
};

constexpr text_t verdict_texts[] = {
    {COMPOSE_VERDICT_OFFERED, "offered"},
    {COMPOSE_VERDICT_LEFT_OUT, "left out"},
    {COMPOSE_VERDICT_CHANGED, "changed"},
};

constexpr text_t reason_texts[] = {
    {COMPOSE_REASON_SINK_HAS_IT, "the priority list names it and the sink has it"},
    {COMPOSE_REASON_PLATFORM_ADDS_IT, "the priority list names it and the addition list has it"},
    {COMPOSE_REASON_IS_CURRENT_MODE, "the platform puts it out now"},
    {COMPOSE_REASON_PADS_THE_LIST, "it stands in for missing modes"},
    {COMPOSE_REASON_NOT_IN_PRIORITY_LIST, "the priority list does not name it"},
    {COMPOSE_REASON_NOT_AVAILABLE, "neither the sink nor the addition list has it"},
    {COMPOSE_REASON_OTHER_REFRESH_FAMILY, "only lists of the other refresh family name it"},
    {COMPOSE_REASON_TALLER_THAN_SINK, "it is taller than every short video descriptor of the sink"},
    {COMPOSE_REASON_NO_ROOM, "the extension holds no more of its kind"},
    {COMPOSE_REASON_TIMING_WITHOUT_VIC, "no VIC has this timing"},
    {COMPOSE_REASON_PLATFORM_FORMAT, "the platform has it"},
    {COMPOSE_REASON_SINK_FORMAT, "it is passed through from the sink"},
    {COMPOSE_REASON_NARROWED_TO_SINK, "narrowed to what the sink takes"},
    {COMPOSE_REASON_BASIC_AUDIO, "basic audio, which no other format covers"},
    {COMPOSE_REASON_NOT_AN_AUDIO_FORMAT, "the entry is not an audio format"},
    {COMPOSE_REASON_SINK_FORMATS_ONLY, "pass-through takes the formats of the sink only"},
    {COMPOSE_REASON_PLATFORM_FORMATS_ONLY, "pass-through takes the formats of the platform only"},
    {COMPOSE_REASON_NOT_IN_SINK, "the sink has no such format"},
    {COMPOSE_REASON_DUPLICATE, "a format before it covers it"},
    {COMPOSE_REASON_AUDIO_MASK, "the caller's audio mask excludes it"},
    {COMPOSE_REASON_TYPE_WITHOUT_BIT, "no audio mask has a bit for its type"},
    {COMPOSE_REASON_RATE_OF_DETAILED_TIMING, "that of the sink's first detailed timing at 50 or 60 Hz"},
    {COMPOSE_REASON_RATE_OF_STANDARD_TIMING, "that of the sink's first standard timing at 60 Hz"},
    {COMPOSE_REASON_RATE_OF_SHORT_VIDEO, "that of the sink's first short video descriptor at 50 or 60 Hz"},
    {COMPOSE_REASON_RATE_OF_PLATFORM, "the platform's, as no timing of the sink is at 50 or 60 Hz"},
    {COMPOSE_REASON_RATE_FORCED, "the platform's rate is neither 50 nor 60"},
    {COMPOSE_REASON_GEOMETRY_OF_SINK, "the tallest short video descriptor of the sink"},
    {COMPOSE_REASON_GEOMETRY_UNLIMITED, "the platform sets no limit"},
    {COMPOSE_REASON_CURRENT_MODE_FIRST, "the platform wants it first"},
    {COMPOSE_REASON_CURRENT_MODE_IGNORED, "the platform does not want it first"},
    {COMPOSE_REASON_CURRENT_MODE_IMPLAUSIBLE, "it is not a plausible mode"},
    {COMPOSE_REASON_CURRENT_MODE_WITHOUT_VIC, "no VIC has this mode"},
    {COMPOSE_REASON_ADDRESS_OF_ROOT, "the platform is the television"},
    {COMPOSE_REASON_ADDRESS_BELOW_SINK, "the port stands in the first free place of the sink's"},
    {COMPOSE_REASON_ADDRESS_WITHOUT_SINK, "there is no HDMI sink"},
    {COMPOSE_REASON_ADDRESS_OF_SINK_INVALID, "the sink's begins with 0"},
    {COMPOSE_REASON_ADDRESS_WITHOUT_PLACE, "the sink's has no free place"},
    {COMPOSE_REASON_DEEP_COLOR_OF_PLATFORM, "the platform says so"},
    {COMPOSE_REASON_DEEP_COLOR_REQUIRED, "HDMI requires 36 bit where 30 bit is offered"},
    {COMPOSE_REASON_DEEP_COLOR_NEVER, "never offered"},
    {COMPOSE_REASON_TMDS_OVERRIDE, "the platform sets it"},
    {COMPOSE_REASON_TMDS_OF_MODES, "the offered modes need it"},
    {COMPOSE_REASON_TMDS_OF_4K_MODES, "the offered 4Kx2K modes need it"},
    {COMPOSE_REASON_TMDS_NOT_NEEDED, "the offered modes stay below 165 MHz"},
    {COMPOSE_REASON_TMDS_LARGEST, "cut to the largest that can be declared"},
    {COMPOSE_REASON_LATENCY_OF_BOTH, "the platform's and the sink's in sum"},
    {COMPOSE_REASON_LATENCY_NONE, "neither the platform nor the sink delays"},
    {COMPOSE_REASON_LATENCY_TOO_LONG, "the platform's or the sink's is longer than 500 ms"},
    {COMPOSE_REASON_3D_ALWAYS, "the caller wants it always"},
    {COMPOSE_REASON_3D_OF_SINK, "the caller wants it as the sink, which has it"},
    {COMPOSE_REASON_3D_NOT_IN_SINK, "the caller wants it as the sink, which does not have it"},
    {COMPOSE_REASON_3D_OFF, "the caller does not want it"},
    {COMPOSE_REASON_TOO_FEW_MODES, "fewer modes than an EDID has at least were chosen"},
    {COMPOSE_REASON_ENOUGH_MODES, "enough modes were chosen"},
    {COMPOSE_REASON_ROOM_ENOUGH, "every byte fits"},
    {COMPOSE_REASON_ROOM_EXCEEDED, "the extension is full: what comes last is left out"},
    {COMPOSE_REASON_BLOCK_TOO_LONG, "a data block is too long for its length field"},
    {COMPOSE_REASON_NOT_ANNOUNCED, "without a monitor name the extension is not announced"},
    {COMPOSE_REASON_ONLY_IN_420, "in 4:2:0 only, as it is too fast for the link otherwise"},
    {COMPOSE_REASON_ABOVE_RATE, "it is too fast for the link"},
    {COMPOSE_REASON_SINK_HAS_IT_IN_420, "the sink takes it in 4:2:0 only, in which it is not offered"},
    {COMPOSE_REASON_OFF, "the platform does not offer it"},
    {COMPOSE_REASON_BOX_ITSELF, "the platform does it itself"},
    {COMPOSE_REASON_AS_SINK, "as the sink, which has it"},
    {COMPOSE_REASON_SINK_WITHOUT, "as the sink, which does not have it"},
    {COMPOSE_REASON_VRR_RANGE_INVALID, "its range of refresh rates is not valid"},
    {COMPOSE_REASON_TMDS_OF_LINK, "the link carries more than the HDMI block tells"},
    {COMPOSE_REASON_TMDS_OF_EXTENDED_MODES, "the offered modes above VIC 64 need it"},
    {COMPOSE_REASON_TMDS_LIMITED, "cut to what the platform and the sink take"},
    {COMPOSE_REASON_PASSED_ON, "passed on from the sink"},
    {COMPOSE_REASON_RATE_BELOW_BLOCK, "it announces a mode that is too fast for the link"},
    {COMPOSE_REASON_VRR_CHANGED, "the sink's range of refresh rates is not offered unchanged"},
    {COMPOSE_REASON_LINK_RATE_OF_BOX, "the platform's receiver takes no more"},
    {COMPOSE_REASON_LINK_RATE_OF_SINK, "the sink takes no more"},
    {COMPOSE_REASON_LINK_RATE_OF_ADDED_MODES, "modes that the platform makes itself need it"},
    {COMPOSE_REASON_NO_MODE_IN_420, "no offered mode may be sent in it"},
    {COMPOSE_REASON_RATE_BELOW_DEPTH, "no mode in 4:2:0 leaves room for it on the link"},
    {COMPOSE_REASON_DEEP_COLOR_420_REQUIRED, "HDMI requires 30 bit where 36 bit is offered"},
    {COMPOSE_REASON_UHD_VIC_OF_MODES, "a 4Kx2K mode is offered by its HDMI_VIC and by its VIC"},
    {COMPOSE_REASON_NO_UHD_VIC, "no 4Kx2K mode is offered by its HDMI_VIC and by its VIC"},
    {COMPOSE_REASON_NO_FORUM_BLOCK, "nothing else calls for the HDMI Forum block"},
    {COMPOSE_REASON_FIRST_EXTENDED_MODE, "the first mode above VIC 64 that a detailed timing can hold"},
    {COMPOSE_REASON_NO_EXTENDED_TIMING, "no offered mode above VIC 64 fits a detailed timing"},
};

constexpr text_t sink_status_texts[] = {
    {COMPOSE_SINK_NONE, "none given"},
    {COMPOSE_SINK_READ, "read"},
    {COMPOSE_SINK_LENGTH_INVALID, "not read: the length is no multiple of 128 bytes"},
    {COMPOSE_SINK_HEADER_INVALID, "base block refused: header"},
    {COMPOSE_SINK_CHECKSUM_INVALID, "base block refused: checksum"},
    {COMPOSE_SINK_VERSION_UNSUPPORTED, "base block refused: version below 1.3"},
    {COMPOSE_SINK_DESCRIPTOR_INVALID, "base block read up to a malformed descriptor"},
    {COMPOSE_SINK_OUT_OF_MEMORY, "base block not read to its end: out of memory"},
};

constexpr text_t extension_status_texts[] = {
    {COMPOSE_EXTENSION_NOT_LOOKED_AT, "not looked at"},
    {COMPOSE_EXTENSION_NOT_ANNOUNCED, "none announced"},
    {COMPOSE_EXTENSION_READ, "read"},
    {COMPOSE_EXTENSION_MISSING, "announced but missing"},
    {COMPOSE_EXTENSION_NOT_CEA, "refused: not a CEA-861 extension"},
    {COMPOSE_EXTENSION_REVISION_UNSUPPORTED, "refused: revision other than 3"},
    {COMPOSE_EXTENSION_CHECKSUM_INVALID, "refused: checksum"},
    {COMPOSE_EXTENSION_OFFSET_UNSUPPORTED, "refused: detailed timings after byte 110"},
    {COMPOSE_EXTENSION_MALFORMED, "read up to a data block that overruns its collection"},
    {COMPOSE_EXTENSION_OUT_OF_MEMORY, "not read to its end: out of memory"},
};

template <std::size_t count>
constexpr bool are_in_order(const text_t (&texts)[count]) {
  for (u32 i = 0; i < count; ++i) {
    if (texts[i].number != i + 1) return false;
  }
  return true;
}

/// The text of a number; "unknown" for one that the table does not hold.
template <const auto &texts>
const char *text_of(u32 number) {
  static_assert(are_in_order(texts));
  return number >= 1 && number <= std::size(texts) ? texts[number - 1].text : "unknown";
}

}  // namespace
}  // namespace edid_composer

using namespace edid_composer;  // NOLINT(google-build-using-namespace): the operations below are the namespace's API

const char *compose_subject_string(u32 subject) {
  return text_of<subject_texts>(subject);
}

const char *compose_verdict_string(u32 verdict) {
  return text_of<verdict_texts>(verdict);
}

const char *compose_reason_string(u32 reason) {
  return text_of<reason_texts>(reason);
}

const char *compose_sink_status_string(u32 status) {
  return text_of<sink_status_texts>(status);
}

const char *compose_extension_status_string(u32 status) {
  return text_of<extension_status_texts>(status);
}
