#include "explain/audio_answer.h"

#include <algorithm>

#include "explain/mode_names.h"
#include "explain/reason_texts.h"
#include "explain/steps.h"
#include "text/hexadecimal.h"

namespace edid_cli {
namespace {

constexpr const char *pass_through_key = "audio.pass_through";
constexpr i32 platform_only = 0;
constexpr i32 both = 1;
constexpr i32 sink_only = 2;
/// The library encodes no more.
constexpr std::size_t most_formats = 10;

/// The bit of a type in the audio masks.
u32 mask_bit(u32 type) {
  constexpr u32 first_extension = 16;
  return 1U << (type >= first_extension ? type - 2 : type - 1);
}

class audio_question_t {
 public:
  audio_question_t(u32 type, const explained_t &explained) : type_(type), explained_(explained), steps_(explained) {
    for (const compose_decision_t &decision : explained.composition.decisions) {
      if (decision.subject == COMPOSE_SUBJECT_AUDIO_FORMAT && decision.code == type) {
        decisions_.push_back(decision);
      }
    }
  }

  answer_t run() && {
    answer_t answer;
    answer.name = audio_type_name(type_) + " (audio:" + std::to_string(type_) + ")";
    answer.is_offered = any_of([this](const auto &decision) { return is_found_by_sources(decision, explained_); });
    for (const compose_decision_t &decision : decisions_) {
      if (!answer.is_offered || decision.verdict != COMPOSE_VERDICT_LEFT_OUT) {
        answer.reasons.push_back(reason_sentence(decision, explained_));
      }
    }
    if (decisions_.empty()) {
      answer.reasons.emplace_back("Neither the platform nor the sink has a format of this type.");
    }
    if (!answer.is_offered) {
      add_general_reasons(explained_, answer);
      find_steps();
      answer.steps = std::move(steps_).take();
    }
    return answer;
  }

 private:
  template <typename predicate_t>
  bool any_of(predicate_t predicate) const {
    return std::any_of(decisions_.begin(), decisions_.end(), predicate);
  }

  bool is_named_by(u32 origin) const {
    return any_of([origin](const auto &decision) { return (decision.origins & origin) != 0; });
  }

  bool is_left_out_for(u32 reason) const {
    return any_of([reason](const auto &decision) { return decision.reason == reason; });
  }

  void find_steps() {
    steps_.announce_extension();
    const bool in_platform = is_named_by(COMPOSE_ORIGIN_PLATFORM_AUDIO);
    const bool in_sink = is_named_by(COMPOSE_ORIGIN_SINK_AUDIO);
    const i32 pass_through = std::clamp(platform_places_t::number_at(pass_through_key, platform_only), 0, sink_only);
    const bool is_named = (in_platform && pass_through != sink_only) || (in_sink && pass_through != platform_only);
    if (!is_named && (in_platform || in_sink || pass_through == sink_only)) {
      steps_.set(pass_through_key, std::to_string(both), "formats of the platform and of the sink");
    }
    if (!in_platform && !in_sink) {
      steps_.add_audio_entry(type_);
    }
    change_settings(in_sink);
    make_room();
  }

  void change_settings(bool in_sink) {
    const compose_cfg_t &settings = explained_.options.settings;
    const bool is_refused =
        is_left_out_for(COMPOSE_REASON_NOT_IN_SINK) || is_left_out_for(COMPOSE_REASON_TYPE_WITHOUT_BIT);
    if (settings.audio_sink_filter == 1 && (is_refused || !in_sink)) {
      steps_.drop_option("--audio-sink-filter");
    }
    if ((settings.audio_mask & mask_bit(type_)) == 0) {
      steps_.give_option("--audio-mask", hex_number(settings.audio_mask | mask_bit(type_)));
    }
  }

  /// Takes formats of the platform out, the last first, until there is room for one more.
  void make_room() {
    const auto &all = explained_.composition.decisions;
    const bool is_chosen = any_of([](const auto &decision) {
      return decision.verdict != COMPOSE_VERDICT_LEFT_OUT || decision.reason == COMPOSE_REASON_NO_ROOM;
    });
    std::vector<compose_decision_t> others;
    std::size_t chosen = is_chosen ? 0 : 1;
    for (const compose_decision_t &decision : all) {
      const bool was_chosen = decision.verdict != COMPOSE_VERDICT_LEFT_OUT || decision.reason == COMPOSE_REASON_NO_ROOM;
      if (decision.subject != COMPOSE_SUBJECT_AUDIO_FORMAT || !was_chosen) {
        continue;
      }
      ++chosen;
      if (decision.code != type_ && (decision.origins & COMPOSE_ORIGIN_PLATFORM_AUDIO) != 0) {
        others.push_back(decision);
      }
    }
    std::sort(others.begin(), others.end(),
              [](const auto &left, const auto &right) { return left.priority_index > right.priority_index; });
    for (std::size_t index = 0; chosen > most_formats && index < others.size(); ++index, --chosen) {
      if (const list_entry_t *const entry =
              explained_.places.entry(platform_list::audio, others[index].priority_index)) {
        steps_.take_entry_out(platform_list::audio, *entry);
      }
    }
  }

  u32 type_;
  const explained_t &explained_;
  std::vector<compose_decision_t> decisions_;
  steps_t steps_;
};

}  // namespace

answer_t audio_answer(u32 type, const explained_t &explained) {
  return audio_question_t(type, explained).run();
}

}  // namespace edid_cli
