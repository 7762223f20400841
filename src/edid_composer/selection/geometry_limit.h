// Keeping modes that are taller than the sink shows out of the selection.
#pragma once

#include "edid_composer/inputs.h"
#include "edid_composer/journal.h"
#include "edid_composer/selection/candidates.h"

namespace edid_composer {

struct geometry_limit_t {
  bool in_force = false;
  u32 lines = 0;  ///< Frame height of the sink's tallest short video descriptor.
};

/// Takes the candidates out that are taller than the sink shows, if the platform wants so.
geometry_limit_t limit_geometry(const inputs_t &inputs, candidates_t *candidates, journal_t *journal);

/// Frame height of the tallest mode, in lines; 0 for an empty list.
u32 _find_largest_height(const ll_list_t *video_list);

/// Takes out the candidates that are taller than @p limit lines.
void _remove_larger_height_modes(u32 limit, candidates_t *candidates, journal_t *journal);

}  // namespace edid_composer
