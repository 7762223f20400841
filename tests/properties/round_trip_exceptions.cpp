#include "round_trip_exceptions.h"

#include <algorithm>
#include <cstring>

namespace properties {
namespace {

constexpr u32 longest_text = 13;
constexpr std::size_t most_video_in_header = 31;
constexpr u32 most_3d_modes = 16;
constexpr u32 longest_block = 31;
constexpr u32 room = 127;

// Base block.

void only_good_records(const encoding_t &, plain_record_t &expected) {
  expected.scalars.valid = 1;
}

void digital(const encoding_t &, plain_record_t &expected) {
  expected.scalars.digital = 1;
}

void five_bit_letters(const encoding_t &, plain_record_t &expected) {
  for (std::size_t i = 0; i < 3; ++i) {
    char &letter = expected.scalars.manufacturer[i];
    letter = static_cast<char>(0x40 + (letter & 0x1F));
  }
}

void known_size(const encoding_t &, plain_record_t &expected) {
  if (expected.scalars.h_size_cm != 0 && expected.scalars.v_size_cm != 0) return;
  expected.scalars.h_size_cm = 160;
  expected.scalars.v_size_cm = 90;
}

void eight_standard_timings(const encoding_t &, plain_record_t &expected) {
  if (expected.std_timings.size() > 8) expected.std_timings.resize(8);
}

void unused_slot(const encoding_t &, plain_record_t &expected) {
  const auto is_unused = [](const std_timing_t &timing) {
    return timing.h_active == 256 && timing.aspect_ratio == 0 && timing.refresh_rate == 61;
  };
  std::erase_if(expected.std_timings, is_unused);
}

void clock_in_10_khz(const encoding_t &, plain_record_t &expected) {
  for (detailed_timing_t &timing : expected.timings)
    timing.pixel_clock = (timing.pixel_clock + 5000) / 10000 * 10000;
}

void no_stereo_timings(const encoding_t &, plain_record_t &expected) {
  for (detailed_timing_t &timing : expected.timings)
    timing.stereo = 0;
}

template <std::size_t size>
void rewrite(char (&field)[size], const std::string &text) {
  std::memset(field, 0, size);
  std::memcpy(field, text.data(), text.size());
}

template <std::size_t size>
void rewrite_as_descriptor(char (&field)[size]) {
  std::string text = text_of(field, size);
  if (!is_written(text)) {
    rewrite(field, "");
    return;
  }
  while (text.size() > 1 && text.back() == ' ')
    text.pop_back();
  rewrite(field, text.substr(0, text.find('\n')));
}

void texts_of_descriptors(const encoding_t &, plain_record_t &expected) {
  rewrite_as_descriptor(expected.scalars.monitor_name);
  rewrite_as_descriptor(expected.scalars.serial_string);
}

void no_data_text(const encoding_t &, plain_record_t &expected) {
  rewrite(expected.scalars.data_string, "");
}

bool has_limits(const edid_t &edid) {
  return edid.min_v_rate != 0 && edid.max_v_rate != 0 && edid.min_h_rate != 0 && edid.max_h_rate != 0 &&
         edid.max_pixel_clock != 0;
}

bool has_name(const plain_record_t &record) {
  return is_written(text_of(record.scalars.monitor_name, sizeof record.scalars.monitor_name));
}

void all_limits_or_none(const encoding_t &, plain_record_t &expected) {
  edid_t &edid = expected.scalars;
  if (has_limits(edid)) return;
  edid.min_v_rate = edid.max_v_rate = edid.min_h_rate = edid.max_h_rate = 0;
  edid.max_pixel_clock = 0;
}

void limit_in_10_mhz(const encoding_t &, plain_record_t &expected) {
  expected.scalars.max_pixel_clock = expected.scalars.max_pixel_clock / 10 * 10;
}

void count_and_checksum(const encoding_t &encoding, plain_record_t &expected) {
  const bool in_place = has_name(encoding.record) && has_limits(encoding.record.scalars);
  expected.scalars.extension_count = in_place ? 1 : 0;
  expected.scalars.checksum = in_place ? encoding.bytes[127] : u8{0};
}

void count_and_checksum_as_timing(const encoding_t &encoding, plain_record_t &expected) {
  const u32 descriptors = 2u + has_name(encoding.record) + has_limits(encoding.record.scalars);
  if (descriptors == 4) return;
  detailed_timing_t timing{};
  timing.valid = 1;
  timing.pixel_clock = (1 + 256u * encoding.bytes[54 + 18 * descriptors + 1]) * 10000;
  timing.progressive = 1;
  expected.timings.push_back(timing);
}

// Extension.

void fixed_capabilities(const encoding_t &, plain_record_t &expected) {
  edid_t &edid = expected.scalars;
  edid.basic_audio = edid.ycbcr_444 = edid.ycbcr_422 = edid.hdmi_present = 1;
}

void timing_of_vic_1(const encoding_t &, plain_record_t &expected) {
  expected.timings.push_back(test_support::timing_of_vic(1));
}

void line_feed_as_timing(const encoding_t &encoding, plain_record_t &expected) {
  const std::string serial = text_of(encoding.record.scalars.serial_string, 14);
  if (!is_written(serial) || serial.size() < longest_text || serial[longest_text - 1] == ' ') return;
  const u32 behind_serial = encoding.bytes[130] + 2u * 18;
  if (behind_serial + 18 >= 128) return;
  detailed_timing_t timing{};
  timing.valid = 1;
  timing.pixel_clock = '\n' * 10000;
  timing.progressive = 1;
  expected.timings.push_back(timing);
}

void native_modes(const encoding_t &encoding, plain_record_t &expected) {
  for (short_video_desc_t &video : expected.video)
    video.native = encoding.native_bit && video.native != 0 ? 1 : 0;
  if (encoding.native_bit && !expected.video.empty()) expected.video.front().native = 1;
}

void one_mode_at_least(const encoding_t &, plain_record_t &expected) {
  if (expected.video.empty()) expected.video.push_back({0, 1, 0});
}

bool has_3d(const plain_record_t &record) {
  return record.scalars.hdmi_video_present != 0 && record.scalars.hdmi_3d_present != 0;
}

u32 mandatory_stereo(u32 vic) {
  for (const short_video_desc_t &mandatory : _3d_man_modes) {
    if (mandatory.vic == vic) return mandatory.stereo;
  }
  return 0;
}

void structures_without_3d(const encoding_t &encoding, plain_record_t &expected) {
  if (has_3d(encoding.record)) return;
  for (short_video_desc_t &video : expected.video)
    video.stereo = 0;
}

void structures_of_sixteen_modes(const encoding_t &, plain_record_t &expected) {
  for (std::size_t i = most_3d_modes; i < expected.video.size(); ++i)
    expected.video[i].stereo = 0;
}

void mandatory_structures(const encoding_t &, plain_record_t &expected) {
  for (short_video_desc_t &video : expected.video)
    video.stereo &= ~mandatory_stereo(video.vic);
}

void ten_audio_formats(const encoding_t &, plain_record_t &expected) {
  if (expected.audio.size() > 10) expected.audio.resize(10);
}

void one_audio_format_at_least(const encoding_t &, plain_record_t &expected) {
  if (expected.audio.empty()) expected.audio.push_back({1, 2, 7, 5, 0, 0, 0});
}

void bitrate_in_8_kbit(const encoding_t &, plain_record_t &expected) {
  for (short_audio_desc_t &audio : expected.audio)
    audio.max_bitrate = audio.max_bitrate / 8 * 8;
}

void address_of_nibbles(const encoding_t &, plain_record_t &expected) {
  for (u8 &component : expected.scalars.physical_address)
    component &= 0x0F;
}

void tmds_clock_in_5_mhz(const encoding_t &, plain_record_t &expected) {
  expected.scalars.max_tmds_clock = expected.scalars.max_tmds_clock / 5 * 5;
}

constexpr u16 edid_t::*latencies[] = {&edid_t::video_latency, &edid_t::audio_latency, &edid_t::i_video_latency,
                                      &edid_t::i_audio_latency};

void even_latencies(const encoding_t &, plain_record_t &expected) {
  for (u16 edid_t::*latency : latencies) {
    u16 &ms = expected.scalars.*latency;
    if (ms <= 500) ms = static_cast<u16>(ms / 2 * 2);
  }
}

void long_latencies(const encoding_t &, plain_record_t &expected) {
  for (u16 edid_t::*latency : latencies) {
    u16 &ms = expected.scalars.*latency;
    if (ms > 500) ms = ms == 65535 ? 508 : 500;
  }
}

void interlaced_latencies(const encoding_t &encoding, plain_record_t &expected) {
  if (encoding.record.scalars.i_video_latency != 0 || encoding.record.scalars.i_audio_latency != 0) return;
  expected.scalars.i_video_latency = expected.scalars.video_latency;
  expected.scalars.i_audio_latency = expected.scalars.audio_latency;
}

void video_part_only_when_present(const encoding_t &, plain_record_t &expected) {
  edid_t &edid = expected.scalars;
  if (edid.hdmi_video_present != 0) return;
  edid.hdmi_3d_present = edid.image_size = edid.hdmi_vic_len = 0;
}

void codes_behind_the_last(const encoding_t &, plain_record_t &expected) {
  for (std::size_t i = expected.scalars.hdmi_vic_len; i < 7; ++i)
    expected.scalars.hdmi_vic[i] = 0;
}

void seven_bit_codes(const encoding_t &, plain_record_t &expected) {
  for (u32 &code : expected.scalars.hdmi_vic)
    code &= 0x7F;
}

// Of a record whose extension does not decode, the base block is left.
void drop_extension(plain_record_t &expected) {
  edid_t only_base = expected.scalars;
  const auto *const first = reinterpret_cast<const u8 *>(&only_base);
  const auto offset = static_cast<std::size_t>(&only_base.underscan - first);
  std::memset(&only_base.underscan, 0, sizeof(edid_t) - offset);
  std::memset(only_base.serial_string, 0, sizeof only_base.serial_string);
  expected.scalars = only_base;
  expected.video.clear();
  expected.audio.clear();
  const std::size_t in_base_block = 2 + (only_base.extension_count == 0 ? 1 : 0);
  expected.timings.resize(in_base_block);
}

u32 vendor_block_length(const plain_record_t &record) {
  const edid_t &edid = record.scalars;
  const bool interlaced = edid.i_video_latency != 0 || edid.i_audio_latency != 0;
  const bool progressive = interlaced || edid.video_latency != 0 || edid.audio_latency != 0;
  u32 length = 8 + (progressive ? 2 : 0) + (interlaced ? 2 : 0);
  if (edid.hdmi_video_present == 0) return length;
  length += 2 + edid.hdmi_vic_len;
  if (!has_3d(record)) return length;
  for (std::size_t i = 0; i < record.video.size() && i < most_3d_modes; ++i) {
    u32 stereo = record.video[i].stereo & ~mandatory_stereo(record.video[i].vic);
    if ((stereo & STEREO_SIDE_BY_SIDE_HALF) != 0) ++length;  // its detail
    for (; stereo != 0; stereo &= stereo - 1)
      ++length;
  }
  return length;
}

void video_block_wraps(const encoding_t &encoding, plain_record_t &expected) {
  if (encoding.record.video.size() > most_video_in_header) drop_extension(expected);
}

void vendor_block_wraps(const encoding_t &encoding, plain_record_t &expected) {
  if (vendor_block_length(encoding.record) > longest_block) drop_extension(expected);
}

void extension_overflows(const encoding_t &encoding, plain_record_t &expected) {
  if (extension_size(encoding.record) > room) drop_extension(expected);
}

constexpr exception_t all_exceptions[] = {
    {"valid", "is set by the decoder", only_good_records},
    {"digital", "is always declared", digital},
    {"manufacturer", "is packed into five bits a letter", five_bit_letters},
    {"unknown image size", "is replaced by one of 16:9", known_size},
    {"standard timings behind the eighth", "have no slot", eight_standard_timings},
    {"standard timing 256 x 256 at 61 Hz", "has the code of an unused slot", unused_slot},
    {"pixel clock", "is stored in units of 10 kHz, rounded", clock_in_10_khz},
    {"stereo of detailed timings", "is never written", no_stereo_timings},
    {"data text", "is never written", no_data_text},
    {"one range limit missing", "leaves out the whole descriptor", all_limits_or_none},
    {"maximum pixel clock", "is stored in units of 10 MHz", limit_in_10_mhz},
    {"extension count and checksum", "are the encoder's, and stand elsewhere without name or limits",
     count_and_checksum},
    {"extension count and checksum behind fewer descriptors", "read back as a detailed timing",
     count_and_checksum_as_timing},
    {"texts", "begin with no blank, have two characters, lose blanks at their end and what follows a line feed",
     texts_of_descriptors},
    {"basic audio, YCbCr, HDMI", "are always declared", fixed_capabilities},
    {"detailed timing of the extension", "is always that of VIC 1", timing_of_vic_1},
    {"line feed behind a full serial text", "reads back as a detailed timing where there is room for one",
     line_feed_as_timing},
    {"empty video list", "is written as VIC 1", one_mode_at_least},
    {"native", "is the platform's to allow, and then the first mode's too", native_modes},
    {"3D structures without 3D", "are not written", structures_without_3d},
    {"3D structures behind the sixteenth mode", "cannot be written", structures_of_sixteen_modes},
    {"mandatory 3D structures", "are declared by the 3D flag alone", mandatory_structures},
    {"audio formats behind the tenth", "are left out", ten_audio_formats},
    {"empty audio list", "is written as basic audio", one_audio_format_at_least},
    {"bit rate", "is stored in units of 8 kHz", bitrate_in_8_kbit},
    {"physical address", "has four bits a component", address_of_nibbles},
    {"TMDS clock", "is stored in units of 5 MHz", tmds_clock_in_5_mhz},
    {"latency", "is stored in units of 2 ms", even_latencies},
    {"latency above 500 ms", "is stored as 500 ms, and 65535 as the code that reads as 508 ms", long_latencies},
    {"no interlaced latency", "reads back as the progressive one", interlaced_latencies},
    {"3D and 4Kx2K without HDMI video", "are not written", video_part_only_when_present},
    {"4Kx2K codes behind the last", "are not written", codes_behind_the_last},
    {"4Kx2K codes", "have seven bits", seven_bit_codes},
    {"more than 31 modes", "are more than the video block's header can say", video_block_wraps},
    {"an HDMI block of more than 31 bytes", "is longer than its header can say", vendor_block_wraps},
    {"more than 127 bytes of extension", "do not fit", extension_overflows},
};

}  // namespace

std::span<const exception_t> exceptions() {
  return all_exceptions;
}

u32 extension_size(const plain_record_t &record) {
  constexpr u32 header = 4;
  constexpr u32 speakers = 4;
  constexpr u32 descriptor = 18;
  const auto video = static_cast<u32>(std::clamp<std::size_t>(record.video.size(), 1, 32));
  const auto audio = static_cast<u32>(std::clamp<std::size_t>(record.audio.size(), 1, 10));
  const edid_t &edid = record.scalars;
  const u32 colorimetry = edid.xvycc601 != 0 || edid.xvycc709 != 0 ? 4 : 0;
  const u32 serial = is_written(text_of(edid.serial_string, sizeof edid.serial_string)) ? descriptor : 0;
  return header + speakers + 1 + video + 1 + 3 * audio + 1 + vendor_block_length(record) + colorimetry + descriptor +
         serial;
}

bool is_extension_decodable(const plain_record_t &record) {
  return record.video.size() <= most_video_in_header && vendor_block_length(record) <= longest_block &&
         extension_size(record) <= room;
}

std::string text_of(const char *field, std::size_t size) {
  return {field, strnlen(field, std::min<std::size_t>(size, longest_text))};
}

bool is_written(const std::string &text) {
  return text.size() >= 2 && text.front() != ' ';
}

}  // namespace properties
