// Selection of the 4Kx2K modes (HDMI_VICs) that the new EDID offers.
#pragma once

#include <algorithm>
#include <iterator>

#include "edid_composer/inputs.h"

namespace edid_composer {

/// HDMI_VICs of one origin.
class hdmi_vics_t {
 public:
  static constexpr u32 most = static_cast<u32>(std::size(edid_t{}.hdmi_vic));

  void add(u32 vic) { vics_[count_++] = vic; }
  bool has(u32 vic) const { return std::find(begin(), end(), vic) != end(); }
  const u32 *begin() const { return vics_; }
  const u32 *end() const { return vics_ + count_; }
  u32 size() const { return count_; }

 private:
  u32 vics_[most];
  u32 count_ = 0;
};

struct selection_4k_t {
  hdmi_vics_t of_sink;
  hdmi_vics_t addition;
  hdmi_vics_t priority;
  hdmi_vics_t selected;
};

/// Selects what the platform's priority list names and the sink or the addition list has, best first.
selection_4k_t _filter_4k_modes(const inputs_t &inputs);

}  // namespace edid_composer
