#include "edid_composer/selection/candidates.h"

namespace edid_composer {

bool candidates_t::add(const candidate_t &candidate, const site_t &site, int line) {
  if (candidates_.add({candidate, false}, site, line) == nullptr) return false;
  ++size_;
  return true;
}

match_t candidates_t::match(const short_video_desc_t &wanted) const {
  match_t match;
  for_each([&](const candidate_t &candidate) {
    if (candidate.vic != wanted.vic) return;
    match.found = true;
    match.of_sink |= candidate.of_sink;
    match.stereo |= wanted.stereo & candidate.stereo;
  });
  return match;
}

}  // namespace edid_composer
