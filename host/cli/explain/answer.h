// What stands in the way of one mode or format, and what would change it.
#pragma once

#include <string>
#include <vector>

#include "explain/explained.h"
#include "explain/wanted.h"

namespace edid_cli {

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
