// The road of one composition, from a request to the bytes of the new EDID.
#pragma once

#include "edid_composer.h"

namespace edid_composer {

/// Whether a composition may have what HDMI 2 adds, if request or configuration ask for it.
enum class hdmi2_access_t : bool { none, on_demand };

/// Composes in the name of compose_edid_internal(). @p request has the size of this version, @p result holds zeros.
bool compose(const compose_request_t &request, hdmi2_access_t access, compose_result_t *result);

}  // namespace edid_composer
