// What stands in the way of one mode or format, and what would change it.
#pragma once

#include <string>
#include <string_view>
#include <variant>
#include <vector>

#include "explain/explained.h"

namespace edid_cli {

/// One thing that may be wanted: a video mode by its VIC, a 4Kx2K mode by its HDMI_VIC, or an audio type.
struct wanted_t {
  compose_subject subject;
  u32 code;
};

/// "16", "1920x1080p60", "4k:1", "audio:2" or "ac3". More than one where modes differ in their aspect ratio only.
/// Throws bad_input_t.
std::vector<wanted_t> parse_wanted(std::string_view text);

/// One change. What has to be done is all of an answer's steps.
struct step_t {
  std::string text;   ///< "add \"16\" to 60_hz_priority_list (box.toml:40)".
  std::string key{};  ///< Of the platform, or the option.
  unsigned line = 0;  ///< 0: it is not in the platform's file.
};

struct answer_t {
  std::string name;
  bool is_offered = false;
  std::vector<std::string> reasons;  ///< Sentences.
  std::vector<step_t> steps;         ///< None when it is offered.
};

/// Whether sources find what is chosen. Without an extension they find the first two video modes, which are detailed
/// timings as well.
bool is_found_by_sources(const compose_decision_t &decision, const explained_t &explained);

/// Adds what stands in the way of everything.
void add_general_reasons(const explained_t &explained, answer_t &answer);

answer_t answer(const wanted_t &wanted, const explained_t &explained);

}  // namespace edid_cli
