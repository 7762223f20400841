// Audio masks: a bit for each audio type, as in compose_cfg_t::audio_mask.
#pragma once

#include "edid_composer/journal.h"

namespace edid_composer {

/// The bit of an audio type in an audio mask; 0 when it has none.
u32 _audio_type_to_audio_mask(u32 type);

/// The mask of all types in a list.
u32 _create_audio_mask(const ll_list_t *list);

/// Takes the formats out whose type is not in @p mask, the first entry excepted.
void _filter_audio_list_with_mask(ll_list_t *formats, u32 mask, entry_arena_t *arena, journal_t *journal);

}  // namespace edid_composer
