// Ways to have offered what is wanted: steps that are proved by composing with them.
#pragma once

#include <optional>

#include "explain/trial.h"

namespace edid_cli {

/// Where the sink has what is wanted and the platform leaves it out.
enum class opening_t {
  narrow,  ///< That one thing is added.
  wide     ///< All that the sink has is let through.
};

/// The next step for what stands in the way in a trial; none when no step is known.
std::optional<step_t> next_mode_step(const wanted_t &wanted, const trial_t &trial);
std::optional<step_t> next_audio_step(const wanted_t &wanted, const trial_t &trial, const explained_t &explained,
                                      opening_t opening);
/// For a platform whose audio formats can't be encoded, so that no EDID is composed; none for any other.
std::optional<step_t> step_that_drops_what_breaks(const trial_t &trial);
/// For deep colour and 3D.
std::optional<step_t> next_setting_step(const wanted_t &wanted, const trial_t &trial, const explained_t &explained);

/// For what HDMI 2 added: the feature's own key, or what it depends on.
std::optional<step_t> next_feature_step(const wanted_t &wanted, const trial_t &trial);
/// For a mode above VIC 64 that is too fast for the link: another rate, 4:2:0, or a box that makes it itself.
std::optional<step_t> next_rate_step(const wanted_t &wanted, const trial_t &trial);
step_t step_that_enables_hdmi2();

/// One mode less in the new EDID, the last that was chosen; none when there is no other.
std::optional<step_t> step_that_makes_room(const wanted_t &wanted, const trial_t &trial);

/// Steps that lead there, none of them superfluous; none when nothing was found that does.
std::optional<steps_t> find_way(const wanted_t &wanted, const trials_t &trials, opening_t opening);

}  // namespace edid_cli
