// Composing with changes that nobody has made yet: an answer is tried before it is given.
#pragma once

#include "explain/explained.h"
#include "explain/step.h"
#include "explain/wanted.h"

namespace edid_cli {

/// What came of some steps.
struct trial_t {
  platform_draft_t platform;
  composition_options_t options;
  composition_t composition;
  bool is_reached = false;  ///< What is wanted is offered, in an EDID that sources read as it is meant.

  /// The first decision about a subject and a code; nullptr when there is none.
  const compose_decision_t *find(u32 subject, u32 code) const;
  u32 family() const;
  bool is_extension_announced() const;
  /// Whether the data blocks fit the extension and their length fields.
  bool has_room() const;
};

/// While it lives the configuration store may hold a changed platform; then the original one again, but without its
/// file's positions.
class trials_t {
 public:
  explicit trials_t(const explained_t &explained) : explained_(explained) {}
  ~trials_t();
  trials_t(const trials_t &) = delete;
  trials_t &operator=(const trials_t &) = delete;

  trial_t run(const wanted_t &wanted, const steps_t &steps) const;
  const platform_draft_t &original() const { return original_; }
  const explained_t &explained() const { return explained_; }

 private:
  const explained_t &explained_;
  const platform_draft_t original_;
};

}  // namespace edid_cli
