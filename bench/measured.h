// Runs an operation under Google Benchmark, with the heap calls that it makes beside its time.
#pragma once

#include <benchmark/benchmark.h>

#include "heap_meter.h"

namespace bench {

/// Runs before the one whose heap calls are counted.
inline constexpr unsigned warm_up_runs = 3;

/// Shows heap calls and bytes of one run: "allocations" and "frees" of "bytes".
void show_heap_use(benchmark::State &state, const heap_use_t &use);

template <typename operation_t>
void measure(benchmark::State &state, operation_t operation) {
  // What a first run leaves behind (buffers, bound symbols) is no part of the cost of the others.
  for (unsigned i = 0; i < warm_up_runs; ++i)
    operation();
  show_heap_use(state, heap_use_of(operation));
  for (auto _ : state)
    operation();
}

}  // namespace bench
