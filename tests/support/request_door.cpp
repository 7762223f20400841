// compose_edid() and compose_edid_internal() for programs of tests that are linked with --wrap of both: they go through
// compose_edid_request(). All that may tell them apart is the one look-up for the key that asks for HDMI 2, where the
// configuration is read; it is counted, and forgotten, so that the tests find what they find without it.
#include <cstdio>
#include <cstdlib>

#include "support/configuration_tree.h"

namespace {

constexpr const char *key_of_enable = "platform.software.drivers.vorex.edid.hdmi2.enable";

void expect_lookups(int expected) {
  const int lookups = test_support::configuration_tree_t::forget_calls(key_of_enable);
  if (lookups == expected) return;
  std::fprintf(stderr, "compose_edid_request: %d look-ups of %s, expected %d\n", lookups, key_of_enable, expected);
  std::abort();
}

bool compose(const u8 *edid_block, u32 edid_bytes, u8 *new_edid_block, u32 new_edid_bytes, const compose_cfg_t *cfg,
             const platform_values_t *platform_values) {
  compose_request_t request{};
  request.size = sizeof request;
  request.sink = edid_block;
  request.sink_bytes = edid_bytes;
  request.new_edid = new_edid_block;
  request.new_edid_bytes = new_edid_bytes;
  request.settings = cfg;
  request.platform_values = platform_values;
  compose_result_t result{};
  result.size = sizeof result;
  const bool composed = compose_edid_request(&request, &result);
  const bool reads = composed && platform_values == nullptr && test_support::configuration_tree_t::is_there();
  // One that fails ends before the look-up, or after it.
  if (composed) expect_lookups(reads ? 1 : 0);
  test_support::configuration_tree_t::forget_calls(key_of_enable);
  return composed;
}

}  // namespace

extern "C" {

// NOLINTBEGIN(bugprone-reserved-identifier): names that the linker makes.
bool __wrap_compose_edid_internal(const u8 *edid_block, u32 edid_bytes, u8 *new_edid_block, u32 new_edid_bytes,
                                  const compose_cfg_t *cfg, const platform_values_t *platform_values) {
  return compose(edid_block, edid_bytes, new_edid_block, new_edid_bytes, cfg, platform_values);
}

bool __wrap_compose_edid(const u8 *edid_block, u32 edid_bytes, u8 *new_edid_block, u32 new_edid_bytes,
                         const compose_cfg_t *cfg) {
  return compose(edid_block, edid_bytes, new_edid_block, new_edid_bytes, cfg, nullptr);
}
// NOLINTEND(bugprone-reserved-identifier)

}  // extern "C"
