// What the list stages have found and decided, entry by entry, for whoever explains the composition afterwards.
#pragma once

#include "edid_composer/inputs.h"
#include "linked_list/record_blocks.h"

namespace edid_composer {

/// One candidate at one place: who names it, or what becomes of it and why.
struct journal_entry_t {
  compose_subject subject;
  compose_origin origin{};  ///< Who names it; 0 for a verdict.
  i32 index = -1;           ///< Its place in the list that names it, or among the candidates chosen before.
  u32 code = 0;             ///< As in compose_decision_t; 0: it has none.
  compose_reason reason{};  ///< Why it is chosen or left out; 0 when it is only named.
  reason_values_t values{};
};

/// Keeps the entries of an observed composition; that of any other forgets them.
class journal_t {
 public:
  journal_t(bool kept, entry_arena_t *arena) : entries_(arena), kept_(kept) {}

  void note(const journal_entry_t &entry);

  /// False when an entry could not be kept: what follows from the others might then be wrong.
  bool is_complete() const { return complete_; }
  const record_blocks_t<journal_entry_t> &entries() const { return entries_; }

 private:
  record_blocks_t<journal_entry_t> entries_;
  bool kept_;
  bool complete_ = true;
};

}  // namespace edid_composer
