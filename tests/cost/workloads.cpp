// Runs one of the workloads whose cost is watched, in cost_measured_run(), once what only first runs do is done. Tells
// its heap calls on standard error: allocations, frees, bytes.
#include <algorithm>
#include <array>
#include <cstdio>
#include <cstring>
#include <functional>
#include <stdexcept>
#include <string>

#include "bench/heap_meter.h"
#include "bench/platforms.h"
#include "bench/sinks.h"

namespace {

using bench::sink_t;
using operation_t = std::function<void()>;

constexpr u32 block_size = 128;

const sink_t &heaviest_sample() {
  const auto &sinks = bench::sample_sinks();
  const auto found = std::find_if(sinks.begin(), sinks.end(), [](const sink_t &sink) { return sink.name == "tv_4k"; });
  if (found == sinks.end()) throw std::runtime_error("the sample sink tv_4k is gone");
  return *found;
}

void decode(const sink_t &sink, edid_t *edid) {
  edid_prepare(edid);
  if (decode_edid_block_0(sink.data(), edid) != 1 ||
      decode_edid_extensions(sink.data() + block_size, block_size, edid) != 1) {
    throw std::runtime_error("the sink does not decode");
  }
}

operation_t decode_and_destroy(const sink_t &sink) {
  return [sink] {
    edid_t edid;
    decode(sink, &edid);
    edid_destroy(&edid);
  };
}

operation_t report(const sink_t &sink) {
  static edid_t edid;
  decode(sink, &edid);
  return [] { print_edid_struct(&edid, 0, "Sink"); };
}

operation_t compose_with_values(const sink_t &sink, u32 priority) {
  static bench::values_t values;
  bench::fill_sample(&values);
  if (priority != 0) bench::prioritize_first_vics(&values, priority);
  return [sink] {
    std::array<u8, 2 * block_size> output;
    const compose_cfg_t cfg = bench::sample_settings();
    if (!compose_edid_internal(sink.data(), sink.size(), output.data(), output.size(), &cfg, values.get())) {
      throw std::runtime_error("nothing was composed");
    }
  };
}

operation_t compose_with_store(const sink_t &sink) {
  bench::load_default_platform();
  return [sink] {
    std::array<u8, 2 * block_size> output;
    const compose_cfg_t cfg = bench::sample_settings();
    if (!compose_edid(sink.data(), sink.size(), output.data(), output.size(), &cfg)) {
      throw std::runtime_error("nothing was composed");
    }
  };
}

struct workload_t {
  const char *name;
  operation_t (*prepare)();
};

constexpr u32 most_video = 80;
constexpr u32 most_vics = 64;

const workload_t workloads[] = {
    {"decode", [] { return decode_and_destroy(heaviest_sample()); }},
    {"decode_long_list", [] { return decode_and_destroy(bench::sink_with_video(most_video)); }},
    {"report", [] { return report(heaviest_sample()); }},
    {"compose_with_values", [] { return compose_with_values(heaviest_sample(), 0); }},
    {"compose_long_lists", [] { return compose_with_values(bench::sink_with_every_vic(), most_vics); }},
    {"compose_with_store", [] { return compose_with_store(heaviest_sample()); }},
};

int list_workloads() {
  for (const auto &workload : workloads)
    std::printf("%s\n", workload.name);
  return 0;
}

}  // namespace

/// What callgrind is told to count.
extern "C" [[gnu::noinline]] void cost_measured_run(const operation_t &operation);

extern "C" void cost_measured_run(const operation_t &operation) {
  operation();
}

int main(int argc, char **argv) {
  if (argc != 2) return list_workloads();
  const auto *const found = std::find_if(std::begin(workloads), std::end(workloads), [&](const workload_t &workload) {
    return std::strcmp(workload.name, argv[1]) == 0;
  });
  if (found == std::end(workloads) || std::freopen("/dev/null", "w", stdout) == nullptr) return 2;
  try {
    const operation_t operation = found->prepare();
    constexpr int warm_up_runs = 3;
    for (int i = 0; i < warm_up_runs; ++i)
      operation();
    const auto use = bench::heap_use_of([&] { cost_measured_run(operation); });
    std::fprintf(stderr, "%llu %llu %llu\n", static_cast<unsigned long long>(use.allocations),
                 static_cast<unsigned long long>(use.frees), static_cast<unsigned long long>(use.bytes));
  } catch (const std::exception &error) {
    std::fprintf(stderr, "%s: %s\n", argv[1], error.what());
    return 1;
  }
  return 0;
}
