// The loudspeakers of a speaker allocation data block: CEA-861, section 7.5.3.
#pragma once

#include "edid_composer.h"

namespace edid_cli {

struct speaker_name_t {
  u32 bit;
  const char *abbreviation;
  const char *name;
};

inline constexpr speaker_name_t speaker_names[] = {
    {0x001, "FL/FR", "front left and right"},
    {0x002, "LFE", "LFE"},
    {0x004, "FC", "front centre"},
    {0x008, "RL/RR", "rear left and right"},
    {0x010, "RC", "rear centre"},
    {0x020, "FLC/FRC", "front left and right of centre"},
    {0x040, "RLC/RRC", "rear left and right of centre"},
    {0x080, "FLW/FRW", "front wide"},
    {0x100, "FLH/FRH", "front high"},
    {0x200, "TC", "top centre"},
    {0x400, "FCH", "front centre high"},
};

}  // namespace edid_cli
