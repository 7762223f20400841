#include "commands/audio_mask_command.h"

#include <memory>

#include "commands/exit_status.h"
#include "commands/option_values.h"
#include "edid_composer.h"

namespace edid_cli {

command_t audio_mask_command() {
  const auto mask = std::make_shared<u32>(0);
  return {"audio-mask",
          "Print an audio mask in words",
          {required(option("MASK", "", *mask, parse_mask, "Decimal or 0x hexadecimal"))},
          [mask] {
            print_edid_audio_mask(*mask);
            return done_status;
          }};
}

}  // namespace edid_cli
