/* The smallest host: a C program that knows the public header only, keeps its configuration in a table, and composes an
 * EDID without a sink. */
#include "edid_composer.h"

#include <stdio.h>
#include <string.h>

#include "record_layout.h"

#define DOMAIN "platform.software.drivers.vorex.edid."
#define COUNT(array) (sizeof(array) / sizeof((array)[0]))

/* A node is known by its position here plus 1. Entries of a list stand behind it, one behind the other. */
static const struct {
  const char *path;
  const char *text; /* NULL: the node holds a number, or entries when it is a list. */
  i32 number;
  int is_list;
  int is_last_entry;
} nodes[] = {
    {DOMAIN "is_tv", NULL, 1, 0, 0},
    {DOMAIN "product_id", NULL, 0x1234, 0, 0},
    {DOMAIN "serial", NULL, 0x01020304, 0, 0},
    {DOMAIN "manufacturer_id", "ABC", 0, 0, 0},
    {DOMAIN "monitor_name", "Minimal", 0, 0, 0},
    {DOMAIN "60_hz_priority_list", NULL, 0, 1, 0},
    {"a", "16", 0, 0, 0},
    {"b", "4", 0, 0, 0},
    {"c", "5", 0, 0, 0},
    {"d", "2", 0, 0, 1},
    {DOMAIN "60_hz_addition_list", NULL, 0, 1, 0},
    {"a", "2", 0, 0, 0},
    {"b", "4", 0, 0, 0},
    {"c", "5", 0, 0, 0},
    {"d", "16", 0, 0, 1},
};

static u32 node_at(const char *path) {
  for (u32 i = 0; i < COUNT(nodes); ++i) {
    if (strcmp(nodes[i].path, path) == 0) return i + 1;
  }
  return 0;
}

int config_node_find(u32 root, const char *path, u32 *node) {
  const u32 found = node_at(path);
  if (root != 0 || found == 0) return 2;
  *node = found;
  return 0;
}

int config_node_first_child(u32 node, u32 *child) {
  if (!nodes[node - 1].is_list) return 2;
  *child = node + 1;
  return 0;
}

int config_node_next_sibling(u32 node, u32 *sibling) {
  if (nodes[node - 1].is_last_entry) return 2;
  *sibling = node + 1;
  return 0;
}

int config_node_get_name(u32 node, char *buffer, u32 size) {
  snprintf(buffer, size, "%s", nodes[node - 1].path);
  return 0;
}

int config_node_get_int(u32 node, i32 *value) {
  if (nodes[node - 1].text != NULL || nodes[node - 1].is_list) return 1;
  *value = nodes[node - 1].number;
  return 0;
}

int config_node_get_str(u32 node, char *buffer, u32 size) {
  if (nodes[node - 1].text == NULL) return 1;
  snprintf(buffer, size, "%s", nodes[node - 1].text);
  return 0;
}

int config_get_int(u32 root, const char *path, i32 *value) {
  const u32 node = node_at(path);
  return root != 0 || node == 0 ? 2 : config_node_get_int(node, value);
}

int config_get_str(u32 root, const char *path, char *buffer, u32 size) {
  const u32 node = node_at(path);
  return root != 0 || node == 0 ? 2 : config_node_get_str(node, buffer, size);
}

static int failures = 0;

static void expect(int holds, const char *what) {
  if (holds) return;
  fprintf(stderr, "FAILED: %s\n", what);
  ++failures;
}

#define EXPECT(condition) expect((condition), #condition)

static u8 block_sum(const u8 *block) {
  u8 sum = 0;
  for (int i = 0; i < 128; ++i)
    sum = (u8)(sum + block[i]);
  return sum;
}

static void check_base_block(const u8 *edid) {
  static const u8 start[] = {0, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 0, 0x04, 0x43, 0x34, 0x12, 4, 3, 2, 1};
  static const u8 name[] = {0, 0, 0, 0xFC, 0, 'M', 'i', 'n', 'i', 'm', 'a', 'l', '\n', ' ', ' ', ' ', ' ', ' '};
  EXPECT(memcmp(edid, start, sizeof(start)) == 0);
  EXPECT(memcmp(edid + 90, name, sizeof(name)) == 0);
  EXPECT(edid[126] == 1);
  EXPECT(block_sum(edid) == 0);
}

static void check_extension(const u8 *extension) {
  /* Speakers, then the four modes, the first of them marked native. */
  static const u8 blocks[] = {0x83, 0x01, 0x00, 0x00, 0x44, 0x90, 4, 5, 2};
  EXPECT(extension[0] == 2 && extension[1] == 3);
  EXPECT(memcmp(extension + 4, blocks, sizeof(blocks)) == 0);
  EXPECT(block_sum(extension) == 0);
}

int main(void) {
  u8 edid[258];
  u8 spa_offset = 0;
  const compose_cfg_t settings = {.audio_mask = 0xFFFFFFFF, .spa_offset = &spa_offset, .port = 2};

  EXPECT(!debug_enabled());
  EXPECT(strncmp(gVersion, "#@# libedid_composer.so ", 24) == 0);
  memset(edid, 0xEE, sizeof(edid));
  EXPECT(compose_edid(NULL, 0, edid + 1, 256, &settings));
  EXPECT(edid[0] == 0xEE && edid[257] == 0xEE);
  check_base_block(edid + 1);
  check_extension(edid + 1 + 128);
  EXPECT(spa_offset > 128 && edid[1 + spa_offset] == 0x30 && edid[1 + spa_offset + 1] == 0x00);
  return failures == 0 ? 0 : 1;
}
