// "audio-mask": an audio mask in words.
#pragma once

#include "commands/command.h"

namespace edid_cli {

command_t audio_mask_command();

}  // namespace edid_cli
