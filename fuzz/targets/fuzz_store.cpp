// The configuration store: any text is loaded or refused in one line, and a composition from what was loaded ends.
#include <array>
#include <cstring>
#include <string>

#include "config_store.h"
#include "fuzz_target.h"

namespace {

/// Visits every node below @p node; a handle leads to each of them only once.
void walk(u32 node, int depth) {
  FUZZ_REQUIRE(depth < 1000);
  u32 child = 0;
  if (config_node_first_child(node, &child) != 0) return;
  do {
    std::array<char, 64> text{};
    i32 number = 0;
    unsigned line = 0;
    FUZZ_REQUIRE(config_node_get_name(child, text.data(), text.size()) == 0);
    FUZZ_REQUIRE(config_store_node_position(child, &line, nullptr) && line > 0);
    const bool is_number = config_node_get_int(child, &number) == 0;
    const bool is_text = config_node_get_str(child, text.data(), text.size()) == 0;
    FUZZ_REQUIRE(!(is_number && is_text));
    walk(child, depth + 1);
  } while (config_node_next_sibling(child, &child) == 0);
}

}  // namespace

int LLVMFuzzerTestOneInput(const u8 *data, std::size_t size) {
  const bool loaded = config_store_load_text(reinterpret_cast<const char *>(data), size, "fuzz.toml");
  FUZZ_REQUIRE(loaded == (*config_store_error() == '\0'));
  FUZZ_REQUIRE(std::strchr(config_store_error(), '\n') == nullptr);
  if (!loaded) return 0;
  u32 root = 0;
  if (config_node_find(0, "platform", &root) != 2) walk(root, 0);

  std::array<u8, 256> edid{};
  const compose_cfg_t settings{};
  compose_edid(nullptr, 0, edid.data(), edid.size(), &settings);
  return 0;
}
