#include "random_situation.h"

#include <array>

#include "plain_record.h"

namespace properties {

namespace {

using test_support::platform_configuration_t;

std::vector<test_support::mode_pair_t> random_modes(random_source_t &random, u32 most) {
  std::vector<test_support::mode_pair_t> modes;
  for (u32 i = random.between(0, most); i > 0; --i)
    modes.push_back({random_vic(random, 64), random.between(0, 7)});
  return modes;
}

std::vector<i32> random_4k_x_2k(random_source_t &random) {
  std::vector<i32> modes;
  for (u32 i = random.between(0, 7); i > 0; --i)
    modes.push_back(static_cast<i32>(random.between(1, 4)));
  return modes;
}

// Short audio descriptors packed into numbers; some of the reserved format 0 or of anything.
std::vector<i32> random_audio_entries(random_source_t &random) {
  std::vector<i32> entries;
  for (u32 i = random.between(0, 8); i > 0; --i) {
    const u32 type = random.chance(95) ? random.between(1, 14) : random.between(0, 15);
    const u32 third = type == 15 ? random.between(1, 3) << 3 : random.byte();
    const u32 frequencies = random.between(0, 127);
    entries.push_back(static_cast<i32>(third << 16 | frequencies << 8 | type << 3 | random.between(0, 7)));
  }
  return entries;
}

// Without a line feed, which a configured text may hold as little as a sink's.
std::string random_field_text(random_source_t &random, std::size_t size) {
  std::string text = random_text(random, size);
  for (char &character : text) {
    if (character == '\n') character = '-';
  }
  return text;
}

platform_configuration_t random_platform(random_source_t &random) {
  platform_configuration_t platform;
  platform.audio = random_audio_entries(random);
  const u32 most_modes = random.chance(80) ? 12 : 40;
  platform.video_50_priority = random_modes(random, most_modes);
  platform.video_50_additional = random_modes(random, 6);
  platform.video_60_priority = random_modes(random, most_modes);
  platform.video_60_additional = random_modes(random, 6);
  platform.modes_4k_x_2k_priority = random_4k_x_2k(random);
  platform.modes_4k_x_2k_addition = random_4k_x_2k(random);
  for (u32 i = random.between(0, 10); i > 0; --i)
    platform.std_timings.push_back({32 * random.between(8, 71), random.between(0, 3), random.between(60, 123)});
  const auto random_i32 = [&random](u32 last) { return static_cast<i32>(random.between(0, last)); };
  platform.native_refresh_rate = random.flag() != 0 ? 50 : 60;
  platform.current_mode_set_to_priority = random_i32(1);
  platform.geometry_limit = random.chance(25) ? 1 : 0;
  platform.audio_pass_through = random_i32(2);
  platform.underscan = random_i32(1);
  platform.is_tv = random_i32(1);
  platform.dc_30bit = random_i32(1);
  // Always what 30-bit deep colour needs: a warning tells of it otherwise.
  platform.dc_36bit = platform.dc_30bit | random_i32(1);
  platform.tmds_override = random.chance(60) ? 0 : random_i32(1275);
  platform.supports_ai = random_i32(2);
  platform.speaker_entry = 1 + random_i32(2046);
  platform.xvYCC601 = random_i32(2);
  platform.xvYCC709 = random_i32(2);
  platform.native_bit = random_i32(1);
  platform.product_id = random.between(0, 0xFFFF);
  platform.serial = random.between(0, 0xFFFFFFFF);
  platform.week = random.chance(10) ? 255 : random.between(0, 53);
  platform.year = random.between(1990, 2100);
  for (u32 &content_type : platform.cnc)
    content_type = random.between(0, 2);
  platform.manufacturer_id = "RND";
  platform.monitor_name = random_field_text(random, 13);
  platform.monitor_serial = random_field_text(random, 13);
  platform.established_timings_1 = random.byte();
  platform.established_timings_2 = random.byte();
  platform.manufacturer_timings = random.byte();
  return platform;
}

video_mode_t random_current_mode(random_source_t &random) {
  if (random.chance(20)) return {};
  constexpr std::array<video_mode_t, 6> modes{{{1920, 1080, 0, 60},
                                               {1280, 720, 0, 50},
                                               {720, 480, 0, 59},
                                               {1920, 1080, 1, 50},
                                               {399, 100, 0, 60},
                                               {1000, 1000, 0, 60}}};
  return random.one_of(modes);
}

compose_cfg_t random_settings(random_source_t &random) {
  compose_cfg_t settings{};
  settings.hdmi_current_mode = random_current_mode(random);
  settings.audio_mask = random.chance(20) ? 0xFFFFFFFF : random.between(0, 0xFFFFFFFF);
  settings.audio_sink_filter = random.between(0, 2);
  settings.hdmi_3d_mode = static_cast<i32>(random.between(0, 3));
  for (u32 &latency : settings.edid_latency)
    latency = random.chance(50) ? 0 : random.between(0, random.chance(90) ? 250 : 70000);
  settings.port = random.chance(90) ? random.between(0, 14) : random.between(0, 0xFFFFFFFF);
  return settings;
}

}  // namespace

situation_t random_situation(random_source_t &random) {
  situation_t situation;
  if (random.chance(90)) situation.sink = random_sink(random);
  situation.platform = random_platform(random);
  situation.settings = random_settings(random);
  return situation;
}

}  // namespace properties
