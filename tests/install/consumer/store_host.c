/* A host outside of the source tree, on the configuration store. Valid C11 and C++20: it is built as both. */
#include <config_store.h>
#include <edid_composer.h>
#include <stdio.h>

int main(void) {
  u8 new_edid[256];
  u8 spa_offset = 0;
  const compose_cfg_t settings = {.audio_mask = 0xFFFFFFFF, .hdmi_3d_mode = 1, .spa_offset = &spa_offset, .port = 2};
  if (!config_store_load_default()) {
    fprintf(stderr, "%s\n", config_store_error());
    return 1;
  }
  if (!compose_edid(NULL, 0, new_edid, sizeof new_edid, &settings)) return 1;
  print_edid(new_edid, sizeof new_edid, 1, "Default platform");
  printf("address %02X%02X\n", new_edid[spa_offset], new_edid[spa_offset + 1]);
  return 0;
}
