// What stands in the way of one mode or format, and what would change it.
#pragma once

#include <string>
#include <vector>

#include "explain/explained.h"
#include "explain/step.h"
#include "explain/wanted.h"

namespace edid_cli {

struct answer_t {
  std::string name;
  bool is_offered = false;
  std::vector<std::string> reasons;  ///< Sentences.
  std::vector<steps_t> ways;         ///< Each leads there alone, which was tried; the narrowest comes first.
  std::string no_way;                ///< Why there is none; empty when there is one, or when it is offered.
};

struct answers_t {
  std::vector<std::string> sink_gaps;  ///< What was not read of the sink, and why.
  std::vector<answer_t> answers;

  bool is_any_offered() const;
};

/// All ways but the first.
std::vector<steps_t> other_ways(const answer_t &answer);

/// Composes many times; the configuration store holds the same platform after it, but without its file's positions.
answers_t answers_to(const std::vector<wanted_t> &wanted, const explained_t &explained);

}  // namespace edid_cli
