// A small composition for each reason, and the record that tells it.
#pragma once

#include <functional>
#include <ostream>
#include <vector>

#include "edid_composer/explain/observed_composition.h"

namespace observed {

struct case_t {
  const char *name;
  std::function<void(situation_t &)> arrange;
  told_t told;
};

inline void PrintTo(const case_t &named, std::ostream *out) {
  *out << named.name;
}

std::vector<case_t> video_cases();
std::vector<case_t> audio_cases();
std::vector<case_t> selection_cases();   ///< Refresh family, geometry, current mode, padding.
std::vector<case_t> hdmi2_cases();       ///< What HDMI 2 adds.
std::vector<case_t> capability_cases();  ///< Address, colours, clock, latencies, 3D, room.

}  // namespace observed
