// What an observed composition tells of itself.
//
// A stage notes a candidate when somebody names it and what becomes of it where that is decided; a later stage may
// decide otherwise. What holds in the end is told once, when the bytes are written.
#pragma once

#include "diagnostics.h"
#include "linked_list/element_types.h"

namespace edid_composer {

template <>
inline constexpr const char *element_type_name<compose_decision_t> = "compose_decision_t";

/// Numbers behind a reason; see compose_reason.
struct reason_values_t {
  i32 first = 0;
  i32 second = 0;
  i32 third = 0;
  i32 fourth = 0;
};

/// A number of the library's records as one behind a reason.
template <typename number_t>
constexpr i32 reason_value(number_t number) {
  return static_cast<i32>(number);
}

template <typename... numbers_t>
constexpr reason_values_t reason_values(numbers_t... numbers) {
  return {reason_value(numbers)...};
}

/// Sets what became of a candidate, and why.
void decide(compose_decision_t *decision, compose_verdict verdict, compose_reason reason, reason_values_t values = {});

/// Tells whether the candidate is chosen, as things stand.
inline bool is_chosen(const compose_decision_t &decision) {
  return decision.verdict == COMPOSE_VERDICT_OFFERED || decision.verdict == COMPOSE_VERDICT_CHANGED;
}

/// Tells without a word whether a walk over a list has nothing to report.
template <typename record_t>
bool is_walkable(const ll_list_t &list) {
  return ll_is_initialized(&list) && ll_verify_list_type(&list, element_type_name<record_t>);
}

/// The decisions of one composition. Stages are given a null pointer when nobody observes.
class decisions_t {
 public:
  /// @p site reports what goes wrong with the decisions themselves.
  explicit decisions_t(const site_t &site);
  ~decisions_t();
  decisions_t(const decisions_t &) = delete;
  decisions_t &operator=(const decisions_t &) = delete;

  /// Notes a further candidate or value. Where there is no memory for it, nobody will hear of any.
  compose_decision_t *add(compose_subject subject, u32 code);
  /// The candidate of this code, noted once however many name it.
  compose_decision_t *candidate(compose_subject subject, u32 code);
  /// Notes a candidate by who names it, at which place of the list that it stands in.
  compose_decision_t *nominate(compose_subject subject, u32 code, compose_origin origin, i32 index);
  /// Notes all modes of a list. One that can't be walked is passed over in silence: it is not for an observer to
  /// report.
  void nominate_modes(const ll_list_t &modes, compose_origin origin);
  /// Notes a derived value.
  void note(compose_subject subject, u32 code, compose_verdict verdict, compose_reason reason,
            reason_values_t values = {});

  /// The chosen candidate of a subject that @p place others were chosen before; null when there are not as many.
  compose_decision_t *chosen(compose_subject subject, u32 place);

  /// All decisions, in the order in which they were noted.
  const ll_list_t *list() const { return &list_; }
  const site_t &site() const { return site_; }

  /// Tells all, or nothing when a decision is missing: the others might then be wrong.
  void tell(compose_observer_t observer, void *context) const;

 private:
  site_t site_;
  ll_list_t list_{};
  compose_decision_t unheard_{};
  bool complete_ = true;
};

}  // namespace edid_composer
