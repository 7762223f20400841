#include <cstdio>

#include "commands.h"
#include "config_store.h"
#include "exit_status.h"

namespace edid_cli {

int run(const audio_mask_options_t &options) {
  print_edid_audio_mask(options.mask);
  return done_status;
}

int run(const platform_options_t &) {
  std::fputs(config_store_default_text(), stdout);
  return done_status;
}

}  // namespace edid_cli
