// Selection of the audio formats that the new EDID offers.
#pragma once

#include "edid_composer/journal.h"

namespace edid_composer {

/// Whose formats are offered: the platform's setting "audio_pass_through".
enum pass_through_t : i32 {
  platform_only = 0,
  platform_and_sink = 1,
  sink_only = 2,
};

/// Appends to @p formats the platform's and the sink's formats by the platform's pass-through mode, within the masks,
/// and basic audio in any case. False when a list entry could not be had.
bool _filter_audio_formats(const inputs_t &inputs, ll_list_t *formats, journal_t *journal);

}  // namespace edid_composer
