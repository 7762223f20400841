/* The smallest host, in C: the eight config_* operations over a table, and one composition.
 *
 *   minimal_host [FILE]
 *
 * Composes what the third input of a television shows and prints it in brief. With FILE, writes its 256 bytes there.
 * Build: cc -std=c11 minimal_host.c $(pkg-config --cflags --libs edid_composer)
 */
#include <edid_composer.h>
#include <stdio.h>
#include <string.h>

#define EDID "platform.software.drivers.vorex.edid."

/* What the operations return. Of find and first_child, the library takes every status but 2 for "found". */
enum { is_found = 0, has_other_type = 1, is_missing = 2 };
enum kind { integer, text, list };

/* The configuration. A node's handle is its row; the entries of a list follow it. Every key that is missing here has
 * its default, and the library prints a warning. */
static const struct {
  const char *path;
  enum kind kind;
  i32 number;
  const char *characters;
} nodes[] = {
    {EDID "monitor_name", text, 0, "Table Box"},     {EDID "manufacturer_id", text, 0, "ZQA"},
    {EDID "product_id", integer, 0x1234, ""},        {EDID "is_tv", integer, 1, ""},
    {EDID "60_hz_priority_list", list, 0, ""},       {EDID "60_hz_priority_list.best", text, 0, "16"},
    {EDID "60_hz_priority_list.good", text, 0, "4"}, {EDID "60_hz_priority_list.fair", text, 0, "3"},
    {EDID "60_hz_priority_list.last", text, 0, "1"}, {EDID "60_hz_addition_list", list, 0, ""},
    {EDID "60_hz_addition_list.a", text, 0, "16"},   {EDID "60_hz_addition_list.b", text, 0, "4"},
    {EDID "60_hz_addition_list.c", text, 0, "3"},    {EDID "60_hz_addition_list.d", text, 0, "1"},
};
static const u32 node_count = sizeof nodes / sizeof nodes[0];

/* Whether the node after this one has the first `length` characters of its path, and a dot. */
static int next_is_under(u32 node, size_t length) {
  return node + 1 < node_count && strncmp(nodes[node + 1].path, nodes[node].path, length) == 0 &&
         nodes[node + 1].path[length] == '.';
}

int config_node_find(u32 root, const char *path, u32 *node) {
  for (u32 i = 0; root == 0 && i < node_count; ++i) {
    if (strcmp(nodes[i].path, path) == 0) {
      *node = i;
      return is_found;
    }
  }
  return is_missing;
}

int config_node_first_child(u32 node, u32 *child) {
  if (!next_is_under(node, strlen(nodes[node].path))) return is_missing;
  *child = node + 1;
  return is_found;
}

int config_node_next_sibling(u32 node, u32 *sibling) {
  if (!next_is_under(node, (size_t)(strrchr(nodes[node].path, '.') - nodes[node].path))) return is_missing;
  *sibling = node + 1;
  return is_found;
}

int config_node_get_name(u32 node, char *buffer, u32 size) {
  snprintf(buffer, size, "%s", strrchr(nodes[node].path, '.') + 1);
  return is_found;
}

int config_node_get_int(u32 node, i32 *value) {
  if (nodes[node].kind != integer) return has_other_type;
  *value = nodes[node].number;
  return is_found;
}

int config_node_get_str(u32 node, char *buffer, u32 size) {
  if (nodes[node].kind != text) return has_other_type;
  snprintf(buffer, size, "%s", nodes[node].characters);
  return is_found;
}

int config_get_int(u32 root, const char *path, i32 *value) {
  u32 node = 0;
  return config_node_find(root, path, &node) == is_found ? config_node_get_int(node, value) : is_missing;
}

int config_get_str(u32 root, const char *path, char *buffer, u32 size) {
  u32 node = 0;
  return config_node_find(root, path, &node) == is_found ? config_node_get_str(node, buffer, size) : is_missing;
}

static int write_file(const char *path, const u8 *bytes, size_t size) {
  FILE *file = fopen(path, "wb");
  if (file == NULL) return 0;
  const int is_written = fwrite(bytes, 1, size, file) == size;
  return fclose(file) == 0 && is_written;
}

int main(int argc, char **argv) {
  u8 new_edid[256];
  const compose_cfg_t settings = {.audio_mask = 0xFFFFFFFF, .hdmi_3d_mode = 1, .port = 2};
  if (!compose_edid(NULL, 0, new_edid, sizeof new_edid, &settings)) return 1;
  print_edid(new_edid, sizeof new_edid, 1, "What the third input shows");
  if (argc > 1 && !write_file(argv[1], new_edid, sizeof new_edid)) {
    perror(argv[1]);
    return 1;
  }
  return 0;
}
