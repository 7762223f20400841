// The modes that a composed EDID has to offer, worked out from what is known of the sink and the platform.
#pragma once

#include "random_situation.h"

namespace properties {

/// 50 or 60: the family of the sink's first mode that tells, else the platform's.
u32 native_rate_of(const situation_t &situation);

/// The modes of the platform's priority list that the sink or the platform's addition list has, in that order, with the
/// 3D structures that both sides name; the current mode before them, VIC 1 after them until there are four.
std::vector<test_support::mode_pair_t> modes_to_offer(const situation_t &situation);

/// The 4Kx2K modes of the priority list that the sink or the addition list has.
std::vector<u32> hdmi_vics_to_offer(const situation_t &situation);

}  // namespace properties
