// The decisions of one composition, as an observer receives them.
#pragma once

#include <cstdint>

#include "edid_composer/inputs.h"
#include "linked_list/record_blocks.h"

namespace edid_composer {

/// Sets what became of a candidate, and why.
void decide(compose_decision_t *decision, compose_verdict verdict, compose_reason reason, reason_values_t values = {});

/// True when the candidate is chosen, as things stand.
inline bool is_chosen(const compose_decision_t &decision) {
  return decision.verdict == COMPOSE_VERDICT_OFFERED || decision.verdict == COMPOSE_VERDICT_CHANGED;
}

class decisions_t {
 public:
  explicit decisions_t(entry_arena_t *arena) : decisions_(arena) {}

  /// Adds a candidate or value. Where there is no memory for it, the decisions stay incomplete.
  compose_decision_t *add(compose_subject subject, u32 code);
  /// The candidate of this code, added once however many name it.
  compose_decision_t *candidate(compose_subject subject, u32 code);
  /// Adds a candidate by who names it, at which place of the list that it stands in.
  compose_decision_t *nominate(compose_subject subject, u32 code, compose_origin origin, i32 index);
  /// Nominates all modes of a list. One that can't be walked is passed over in silence: its stage has reported it.
  /// VICs above @p largest_vic are passed over too.
  void nominate_modes(const ll_list_t &modes, compose_origin origin, u32 largest_vic = UINT32_MAX);
  /// Adds a derived value.
  void note(compose_subject subject, u32 code, compose_verdict verdict, compose_reason reason,
            reason_values_t values = {});

  /// In the order in which they were added.
  const record_blocks_t<compose_decision_t> &all() const { return decisions_; }

  /// Passes all on, or nothing when a decision is missing: the others might then be wrong.
  void pass_on(compose_observer_t observer, void *context) const;

 private:
  /// Where the decision on a mode stands: a short video descriptor can hold VICs up to 127.
  compose_decision_t **place_of_mode(compose_subject subject, u32 code);

  record_blocks_t<compose_decision_t> decisions_;
  compose_decision_t *modes_[128] = {};
  compose_decision_t unheard_{};
  bool complete_ = true;
};

}  // namespace edid_composer
