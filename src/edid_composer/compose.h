// The road of one composition, from a request to the bytes of the new EDID.
#pragma once

#include "edid_composer.h"

namespace edid_composer {

/// Composes in the name of compose_edid_internal(). @p request has the size of this version, @p result holds zeros.
bool compose(const compose_request_t &request, compose_result_t *result);

}  // namespace edid_composer
