// Selection of the audio formats that the new EDID offers.
#pragma once

#include "edid_composer.h"

namespace edid_composer {

class decisions_t;

/// Appends to @p ret_list the platform's and the sink's formats by the platform's pass-through mode, within the masks,
/// and basic audio in any case.
u32 _filter_audio_formats(const edid_t *edid, u32 audio_mask, u8 audio_sink_filter, ll_list_t *ret_list,
                          const platform_values_t *platform_values, decisions_t *decisions = nullptr);

/// Tells whether an entry makes a further format superfluous.
bool _covers(const short_audio_desc_t &entry, const short_audio_desc_t &audio);

/// Tells whether the list holds the format already.
u32 _audio_format_in_list(const ll_list_t *audio_list, const short_audio_desc_t *audio);

/// Tells whether the sink supports the format, and narrows it to what the sink can take.
u32 _audio_format_in_downstream_sink(const edid_t *edid, short_audio_desc_t *audio);

/// The bit of an audio type in an audio mask; 0 when it has none.
u32 _audio_type_to_audio_mask(u32 type);

/// The mask of all types in a list.
u32 _create_audio_mask(const ll_list_t *list);

/// Deletes the formats whose type is not in @p mask, the first entry excepted.
void _filter_audio_list_with_mask(ll_list_t *list, u32 mask, decisions_t *decisions = nullptr);

}  // namespace edid_composer
