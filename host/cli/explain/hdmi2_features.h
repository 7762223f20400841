// What HDMI 2 added besides modes, each with the key of the platform that it hangs on.
#pragma once

#include <span>

#include "edid_composer.h"

namespace edid_cli {

struct hdmi2_feature_t {
  u32 subject;
  u32 code;          ///< As of a decision; any_code where the subject has one feature only.
  const char *name;  ///< "HDR with PQ (HDR10)".
  const char *key;   ///< Of the platform.
};
inline constexpr u32 any_code = 0xFFFFFFFF;

std::span<const hdmi2_feature_t> hdmi2_features();

/// The feature that a decision is about; nullptr for one about anything else.
const hdmi2_feature_t *find_hdmi2_feature(u32 subject, u32 code);

/// Whether a subject is one of those of HDMI 2.
bool is_of_hdmi2(u32 subject);

}  // namespace edid_cli
