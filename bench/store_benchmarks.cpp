#include "measured.h"
#include "platforms.h"
#include "registration.h"

namespace bench {
namespace {

/// A look-up of what is there, or of what isn't, behind state.range(0) bytes of other keys.
void run_lookup(benchmark::State &state, const char *path) {
  load_default_platform_behind(static_cast<u32>(state.range(0)));
  i32 value = 0;
  measure(state, [&] { benchmark::DoNotOptimize(config_get_int(0, path, &value)); });
}

}  // namespace

void register_store_benchmarks() {
  constexpr int smallest = 1 << 10;
  constexpr int largest = 1000 << 10;
  benchmark::RegisterBenchmark(
      "store/found",
      [](benchmark::State &state) { run_lookup(state, "platform.software.drivers.vorex.edid.native_refresh_rate"); })
      ->RangeMultiplier(4)
      ->Range(smallest, largest);
  benchmark::RegisterBenchmark(
      "store/not_found",
      [](benchmark::State &state) { run_lookup(state, "platform.software.drivers.vorex.edid.no_such_key"); })
      ->RangeMultiplier(4)
      ->Range(smallest, largest);
}

}  // namespace bench
