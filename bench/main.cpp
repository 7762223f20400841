// The library reports on C's stdout; the benchmarks' table goes to std::cout, which keeps the stream it began with.
#include <benchmark/benchmark.h>

#include <cstdio>

#include "registration.h"

int main(int argc, char **argv) {
  std::FILE *const nowhere = std::fopen("/dev/null", "w");
  if (nowhere == nullptr) {
    std::perror("/dev/null");
    return 1;
  }
  stdout = nowhere;

  bench::register_heap_benchmarks();
  bench::register_codec_benchmarks();
  bench::register_stage_benchmarks();
  bench::register_composition_benchmarks();
  bench::register_growth_benchmarks();
  bench::register_store_benchmarks();
  benchmark::Initialize(&argc, argv);
  if (benchmark::ReportUnrecognizedArguments(argc, argv)) return 2;
  benchmark::RunSpecifiedBenchmarks();
  return 0;
}
