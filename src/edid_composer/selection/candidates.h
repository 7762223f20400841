// The modes that the new EDID may offer: those that the sink or the platform's addition list has.
#pragma once

#include "edid_composer.h"
#include "linked_list/record_blocks.h"

namespace edid_composer {

struct candidate_t {
  u32 vic;
  u32 stereo;  ///< Mask of its 3D structures.
  bool of_sink;
};

/// What the candidates of one VIC have in common with a mode that is asked for.
struct match_t {
  bool found = false;
  bool of_sink = false;  ///< The sink has it, whether or not the addition list does too.
  u32 stereo = 0;        ///< The 3D structures that any of them shares with it.
};

/// One VIC may be named any number of times.
class candidates_t {
 public:
  /// Only @p ordered candidates can be listed and removed.
  candidates_t(bool ordered, entry_arena_t *arena) : ordered_(ordered), list_(arena) {}

  /// False, reported in the name of @p site, when there is no memory for it.
  [[nodiscard]] bool add(const candidate_t &candidate, const site_t &site, int line = __builtin_LINE());

  match_t match(const short_video_desc_t &wanted) const;

  /// Takes out those whose VIC @p is_removed returns true for, asking from the last to the first.
  template <typename predicate_t>
  void remove_if(predicate_t is_removed) {
    list_.visit_backwards([&](entry_t &entry) {
      if (entry.removed || !is_removed(entry.candidate.vic)) return;
      entry.removed = true;
      if (entry.candidate.vic < table_size) by_vic_[entry.candidate.vic] = {};
      --size_;
    });
  }

  /// In the order in which they were named.
  template <typename visitor_t>
  void for_each(visitor_t visit) const {
    for (const entry_t &entry : list_) {
      if (!entry.removed) visit(entry.candidate);
    }
  }

  u32 size() const { return size_; }

 private:
  /// The VICs that a short video descriptor can hold. A caller's addition list may have others.
  static constexpr u32 table_size = 128;

  struct named_t {
    u32 stereo;  ///< Of all candidates of the VIC.
    bool found;
    bool of_sink;
  };
  struct entry_t {
    candidate_t candidate;
    bool removed;
  };

  static match_t match_of(const named_t &named, u32 wanted_stereo) {
    return {named.found, named.of_sink, named.stereo & wanted_stereo};
  }

  bool ordered_;
  u32 size_ = 0;
  named_t by_vic_[table_size] = {};
  record_blocks_t<entry_t> list_;  ///< Of all candidates, or only of those whose VIC the table has no place for.
};

}  // namespace edid_composer
