// Small compositions that are observed, and what is told of them, in words.
#pragma once

#include <array>
#include <optional>
#include <string>
#include <vector>

#include "support/edid_builder.h"
#include "support/platform_configuration.h"

namespace observed {

using test_support::bytes_t;

/// A display. One without any part is no sink at all.
struct sink_t {
  std::vector<detailed_timing_t> timings;       ///< Of the base block; four at most.
  std::vector<std::array<u8, 2>> std_timings;   ///< As stored.
  std::vector<detailed_timing_t> more_timings;  ///< Of the extension.
  bytes_t video;                                ///< Short video descriptors.
  bytes_t audio;                                ///< Short audio descriptors, three bytes each.
  bytes_t hdmi;                                 ///< The HDMI block's payload, from the physical address on.
  std::vector<bytes_t> blocks;                  ///< Further data blocks.

  bytes_t build() const;
};

/// What a composition is made from. The one to begin with has no sink and offers 16, 4, 2 and 1, without a word.
struct situation_t {
  situation_t();
  test_support::platform_configuration_t platform;
  sink_t sink;
  compose_cfg_t settings;
  std::optional<hdmi2_values_t> hdmi2;
};

/// Turns HDMI 2 on, with the defaults of everything else.
hdmi2_values_t &enable_hdmi2(situation_t &situation);

/// An observed composition.
struct composition_t {
  bool result = false;
  bytes_t bytes = bytes_t(256, 0xA5);
  std::string output;
  std::vector<compose_decision_t> decisions;
};

/// An observer: appends a copy of the record to the vector that @p decisions is.
void keep(const compose_decision_t *decision, void *decisions);

/// From platform values at hand.
composition_t observe(const situation_t &situation, compose_observer_t observer = keep);
/// From a configuration tree.
composition_t observe_tree(const situation_t &situation);

/// A record to compare with. What is not said is as the library leaves it: nobody named it, nowhere, no numbers.
class told_t {
 public:
  told_t(compose_subject subject, u32 code, compose_verdict verdict, compose_reason reason);
  told_t &named_by(u32 origins);
  told_t &in_sink_at(i32 index);
  told_t &in_priority_list_at(i32 index);
  told_t &in_addition_list_at(i32 index);
  told_t &at(i32 position);
  told_t &values(const std::array<i32, 4> &values);

  const compose_decision_t &record() const { return record_; }

 private:
  compose_decision_t record_;
};

/// Every member of the record.
std::string words_of(const compose_decision_t &decision);

/// In the order of their words: records are told in no order to rely on.
std::vector<std::string> words_of(const std::vector<told_t> &records);
std::vector<std::string> words_about(compose_subject subject, const composition_t &composition);

/// What is told of one candidate or value.
std::vector<std::string> words_about(compose_subject subject, u32 code, const composition_t &composition);

/// Modes without 3D structures, for a platform's list.
std::vector<test_support::mode_pair_t> modes(const std::vector<u32> &vics);

/// Origins that go together in most records.
inline constexpr u32 both_lists = COMPOSE_ORIGIN_PRIORITY_LIST | COMPOSE_ORIGIN_ADDITION_LIST;
inline constexpr u32 sink_and_both_lists = both_lists | COMPOSE_ORIGIN_SHORT_VIDEO;

/// Audio formats as the platform's list has them: 2 and 8 channels of PCM, 6 of AC-3, DTS and E-AC-3.
inline constexpr i32 pcm_2 = 0x050709;
inline constexpr i32 pcm_8 = 0x05070F;
inline constexpr i32 ac3_6 = 0x500715;
inline constexpr i32 dts_6 = 0xC0073D;
inline constexpr i32 eac3_6 = 0x000755;

/// A format of the platform's list as the bytes of a short audio descriptor.
bytes_t descriptor(i32 platform_format);

}  // namespace observed
