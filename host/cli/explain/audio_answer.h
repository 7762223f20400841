// What stands in the way of an audio format.
#pragma once

#include "explain/answer.h"

namespace edid_cli {

answer_t audio_answer(u32 type, const explained_t &explained);

}  // namespace edid_cli
