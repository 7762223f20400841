#include <cstdlib>
#include <vector>

#include "edid_composer.h"
#include "measured.h"
#include "registration.h"

namespace bench {
namespace {

constexpr std::size_t entry_size = sizeof(ll_entry_t);
constexpr std::size_t payload_size = sizeof(short_video_desc_t);

void free_hidden(void *block) {
  benchmark::DoNotOptimize(block);
  std::free(block);
}

/// The heap calls of @p entries list entries, made and freed in the order in which a record does: what is left of
/// decoding when the library's own work is taken away.
void run_entries(benchmark::State &state) {
  const auto entries = static_cast<std::size_t>(state.range(0));
  std::vector<void *> blocks(2 * entries);
  measure(state, [&] {
    for (std::size_t i = 0; i < blocks.size(); i += 2) {
      blocks[i] = std::malloc(entry_size);
      blocks[i + 1] = std::malloc(payload_size);
    }
    for (std::size_t i = 0; i < blocks.size(); i += 2) {
      free_hidden(blocks[i + 1]);
      free_hidden(blocks[i]);
    }
  });
}

}  // namespace

void register_heap_benchmarks() {
  benchmark::RegisterBenchmark("heap/malloc_pair", [](benchmark::State &state) {
    measure(state, [] { free_hidden(std::malloc(entry_size)); });
  });
  benchmark::RegisterBenchmark("heap/entries", run_entries)->Arg(5)->Arg(10)->Arg(20)->Arg(40)->Arg(80)->Arg(160);
}

}  // namespace bench
