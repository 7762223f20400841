#include "measured.h"

namespace bench {

void show_heap_use(benchmark::State &state, const heap_use_t &use) {
  state.counters["allocations"] = static_cast<double>(use.allocations);
  state.counters["frees"] = static_cast<double>(use.frees);
  state.counters["bytes"] = static_cast<double>(use.bytes);
}

}  // namespace bench
