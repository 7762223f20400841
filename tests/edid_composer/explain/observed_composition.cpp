#include "edid_composer/explain/observed_composition.h"

#include <algorithm>
#include <sstream>

#include "support/observation.h"
#include "support/output_capture.h"

namespace observed {
namespace {

composition_t compose(const situation_t &situation, const platform_values_t *values, compose_observer_t observer) {
  composition_t composition;
  const bytes_t sink = situation.sink.build();
  composition.output = test_support::output_of([&] {
    composition.result =
        test_support::compose_observed(sink, composition.bytes, &situation.settings, values, observer,
                                       &composition.decisions, situation.hdmi2 ? &*situation.hdmi2 : nullptr);
  });
  return composition;
}

template <typename condition_t>
std::vector<std::string> words_where(const composition_t &composition, const condition_t &condition) {
  std::vector<std::string> words;
  for (const auto &decision : composition.decisions) {
    if (condition(decision)) words.push_back(words_of(decision));
  }
  std::sort(words.begin(), words.end());
  return words;
}

}  // namespace

bytes_t sink_t::build() const {
  const bool has_extension =
      !(more_timings.empty() && video.empty() && audio.empty() && hdmi.empty() && blocks.empty());
  if (!has_extension && timings.empty() && std_timings.empty()) return {};
  test_support::base_block_builder_t base;
  for (u32 i = 0; i < timings.size(); ++i)
    base.descriptor(i, test_support::timing_descriptor(timings[i]));
  for (u32 i = 0; i < std_timings.size(); ++i)
    base.standard_timing(i, std_timings[i][0], std_timings[i][1]);
  if (!has_extension) return base.build();

  test_support::extension_builder_t extension;
  if (!video.empty()) extension.block(test_support::video_block(video));
  if (!audio.empty()) extension.block(test_support::audio_block(audio));
  if (!hdmi.empty()) extension.block(test_support::hdmi_block(hdmi));
  for (const auto &block : blocks)
    extension.block(block);
  for (const auto &timing : more_timings)
    extension.timing(test_support::timing_descriptor(timing));
  return test_support::join(base.extensions(1).build(), extension.build());
}

situation_t::situation_t() : settings(test_support::plain_settings()) {
  platform.video_60_priority = modes({16, 4, 2, 1});
  platform.video_60_additional = modes({16, 4, 2, 1});
  platform.monitor_name = "Box";
}

hdmi2_values_t &enable_hdmi2(situation_t &situation) {
  hdmi2_values_t values{};
  values.size = sizeof values;
  hdmi2_values_init(&values);
  values.enable = 1;
  return situation.hdmi2.emplace(values);
}

void keep(const compose_decision_t *decision, void *decisions) {
  static_cast<std::vector<compose_decision_t> *>(decisions)->push_back(*decision);
}

composition_t observe(const situation_t &situation, compose_observer_t observer) {
  test_support::scoped_values_t values;
  situation.platform.write_to(values.get());
  return compose(situation, values.get(), observer);
}

composition_t observe_tree(const situation_t &situation) {
  test_support::configuration_tree_t tree;
  situation.platform.write_to(tree);
  return compose(situation, nullptr, keep);
}

told_t::told_t(compose_subject subject, u32 code, compose_verdict verdict, compose_reason reason)
    : record_{.size = sizeof(compose_decision_t),
              .subject = subject,
              .code = code,
              .verdict = verdict,
              .reason = reason,
              .origins = 0,
              .sink_index = -1,
              .priority_index = -1,
              .addition_index = -1,
              .position = -1,
              .value = {}} {}

told_t &told_t::named_by(u32 origins) {
  record_.origins = origins;
  return *this;
}

told_t &told_t::in_sink_at(i32 index) {
  record_.sink_index = index;
  return *this;
}

told_t &told_t::in_priority_list_at(i32 index) {
  record_.priority_index = index;
  return *this;
}

told_t &told_t::in_addition_list_at(i32 index) {
  record_.addition_index = index;
  return *this;
}

told_t &told_t::at(i32 position) {
  record_.position = position;
  return *this;
}

told_t &told_t::values(const std::array<i32, 4> &values) {
  std::copy(values.begin(), values.end(), record_.value);
  return *this;
}

std::string words_of(const compose_decision_t &decision) {
  std::ostringstream words;
  words << compose_subject_string(decision.subject) << ' ' << decision.code << ' '
        << compose_verdict_string(decision.verdict) << ", " << compose_reason_string(decision.reason) << " {"
        << decision.value[0] << ", " << decision.value[1] << ", " << decision.value[2] << ", " << decision.value[3]
        << "}, named by 0x" << std::hex << decision.origins << std::dec << ", in sink at " << decision.sink_index
        << ", priority list " << decision.priority_index << ", addition list " << decision.addition_index
        << ", position " << decision.position << ", " << decision.size << " bytes";
  return words.str();
}

std::vector<std::string> words_of(const std::vector<told_t> &records) {
  std::vector<std::string> words;
  for (const auto &record : records)
    words.push_back(words_of(record.record()));
  std::sort(words.begin(), words.end());
  return words;
}

std::vector<std::string> words_about(compose_subject subject, const composition_t &composition) {
  return words_where(composition, [=](const auto &decision) { return decision.subject == subject; });
}

std::vector<std::string> words_about(compose_subject subject, u32 code, const composition_t &composition) {
  return words_where(composition,
                     [=](const auto &decision) { return decision.subject == subject && decision.code == code; });
}

std::vector<test_support::mode_pair_t> modes(const std::vector<u32> &vics) {
  std::vector<test_support::mode_pair_t> modes;
  for (const u32 vic : vics)
    modes.emplace_back(vic, 0);
  return modes;
}

bytes_t descriptor(i32 platform_format) {
  const auto bytes = static_cast<u32>(platform_format);
  return {static_cast<u8>(bytes & 0xFF), static_cast<u8>(bytes >> 8 & 0xFF), static_cast<u8>(bytes >> 16 & 0xFF)};
}

}  // namespace observed
