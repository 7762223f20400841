#include "random_hdmi2.h"

#include <algorithm>

namespace properties {
namespace {

using test_support::bytes_t;
using test_support::data_block;

constexpr u8 vendor_specific = 3;
constexpr u8 extended = 7;

/// Those that are named often, so that sinks and platforms meet.
u32 random_extended_vic(random_source_t &random) {
  static constexpr std::array<u32, 12> common{97, 96, 102, 101, 95, 94, 93, 98, 118, 107, 76, 78};
  if (random.chance(70)) return random.one_of(common);
  return random.flag() != 0 ? random.between(65, 127) : random.between(193, 219);
}

bytes_t random_bytes(random_source_t &random, u32 least, u32 most) {
  bytes_t bytes;
  for (u32 i = random.between(least, most); i > 0; --i)
    bytes.push_back(random.byte());
  return bytes;
}

bytes_t block(u8 tag, const bytes_t &beginning, const bytes_t &rest) {
  return data_block(tag, test_support::join(beginning, rest));
}

bytes_t random_svds(random_source_t &random, u32 most) {
  bytes_t svds;
  for (u32 i = random.between(0, most); i > 0; --i)
    svds.push_back(static_cast<u8>(random.flag() != 0 ? random_extended_vic(random) : random_vic(random, 64)));
  return svds;
}

bytes_t random_forum_block(random_source_t &random) {
  bytes_t rest{1, static_cast<u8>(random.chance(60) ? 120 : random.between(0, 140)), random.byte(), random.byte()};
  if (random.flag() != 0) {
    rest.push_back(random.byte());
    if (random.flag() != 0) {
      rest.push_back(static_cast<u8>(random.between(0, 63) | random.between(0, 1) << 6));
      rest.push_back(random.byte());
    }
  }
  return block(vendor_specific, {0xD8, 0x5D, 0xC4}, rest);
}

bytes_t random_block(random_source_t &random) {
  switch (random.between(0, 12)) {
    case 0:
      return random_forum_block(random);
    case 1:
      return block(extended, {0x00}, random_bytes(random, 0, 2));
    case 2:
      return block(extended, {0x05}, random_bytes(random, 1, 3));
    case 3:
      return block(extended, {0x06, random.byte(), 1}, random_bytes(random, 0, 4));
    case 4:
      return block(extended, {0x0E}, random_svds(random, 6));
    case 5:
      return block(extended, {0x0F}, random_bytes(random, 0, 4));
    case 6:
      return block(extended, {0x07}, random_bytes(random, 2, 12));
    case 7:
      return block(extended, {0x01, 0x8B, 0x84, 0x90}, random_bytes(random, 0, 4));
    case 8:
      return block(extended, {0x01, 0x46, 0xD0, 0x00}, random_bytes(random, 4, 20));
    case 9:
      return block(vendor_specific, {0x1A, 0x00, 0x00}, random_bytes(random, 4, 24));
    case 10:
      return test_support::hdmi_block({0x10, 0x00, random.byte(), static_cast<u8>(random.between(0, 120))});
    default:
      return test_support::video_block(random_svds(random, 12));
  }
}

}  // namespace

bytes_t random_hdmi2_sink(random_source_t &random) {
  const u32 extensions = random.between(1, 3);
  bytes_t sink = test_support::base_block_builder_t().extensions(static_cast<u8>(extensions)).build();
  for (u32 i = 0; i < extensions; ++i) {
    test_support::extension_builder_t extension;
    extension.block(test_support::video_block(random_svds(random, 16)));
    // Timings of today begin at byte 110 at most.
    std::size_t room = 110 - 4 - 17;
    for (u32 blocks = random.between(0, 8); blocks > 0; --blocks) {
      const bytes_t added = random_block(random);
      if (added.size() > room) continue;
      room -= added.size();
      extension.block(added);
    }
    sink = test_support::join(sink, extension.build());
  }
  return sink;
}

hdmi2_values_t random_hdmi2_values(random_source_t &random) {
  hdmi2_values_t values{};
  values.size = sizeof values;
  hdmi2_values_init(&values);
  values.enable = 1;
  u32 count = random.between(0, 31);
  for (u32 i = 0; i < count; ++i)
    values.vic_priority_list[i] = static_cast<i32>(random_extended_vic(random));
  count = random.between(0, 12);
  for (u32 i = 0; i < count; ++i)
    values.vic_addition_list[i] = static_cast<i32>(random_extended_vic(random));
  for (u32 index = 36; const configuration_key_t *key = configuration_key(index); ++index) {
    const std::string name = key->name;
    const auto set = [&](const char *suffix, i32 *member) {
      if (name == std::string("hdmi2.") + suffix && random.chance(70)) {
        *member = static_cast<i32>(random.between(key->minimum, key->maximum));
      }
    };
    set("tmds_limit", &values.tmds_limit);
    set("preferred_extended", &values.preferred_extended);
    set("scdc", &values.scdc);
    set("read_request", &values.read_request);
    set("scramble_low", &values.scramble_low);
    set("y420", &values.y420);
    set("dc_30bit_420", &values.dc_30bit_420);
    set("dc_36bit_420", &values.dc_36bit_420);
    set("uhd_vic", &values.uhd_vic);
    set("allm", &values.allm);
    set("vrr", &values.vrr);
    set("vrr_min", &values.vrr_min);
    set("vrr_max", &values.vrr_max);
    set("hdr_gamma", &values.hdr_gamma);
    set("hdr_pq", &values.hdr_pq);
    set("hdr_hlg", &values.hdr_hlg);
    set("hdr_luminance", &values.hdr_luminance);
    set("hdr_max", &values.hdr_max);
    set("hdr_average", &values.hdr_average);
    set("hdr_min", &values.hdr_min);
    set("bt2020_rgb", &values.bt2020_rgb);
    set("bt2020_ycc", &values.bt2020_ycc);
    set("bt2020_cycc", &values.bt2020_cycc);
    set("rgb_quantization", &values.rgb_quantization);
    set("ycc_quantization", &values.ycc_quantization);
    set("pass_hdr_dynamic", &values.pass_hdr_dynamic);
    set("pass_hdr10plus", &values.pass_hdr10plus);
    set("pass_dolby_vision", &values.pass_dolby_vision);
    set("pass_freesync", &values.pass_freesync);
  }
  if (random.chance(60)) values.tmds_limit = 600;
  values.deep_color = random.flag() != 0 ? 2 : 0;
  return values;
}

}  // namespace properties
