#include "support/platform_configuration.h"

#include <algorithm>
#include <cstring>
#include <stdexcept>

namespace test_support {
namespace {

std::string text_of(const mode_pair_t &mode) {
  std::string text = std::to_string(mode.first);
  if ((mode.second & STEREO_FRAME_PACKING) != 0) text += " FP";
  if ((mode.second & STEREO_SIDE_BY_SIDE_HALF) != 0) text += " SBSH";
  if ((mode.second & STEREO_TOP_AND_BOTTOM) != 0) text += " TBH";
  return text;
}

std::string text_of(const std_timing_words_t &timing) {
  const auto [width, ratio, refresh] = timing;
  const u32 heights[] = {width, width * 3 / 4, width * 4 / 5, width * 9 / 16};
  // With a fraction, so that none is read that an earlier, longer entry has left behind.
  return std::to_string(width) + " " + std::to_string(heights[ratio]) + " " + std::to_string(refresh) + ".0";
}

template <typename element_t>
void write_texts(configuration_tree_t &tree, const std::string &key, const std::vector<element_t> &elements) {
  tree.add_list(key);
  for (const auto &element : elements)
    tree.add(key, text_of(element));
}

void write_numbers(configuration_tree_t &tree, const std::string &key, const std::vector<i32> &numbers) {
  tree.add_list(key);
  for (const i32 number : numbers)
    tree.add(key, number);
}

void write_bits(configuration_tree_t &tree, const std::string &key, u32 mask) {
  tree.add_list(key);
  for (int bit = 0; bit < 8; ++bit) {
    if ((mask >> bit & 1) != 0) tree.add(key, bit);
  }
}

template <std::size_t size>
void copy_text(char (&field)[size], const std::string &text) {
  std::memcpy(field, text.data(), std::min(size, text.size()));
}

void copy_modes(i32 (&modes)[7], const std::vector<i32> &from) {
  if (from.size() > 7) throw std::length_error("there is room for seven 4Kx2K modes");
  std::copy(from.begin(), from.end(), modes);
}

struct scalar_t {
  const char *key;
  i32 platform_configuration_t::*value;
  i32 platform_values_t::*field;
};

using configuration = platform_configuration_t;
using values_record = platform_values_t;

constexpr scalar_t signed_scalars[] = {
    {"native_refresh_rate", &configuration::native_refresh_rate, &values_record::native_refresh_rate},
    {"current_mode_set_to_priority", &configuration::current_mode_set_to_priority,
     &values_record::current_mode_set_to_priority},
    {"geometry_limit", &configuration::geometry_limit, &values_record::geometry_limit},
    {"audio.pass_through", &configuration::audio_pass_through, &values_record::audio_pass_through},
    {"underscan", &configuration::underscan, &values_record::underscan},
    {"is_tv", &configuration::is_tv, &values_record::is_tv},
    {"dc_30bit", &configuration::dc_30bit, &values_record::dc_30bit},
    {"dc_36bit", &configuration::dc_36bit, &values_record::dc_36bit},
    {"tmds_override", &configuration::tmds_override, &values_record::tmds_override},
    {"supports_ai", &configuration::supports_ai, &values_record::supports_ai},
    {"speaker_entry", &configuration::speaker_entry, &values_record::speaker_entry},
    {"xvYCC601", &configuration::xvYCC601, &values_record::xvYCC601},
    {"xvYCC709", &configuration::xvYCC709, &values_record::xvYCC709},
    {"native_bit", &configuration::native_bit, &values_record::native_bit},
};

}  // namespace

void platform_configuration_t::write_to(configuration_tree_t &tree) const {
  for (const auto &[key, value, field] : signed_scalars)
    tree.set(key, this->*value);
  tree.set("product_id", product_id);
  tree.set("serial", serial);
  tree.set("week", week);
  tree.set("year", year);
  for (std::size_t i = 0; i < 4; ++i)
    tree.set("CNC" + std::to_string(i), cnc[i]);
  for (std::size_t i = 0; i < audio.size(); ++i)
    tree.set(std::string("audio.entry_") + "abcdefghijklmnopqrstuvwxyz"[i], audio[i]);
  write_texts(tree, "50_hz_priority_list", video_50_priority);
  write_texts(tree, "50_hz_addition_list", video_50_additional);
  write_texts(tree, "60_hz_priority_list", video_60_priority);
  write_texts(tree, "60_hz_addition_list", video_60_additional);
  write_numbers(tree, "4k_x_2k_priority_list", modes_4k_x_2k_priority);
  write_numbers(tree, "4k_x_2k_addition_list", modes_4k_x_2k_addition);
  tree.set("manufacturer_id", manufacturer_id);
  tree.set("monitor_name", monitor_name);
  tree.set("monitor_serial", monitor_serial);
  write_bits(tree, "established_timings_1", established_timings_1);
  write_bits(tree, "established_timings_2", established_timings_2);
  write_bits(tree, "manufacturer_timings", manufacturer_timings);
  write_texts(tree, "standard_timings", std_timings);
}

void platform_configuration_t::write_to(platform_values_t *values) const {
  for (const auto &[key, value, field] : signed_scalars)
    values->*field = this->*value;
  values->product_id = product_id;
  values->serial = serial;
  values->week = week;
  values->year = year;
  values->cnc0 = cnc[0];
  values->cnc1 = cnc[1];
  values->cnc2 = cnc[2];
  values->cnc3 = cnc[3];
  for (const i32 entry : audio)
    append(values->audio_list, entry);
  append_modes(values->video_50_priority, video_50_priority);
  append_modes(values->video_50_additional, video_50_additional);
  append_modes(values->video_60_priority, video_60_priority);
  append_modes(values->video_60_additional, video_60_additional);
  copy_modes(values->modes_4k_x_2k_priority, modes_4k_x_2k_priority);
  copy_modes(values->modes_4k_x_2k_addition, modes_4k_x_2k_addition);
  std::memset(values->manufacturer_id, 0, sizeof values->manufacturer_id);
  copy_text(values->manufacturer_id, manufacturer_id);
  copy_text(values->monitor_name, monitor_name);
  copy_text(values->monitor_serial, monitor_serial);
  values->established_timings_1 = established_timings_1;
  values->established_timings_2 = established_timings_2;
  values->manufacturer_timings = manufacturer_timings;
  for (const auto &[width, ratio, refresh] : std_timings)
    append(values->std_timings, std_timing_t{width, ratio, refresh});
}

}  // namespace test_support
