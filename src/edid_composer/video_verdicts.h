// What the selection of the video modes tells an observer.
#pragma once

#include "edid_composer/decisions.h"

namespace edid_composer {

/// Notes a timing of the sink that has no VIC.
void note_timing_without_vic(decisions_t *decisions, const detailed_timing_t &timing, i32 index);
void note_timing_without_vic(decisions_t *decisions, const std_timing_t &timing, i32 index);

/// Notes who is named by the lists that are in use at @p rate, and by those that are not.
void nominate_platform_modes(decisions_t *decisions, i32 rate, const platform_values_t &values);

/// Decides on all candidates: those of @p ret_modes are offered, the others left out.
void judge_video_modes(decisions_t *decisions, i32 rate, const ll_list_t &ret_modes);

/// Notes what became of the mode that the platform puts out now; @p vic is 0 when it has none.
void note_current_mode(decisions_t *decisions, const video_mode_t &mode, u32 vic, compose_reason reason);

/// A mode that is offered whoever else names it.
void offer_mode(decisions_t *decisions, u32 vic, compose_origin origin, compose_reason reason);

}  // namespace edid_composer
