/* A host in C: the store's header needs nothing before it, the tree is empty before the first load, and the default
 * platform is there. Answers 0 when all of it holds. */
#include "config_store.h"

#include <stdio.h>
#include <string.h>

#include "edid_composer.h"

#define CHECK(condition)                                      \
  do {                                                        \
    if (!(condition)) {                                       \
      fprintf(stderr, "line %d: %s\n", __LINE__, #condition); \
      return 1;                                               \
    }                                                         \
  } while (0)

int main(void) {
  const char *week = "platform.software.drivers.vorex.edid.week";
  u32 node = 0;
  i32 value = 0;

  CHECK(strcmp(config_store_error(), "") == 0);
  CHECK(config_node_first_child(0, &node) == 2);
  CHECK(config_get_int(0, week, &value) != 0);

  CHECK(!config_store_load_file("/nonexistent"));
  CHECK(strcmp(config_store_error(), "/nonexistent: No such file or directory") == 0);
  CHECK(config_node_first_child(0, &node) == 2);

  CHECK(config_store_load_default());
  CHECK(config_get_int(0, week, &value) == 0);
  CHECK(value == 1);
  return 0;
}
