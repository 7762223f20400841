// Records and lists for tests: prepared on construction, released at the end of the scope.
#pragma once

#include <gtest/gtest.h>

#include <array>
#include <cstring>
#include <utility>
#include <vector>

#include "edid_composer.h"
#include "support/list_contents.h"

namespace test_support {

template <typename record_t>
inline constexpr const char *list_type_name = nullptr;
template <>
inline constexpr const char *list_type_name<i32> = "int";
template <>
inline constexpr const char *list_type_name<short_video_desc_t> = "short_video_desc_t";
template <>
inline constexpr const char *list_type_name<std_timing_t> = "std_timing_t";
template <>
inline constexpr const char *list_type_name<detailed_timing_t> = "detailed_timing_t";
template <>
inline constexpr const char *list_type_name<short_audio_desc_t> = "short_audio_desc_t";

/// Appends a copy of @p record to a list of its type.
template <typename record_t>
void append(ll_list_t &list, const record_t &record) {
  append_to(list, list_type_name<record_t>, record);
}

/// A list head that deletes its list when it goes.
template <typename record_t>
class scoped_list_t {
 public:
  scoped_list_t() { EXPECT_TRUE(ll_init(&list_, list_type_name<record_t>)); }
  ~scoped_list_t() {
    if (ll_is_initialized(&list_)) ll_delete_list(&list_);
  }
  scoped_list_t(const scoped_list_t &) = delete;
  scoped_list_t &operator=(const scoped_list_t &) = delete;

  ll_list_t *get() { return &list_; }
  ll_list_t &operator*() { return list_; }

 private:
  ll_list_t list_{};
};

/// A prepared EDID record.
class scoped_edid_t {
 public:
  scoped_edid_t() { EXPECT_EQ(edid_prepare(&edid_), 1); }
  ~scoped_edid_t() { EXPECT_EQ(edid_destroy(&edid_), 1); }
  scoped_edid_t(const scoped_edid_t &) = delete;
  scoped_edid_t &operator=(const scoped_edid_t &) = delete;

  edid_t *get() { return &edid_; }
  edid_t *operator->() { return &edid_; }

 private:
  edid_t edid_{};
};

/// Platform values as an empty configuration gives them.
class scoped_values_t {
 public:
  scoped_values_t() {
    EXPECT_TRUE(platform_values_init(&values_));
    values_.native_refresh_rate = 60;
    values_.speaker_entry = 1;
    values_.native_bit = 1;
    values_.week = 1;
    values_.year = 2012;
    std::memcpy(values_.manufacturer_id, "YYY", 4);
  }
  ~scoped_values_t() { EXPECT_TRUE(platform_values_destroy(&values_)); }
  scoped_values_t(const scoped_values_t &) = delete;
  scoped_values_t &operator=(const scoped_values_t &) = delete;

  platform_values_t *get() { return &values_; }
  platform_values_t *operator->() { return &values_; }

 private:
  platform_values_t values_{};
};

/// VIC and 3D mask of a video mode, which is what most expectations are about.
using mode_pair_t = std::pair<u32, u32>;

inline void append_modes(ll_list_t &list, const std::vector<mode_pair_t> &modes) {
  for (const auto &[vic, stereo] : modes)
    append(list, short_video_desc_t{0, vic, stereo});
}

inline std::vector<mode_pair_t> modes_of(const ll_list_t &list) {
  std::vector<mode_pair_t> modes;
  for (const auto &mode : elements_of<short_video_desc_t>(list))
    modes.emplace_back(mode.vic, mode.stereo);
  return modes;
}

/// The seven words of a short audio descriptor, in the order of the record.
using audio_words_t = std::array<u32, 7>;

inline audio_words_t words_of(const short_audio_desc_t &audio) {
  return {audio.type,        audio.channels, audio.frequencies, audio.pcm_bits,
          audio.max_bitrate, audio.value,    audio.wma_profile};
}

inline std::vector<audio_words_t> audio_of(const ll_list_t &list) {
  std::vector<audio_words_t> formats;
  for (const auto &audio : elements_of<short_audio_desc_t>(list))
    formats.push_back(words_of(audio));
  return formats;
}

/// Width, aspect-ratio code and refresh rate of standard timings.
using std_timing_words_t = std::array<u32, 3>;

inline std::vector<std_timing_words_t> std_timings_of(const ll_list_t &list) {
  std::vector<std_timing_words_t> timings;
  for (const auto &timing : elements_of<std_timing_t>(list)) {
    timings.push_back({timing.h_active, timing.aspect_ratio, timing.refresh_rate});
  }
  return timings;
}

/// Settings that ask for nothing: every audio format allowed, no filter, no 3D, no latency, port 0.
inline compose_cfg_t plain_settings() {
  compose_cfg_t cfg{};
  cfg.audio_mask = 0xFFFFFFFF;
  return cfg;
}

}  // namespace test_support
