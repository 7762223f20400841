#include "edid_composer/selection/candidates.h"

namespace edid_composer {

bool candidates_t::add(const candidate_t &candidate, const site_t &site, int line) {
  const bool in_table = candidate.vic < table_size;
  if (in_table) {
    named_t &named = by_vic_[candidate.vic];
    named = {named.stereo | candidate.stereo, true, named.of_sink || candidate.of_sink};
  }
  if ((ordered_ || !in_table) && list_.add({candidate, false}, site, line) == nullptr) return false;
  ++size_;
  return true;
}

match_t candidates_t::match(const short_video_desc_t &wanted) const {
  if (wanted.vic < table_size) return match_of(by_vic_[wanted.vic], wanted.stereo);
  named_t named{};
  for_each([&](const candidate_t &candidate) {
    if (candidate.vic != wanted.vic) return;
    named = {named.stereo | candidate.stereo, true, named.of_sink || candidate.of_sink};
  });
  return match_of(named, wanted.stereo);
}

}  // namespace edid_composer
