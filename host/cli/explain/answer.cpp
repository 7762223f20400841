#include "explain/answer.h"

#include <algorithm>

#include "edid_text/mode_names.h"
#include "explain/hdmi2_features.h"
#include "explain/offer.h"
#include "explain/reason_texts.h"
#include "explain/way.h"

namespace edid_cli {
namespace {

constexpr u32 hdmi_2_0_khz = 600'000;

/// Why the library can't offer it, whatever the platform says; empty when it can.
std::string why_never(const wanted_t &wanted) {
  constexpr u32 never_offered_bits = 48;
  if (wanted.subject == COMPOSE_SUBJECT_DEEP_COLOR && wanted.code == never_offered_bits) {
    return "HDMI 1.4 has it, but no configuration of this library offers it.";
  }
  if (wanted.subject != COMPOSE_SUBJECT_EXTENDED_MODE) {
    return "";
  }
  const u32 clock = pixel_clock_of_vic(wanted.code);
  // In YCbCr 4:2:0 it takes half of its pixel clock.
  return clock / 2 > hdmi_2_0_khz ? "VIC " + std::to_string(wanted.code) +
                                        " needs a fixed rate link, as HDMI 2.1 has it, and this library "
                                        "composes EDIDs for up to 600 MHz."
                                  : "";
}

bool is_about(const compose_decision_t &decision, const wanted_t &wanted, const explained_t &explained) {
  const bool has_one_only = wanted.subject == COMPOSE_SUBJECT_3D || wanted.subject == COMPOSE_SUBJECT_ALLM ||
                            wanted.subject == COMPOSE_SUBJECT_VRR || wanted.subject == COMPOSE_SUBJECT_YCBCR_420;
  // Without HDMI 2, a VIC above 64 of the sink is decided on as any other.
  const bool is_same_kind =
      decision.subject == static_cast<u32>(wanted.subject) ||
      (wanted.subject == COMPOSE_SUBJECT_EXTENDED_MODE && decision.subject == COMPOSE_SUBJECT_VIDEO_MODE);
  return is_same_kind && (has_one_only || sink_vic(decision, explained) == wanted.code);
}

std::vector<compose_decision_t> decisions_about(const wanted_t &wanted, const explained_t &explained) {
  std::vector<compose_decision_t> decisions;
  for (const compose_decision_t &decision : explained.composition.decisions) {
    if (is_about(decision, wanted, explained)) {
      decisions.push_back(decision);
    }
  }
  return decisions;
}

std::string without_decision(const wanted_t &wanted, const explained_t &explained) {
  if (is_of_hdmi2(wanted.subject) && !has_hdmi2(explained.composition)) {
    return "The platform composes without HDMI 2: hdmi2.enable is not 1.";
  }
  return wanted.subject == COMPOSE_SUBJECT_AUDIO_FORMAT ? "Neither the platform nor the sink has a format of this type."
                                                        : "Neither the sink nor any list of the platform names it.";
}

/// Of an audio format with fewer channels than are wanted it has to be said how many there are.
std::string decision_sentence(const wanted_t &wanted, const compose_decision_t &decision,
                              const explained_t &explained) {
  const std::string sentence = reason_sentence(decision, explained);
  const bool is_counted = wanted.channels != 0 && decision.value[0] > 0;
  return is_counted ? "With " + channels_name(static_cast<u32>(decision.value[0])) + ": " + sentence : sentence;
}

std::vector<std::string> reasons_of(const wanted_t &wanted, bool is_offered, const explained_t &explained) {
  std::vector<std::string> reasons;
  bool is_told = false;
  for (const compose_decision_t &decision : decisions_about(wanted, explained)) {
    // For no room it is said that the extension is not announced.
    is_told = is_told || decision.reason == COMPOSE_REASON_NO_ROOM;
    if (!is_offered || decision.verdict != COMPOSE_VERDICT_LEFT_OUT) {
      reasons.push_back(decision_sentence(wanted, decision, explained));
    }
  }
  if (reasons.empty()) {
    reasons.push_back(without_decision(wanted, explained));
  }
  if (!is_offered && !is_told && !explained.is_extension_announced()) {
    reasons.push_back(
        reason_sentence(*find_decision(explained.composition, COMPOSE_SUBJECT_EXTENSION_ROOM), explained));
  }
  return reasons;
}

bool is_same_way(const steps_t &left, const steps_t &right) {
  return std::equal(left.begin(), left.end(), right.begin(), right.end(), [](const step_t &one, const step_t &other) {
    return one.action == other.action && one.key == other.key && one.value == other.value;
  });
}

std::vector<steps_t> ways_to(const wanted_t &wanted, const trials_t &trials) {
  std::vector<steps_t> ways;
  for (const opening_t opening : {opening_t::narrow, opening_t::wide}) {
    const auto way = find_way(wanted, trials, opening);
    if (way && (ways.empty() || !is_same_way(ways.front(), *way))) {
      ways.push_back(*way);
    }
  }
  return ways;
}

/// What stands against it for good, as the end of a sentence.
std::string why_no_way(const wanted_t &wanted) {
  if (wanted.subject == COMPOSE_SUBJECT_PASSED_BLOCK) {
    return ": such a block is only passed on from a sink, as it stands";
  }
  const u32 clock = wanted.subject == COMPOSE_SUBJECT_EXTENDED_MODE ? pixel_clock_of_vic(wanted.code) : 0;
  return clock <= hdmi_2_0_khz ? ""
                               : ": it needs " + std::to_string(clock / 1000) +
                                     " MHz, or half of it where the sink takes it in YCbCr "
                                     "4:2:0, and 600 MHz is the most that can be declared";
}

answer_t answer_to(const wanted_t &wanted, const trials_t &trials, const explained_t &explained) {
  answer_t answer;
  answer.name = wanted_name(wanted);
  answer.is_offered = is_offered(wanted, explained.composition.new_edid);
  answer.reasons = reasons_of(wanted, answer.is_offered, explained);
  if (answer.is_offered) {
    return answer;
  }
  answer.no_way = why_never(wanted);
  if (answer.no_way.empty() && explained.reading.is_incomplete()) {
    answer.no_way = "No change is advised, as " + explained.reading.missing_part + ": what it takes is not known.";
  }
  if (!answer.no_way.empty()) {
    return answer;
  }
  answer.ways = ways_to(wanted, trials);
  if (answer.ways.empty()) {
    answer.no_way = "No change was found that leads there" + why_no_way(wanted) + ".";
  }
  return answer;
}

}  // namespace

bool answers_t::is_any_offered() const {
  return std::any_of(answers.begin(), answers.end(), [](const answer_t &answer) { return answer.is_offered; });
}

std::vector<steps_t> other_ways(const answer_t &answer) {
  return answer.ways.empty() ? std::vector<steps_t>{}
                             : std::vector<steps_t>(answer.ways.begin() + 1, answer.ways.end());
}

answers_t answers_to(const std::vector<wanted_t> &wanted, const explained_t &explained) {
  const trials_t trials(explained);
  answers_t answers{explained.reading.gaps, {}};
  for (const wanted_t &one : wanted) {
    answer_t answer = answer_to(one, trials, explained);
    for (steps_t &way : answer.ways) {
      way = described(std::move(way), trials.original(), explained.places.name());
    }
    answers.answers.push_back(std::move(answer));
  }
  return answers;
}

}  // namespace edid_cli
