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

/// Keeps the candidates in the order in which they are named. One VIC may be named any number of times.
class candidates_t {
 public:
  /// False, reported in the name of @p site, when there is no memory for it.
  [[nodiscard]] bool add(const candidate_t &candidate, const site_t &site, int line = __builtin_LINE());

  match_t match(const short_video_desc_t &wanted) const;

  /// Takes out those for which @p is_removed returns true, from the last to the first.
  template <typename predicate_t>
  void remove_if(predicate_t is_removed) {
    candidates_.visit_backwards([&](entry_t &entry) {
      if (entry.removed || !is_removed(entry.candidate.vic)) return;
      entry.removed = true;
      --size_;
    });
  }

  template <typename visitor_t>
  void for_each(visitor_t visit) const {
    for (const entry_t &entry : candidates_) {
      if (!entry.removed) visit(entry.candidate);
    }
  }

  u32 size() const { return size_; }

 private:
  struct entry_t {
    candidate_t candidate;
    bool removed;
  };
  record_blocks_t<entry_t> candidates_;
  u32 size_ = 0;
};

}  // namespace edid_composer
