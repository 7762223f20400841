#include <algorithm>
#include <cstring>

#include "plain_record.h"

namespace properties {
namespace {

template <std::size_t size>
void set_text(char (&field)[size], const std::string &text) {
  std::memset(field, 0, size);
  std::memcpy(field, text.data(), std::min(size, text.size()));
}

void fill_base_block(random_source_t &random, edid_t *edid) {
  for (std::size_t i = 0; i < 3; ++i) {
    // Sometimes what is no capital letter.
    edid->manufacturer[i] =
        static_cast<char>(random.chance(80) ? random.between('A', 'Z') : random.between(0x20, 0x7E));
  }
  edid->product_code = random.between(0, 0xFFFF);
  edid->serial_number = random.between(0, 0xFFFFFFFF);
  edid->week = random.byte();
  edid->year = random.between(1990, 2245);
  edid->version = 1;
  edid->revision = static_cast<u8>(random.between(3, 255));
  edid->digital = random.flag();
  edid->h_size_cm = random.chance(10) ? u8{0} : random.byte();
  edid->v_size_cm = random.chance(10) ? u8{0} : random.byte();
  edid->gamma = random.byte();
  for (u8 edid_t::*flag : {&edid_t::valid, &edid_t::standby, &edid_t::suspend, &edid_t::active_off,
                           &edid_t::standard_colorspace, &edid_t::preferred_timing, &edid_t::gtf}) {
    edid->*flag = random.flag();
  }
  for (u32 edid_t::*coordinate : {&edid_t::red_x, &edid_t::red_y, &edid_t::green_x, &edid_t::green_y, &edid_t::blue_x,
                                  &edid_t::blue_y, &edid_t::white_x, &edid_t::white_y}) {
    edid->*coordinate = random.between(0, 1023);
  }
  edid->est_timings_1 = random.byte();
  edid->est_timings_2 = random.byte();
  edid->man_timings = random.byte();
  set_text(edid->serial_string, random_text(random, 14));
  set_text(edid->data_string, random_text(random, 13));
  set_text(edid->monitor_name, random_text(random, 14));
  for (u8 edid_t::*rate : {&edid_t::min_v_rate, &edid_t::max_v_rate, &edid_t::min_h_rate, &edid_t::max_h_rate}) {
    edid->*rate = random.chance(3) ? u8{0} : random.byte();
  }
  edid->max_pixel_clock = random.chance(3) ? 0 : random.between(1, 2559);
  edid->extension_count = random.byte();
  edid->checksum = random.byte();
}

u16 random_latency(random_source_t &random) {
  if (random.chance(30)) return 0;
  if (random.chance(10)) return 65535;
  return static_cast<u16>(random.between(0, random.chance(80) ? 500 : 65535));
}

void fill_extension(random_source_t &random, edid_t *edid) {
  for (u8 edid_t::*flag :
       {&edid_t::underscan, &edid_t::basic_audio, &edid_t::ycbcr_444, &edid_t::ycbcr_422, &edid_t::hdmi_present,
        &edid_t::dc_48bit, &edid_t::dc_36bit, &edid_t::dc_30bit, &edid_t::dc_y444, &edid_t::dvi_dual,
        &edid_t::supports_ai, &edid_t::cnc0, &edid_t::cnc1, &edid_t::cnc2, &edid_t::cnc3, &edid_t::hdmi_video_present,
        &edid_t::hdmi_3d_present, &edid_t::xvycc601, &edid_t::xvycc709}) {
    edid->*flag = random.flag();
  }
  for (u8 &speaker : edid->speaker)
    speaker = random.byte();
  for (u8 &component : edid->physical_address)
    component = random.chance(95) ? static_cast<u8>(random.between(0, 15)) : random.byte();
  edid->max_tmds_clock = random.between(0, 1279);
  for (u16 edid_t::*latency :
       {&edid_t::video_latency, &edid_t::audio_latency, &edid_t::i_video_latency, &edid_t::i_audio_latency}) {
    edid->*latency = random_latency(random);
  }
  if (random.chance(40)) edid->i_video_latency = edid->i_audio_latency = 0;
  edid->image_size = static_cast<u8>(random.between(0, 3));
  edid->hdmi_vic_len = static_cast<u8>(random.between(0, random.chance(80) ? 3 : 7));
  for (u32 &code : edid->hdmi_vic)
    code = random.chance(90) ? random.between(1, 4) : random.byte();
}

std_timing_t random_std_timing(random_source_t &random) {
  if (random.chance(5)) return {256, 0, 61};
  return {8 * random.between(31, 286), random.between(0, 3), random.between(60, 123)};
}

short_video_desc_t random_video(random_source_t &random, u32 percent_3d) {
  // The modes with mandatory 3D structures as often as all others.
  const u32 vic = random.chance(50) ? random.one_of(std::array<u32, 6>{4, 5, 19, 20, 32, 16}) : random.between(1, 127);
  const u32 stereo = random.chance(percent_3d) ? random.byte() & random.byte() & random.byte() : 0;
  return {random.flag(), vic, stereo};
}

short_audio_desc_t random_audio(random_source_t &random) {
  short_audio_desc_t audio{};
  audio.type = random.between(1, 17);
  if (audio.type > 14) ++audio.type;
  audio.channels = random.between(1, 8);
  audio.frequencies = random.between(0, 127);
  if (audio.type == 1) audio.pcm_bits = random.between(0, 7);
  if (audio.type >= 2 && audio.type <= 8) audio.max_bitrate = random.between(0, 2047);
  if (audio.type >= 9 && audio.type <= 13) audio.value = random.byte();
  if (audio.type == 14) audio.wma_profile = random.between(0, 7);
  return audio;
}

// Mostly few, sometimes none, sometimes more than there is room for.
u32 random_count(random_source_t &random, u32 few, u32 many) {
  if (random.chance(10)) return 0;
  return random.chance(85) ? random.between(1, few) : random.between(few, many);
}

/// A text of which no character is lost.
std::string canonical_text(random_source_t &random, u32 longest) {
  std::string text(random.between(2, longest), '\0');
  for (char &character : text)
    character = static_cast<char>(random.between('!', '~'));
  return text;
}

void make_base_block_canonical(random_source_t &random, edid_t *edid) {
  edid->valid = edid->digital = edid->extension_count = 1;
  for (std::size_t i = 0; i < 3; ++i)
    edid->manufacturer[i] = static_cast<char>(random.between('A', 'Z'));
  for (u8 edid_t::*size_or_rate : {&edid_t::h_size_cm, &edid_t::v_size_cm, &edid_t::min_v_rate, &edid_t::max_v_rate,
                                   &edid_t::min_h_rate, &edid_t::max_h_rate}) {
    edid->*size_or_rate = static_cast<u8>(random.between(1, 255));
  }
  edid->max_pixel_clock = 10 * random.between(1, 255);
  set_text(edid->monitor_name, canonical_text(random, 13));
  set_text(edid->serial_string, canonical_text(random, 12));  // A full one is followed by what reads as a timing.
  set_text(edid->data_string, "");
}

void make_extension_canonical(random_source_t &random, edid_t *edid) {
  edid->basic_audio = edid->ycbcr_444 = edid->ycbcr_422 = edid->hdmi_present = 1;
  for (u8 &component : edid->physical_address)
    component &= 15;
  edid->max_tmds_clock = 5 * random.between(0, 255);
  // Without interlaced latencies, the progressive ones stand for both.
  const bool has_interlaced = random.chance(50);
  edid->video_latency = static_cast<u16>(2 * random.between(0, 250));
  edid->audio_latency = static_cast<u16>(2 * random.between(0, 250));
  edid->i_video_latency = has_interlaced ? static_cast<u16>(2 * random.between(1, 250)) : edid->video_latency;
  edid->i_audio_latency = has_interlaced ? static_cast<u16>(2 * random.between(1, 250)) : edid->audio_latency;
  if (edid->hdmi_video_present == 0) edid->hdmi_3d_present = edid->image_size = 0;
  edid->hdmi_vic_len = edid->hdmi_video_present == 0 ? u8{0} : static_cast<u8>(random.between(0, 3));
  for (u32 i = 0; i < 7; ++i)
    edid->hdmi_vic[i] = i < edid->hdmi_vic_len ? random.between(1, 127) : 0;
}

/// Some modes have 3D structures, no more than there is room for.
std::vector<short_video_desc_t> canonical_modes(random_source_t &random, bool with_3d) {
  std::vector<short_video_desc_t> modes;
  for (u32 i = random.between(1, 20); i > 0; --i)
    modes.push_back({random.flag(), random.between(40, 60), 0});  // None that 3D is mandatory for.
  modes.front().native = 1;
  if (!with_3d) return modes;
  for (std::size_t i = 0; i < modes.size() && i < 4; ++i)
    modes[i].stereo = random.one_of(std::array<u32, 4>{0, 0x01, 0x40, 0x80});
  return modes;
}

}  // namespace

detailed_timing_t random_timing(random_source_t &random) {
  detailed_timing_t timing{};
  timing.valid = 1;
  timing.pixel_clock = random.between(25175000, 655354999);
  for (u32 detailed_timing_t::*field :
       {&detailed_timing_t::h_active, &detailed_timing_t::h_blanking, &detailed_timing_t::v_active,
        &detailed_timing_t::v_blanking, &detailed_timing_t::h_image_size, &detailed_timing_t::v_image_size}) {
    timing.*field = random.between(0, 4095);
  }
  timing.h_sync_offset = random.between(0, 1023);
  timing.h_sync_width = random.between(0, 1023);
  timing.v_sync_offset = random.between(0, 63);
  timing.v_sync_width = random.between(0, 63);
  timing.h_border = random.byte();
  timing.v_border = random.byte();
  timing.progressive = random.flag();
  timing.stereo = random.flag();
  timing.h_sync_positive = random.flag();
  timing.v_sync_positive = random.flag();
  return timing;
}

std::string random_text(random_source_t &random, std::size_t size) {
  std::string text(random.between(0, static_cast<u32>(size)), '\0');
  if (random.chance(20)) text.resize(size);
  for (char &character : text)
    character = static_cast<char>(random.chance(10) ? ' ' : random.between(0x20, 0x7E));
  if (!text.empty() && random.chance(5)) text[random.between(0, static_cast<u32>(text.size()) - 1)] = '\n';
  return text;
}

plain_record_t random_record(random_source_t &random) {
  plain_record_t record;
  fill_base_block(random, &record.scalars);
  fill_extension(random, &record.scalars);
  for (u32 i = random_count(random, 8, 12); i > 0; --i)
    record.std_timings.push_back(random_std_timing(random));
  record.timings = {random_timing(random), random_timing(random)};
  const u32 percent_3d = random.chance(85) ? 30 : 100;
  for (u32 i = random_count(random, 10, 40); i > 0; --i)
    record.video.push_back(random_video(random, percent_3d));
  for (u32 i = random_count(random, 5, 14); i > 0; --i)
    record.audio.push_back(random_audio(random));
  return record;
}

plain_record_t random_canonical_record(random_source_t &random) {
  plain_record_t record = random_record(random);
  make_base_block_canonical(random, &record.scalars);
  make_extension_canonical(random, &record.scalars);
  record.std_timings.clear();
  for (u32 i = random.between(0, 8); i > 0; --i)
    record.std_timings.push_back({8 * random.between(33, 286), random.between(0, 3), random.between(60, 123)});
  for (detailed_timing_t &timing : record.timings) {
    timing.pixel_clock -= timing.pixel_clock % 10000;
    timing.stereo = 0;
  }
  record.video = canonical_modes(random, record.scalars.hdmi_3d_present != 0);
  record.audio.resize(std::min<std::size_t>(record.audio.size(), 4));
  if (record.audio.empty()) record.audio.push_back({1, 2, 7, 5, 0, 0, 0});
  for (short_audio_desc_t &audio : record.audio)
    audio.max_bitrate -= audio.max_bitrate % 8;
  return record;
}

}  // namespace properties
