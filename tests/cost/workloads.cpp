// Runs one of the workloads whose cost is watched, in cost_measured_run(), after what only first runs do is done.
// Writes its cost to standard error as JSON. Without an argument it lists the workloads.
#include <algorithm>
#include <cstdio>
#include <functional>
#include <stdexcept>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "bench/heap_meter.h"
#include "bench/operations.h"
#include "bench/sinks.h"
#include "bench/stack_meter.h"

namespace {

using bench::bytes_t;

/// Named "operation/sink" or, for a hostile sink, "operation/family/size".
struct workload_t {
  std::string name;
  const bench::operation_t *operation;
  bytes_t sink;
  bytes_t warm_up;  ///< A sink that has the library do, if less often, all that the measured one has it do.
  bool hostile;
};

std::vector<workload_t> all_workloads() {
  std::vector<workload_t> workloads;
  const bench::sink_t ordinary = bench::sink_of(EXAMPLES_DIR "/sinks", "tv_4k");
  for (const auto &operation : bench::operations)
    workloads.push_back({operation.name + ("/" + ordinary.name), &operation, ordinary.bytes, ordinary.bytes, false});
  const auto add_hostile = [&](const char *operation, const bench::hostile_family_t &family) {
    const bytes_t smallest = bench::hostile_sink(family, 256);
    for (const std::size_t size : {256U, 4096U, 32768U}) {
      const std::string name = std::string(operation) + "/" + family.name + "/" + std::to_string(size);
      const bytes_t sink = bench::hostile_sink(family, size);
      workloads.push_back({name, &bench::operation_named(operation), sink, smallest, true});
    }
  };
  for (const auto &family : bench::hostile_families()) {
    add_hostile("compose_observed", family);
    // One whose record has the most entries, and one whose report has the most lines.
    const std::string_view name = family.name;
    if (name == "known_vics" || name == "timings") add_hostile("print", family);
  }
  return workloads;
}

struct printed_t {
  std::size_t lines = 0;
  std::size_t bytes = 0;
};

ssize_t count_printed(void *cookie, const char *text, size_t size) {
  auto *const printed = static_cast<printed_t *>(cookie);
  printed->lines += static_cast<std::size_t>(std::count(text, text + size, '\n'));
  printed->bytes += size;
  return static_cast<ssize_t>(size);
}

/// What an operation prints: the library writes to whatever C's stdout is.
printed_t printed_by(const std::function<void()> &operation) {
  printed_t printed;
  std::FILE *const counter =
      fopencookie(&printed, "w", {.read = nullptr, .write = count_printed, .seek = nullptr, .close = nullptr});
  if (counter == nullptr) throw std::runtime_error("cannot make a stream that counts");
  std::FILE *const nowhere = std::exchange(stdout, counter);
  operation();
  stdout = nowhere;
  std::fclose(counter);
  return printed;
}

int list_workloads() {
  for (const auto &workload : all_workloads())
    std::printf("%s\n", workload.name.c_str());
  return 0;
}

}  // namespace

/// What callgrind is told to count.
extern "C" [[gnu::noinline]] void cost_measured_run(const workload_t &workload, const bench::platform_t &platform);

extern "C" void cost_measured_run(const workload_t &workload, const bench::platform_t &platform) {
  workload.operation->run(workload.sink, platform);
}

namespace {

bool measure(const workload_t &workload, bool only_run) {
  bench::platform_t platform;
  if (workload.hostile) bench::make_heaviest(&platform);
  const auto run = [&] { cost_measured_run(workload, platform); };
  workload.operation->run(workload.warm_up, platform);
  if (only_run) {
    run();
    return true;
  }
  const bench::heap_use_t use = bench::heap_use_of(run);
  if (use.allocations != use.frees) {
    std::fprintf(stderr, "%s: %ju allocations, but %ju frees\n", workload.name.c_str(), use.allocations, use.frees);
    return false;
  }
  const printed_t printed = printed_by(run);
  std::fprintf(stderr,
               "{\"allocations\": %ju, \"heap_bytes\": %ju, \"lines\": %zu, \"printed_bytes\": %zu, \"stack\": %zu}\n",
               use.allocations, use.bytes, printed.lines, printed.bytes, bench::stack_use_of(run));
  return true;
}

}  // namespace

int main(int argc, char **argv) {
  try {
    if (argc == 1) return list_workloads();
    if (std::freopen("/dev/null", "w", stdout) == nullptr) return 2;
    for (const auto &workload : all_workloads()) {
      if (workload.name == argv[1]) return measure(workload, argc > 2) ? 0 : 1;
    }
    std::fprintf(stderr, "no such workload: %s\n", argv[1]);
    return 2;
  } catch (const std::exception &error) {
    std::fprintf(stderr, "%s: %s\n", argv[1], error.what());
    return 1;
  }
}
