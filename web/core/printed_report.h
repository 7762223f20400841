// The library's report of an EDID, as a text.
#pragma once

#include <span>
#include <string>

#include "edid_composer.h"

namespace edid_web {

std::string printed_report(std::span<const u8> edid, const std::string &title);

}  // namespace edid_web
