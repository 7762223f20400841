// The reasons of HDMI 2 as sentences.
#pragma once

#include <span>

#include "explain/reason_table.h"

namespace edid_cli {

std::span<const reason_text_t> hdmi2_reason_texts();

}  // namespace edid_cli
