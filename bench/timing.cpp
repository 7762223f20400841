#include "timing.h"

#include <sched.h>

#include <algorithm>
#include <ctime>
#include <limits>

namespace bench {
namespace {

double processor_time_ns() {
  timespec time{};
  clock_gettime(CLOCK_THREAD_CPUTIME_ID, &time);
  return static_cast<double>(time.tv_sec) * 1e9 + static_cast<double>(time.tv_nsec);
}

double time_of(const std::function<void()> &run, int calls) {
  const double begin = processor_time_ns();
  for (int call = 0; call < calls; ++call)
    run();
  return (processor_time_ns() - begin) / calls;
}

}  // namespace

void stay_on_this_core() {
  cpu_set_t cores;
  CPU_ZERO(&cores);
  CPU_SET(static_cast<unsigned>(sched_getcpu()), &cores);
  sched_setaffinity(0, sizeof cores, &cores);
}

std::vector<double> smallest_times(const runs_t &runs, int rounds) {
  // Enough calls in one measurement that reading the clock does not count.
  constexpr double measurement_ns = 40'000;
  std::vector<int> calls;
  for (const auto &run : runs)
    calls.push_back(static_cast<int>(std::clamp(measurement_ns / time_of(run, 1), 1.0, 1000.0)));
  std::vector<double> smallest(runs.size(), std::numeric_limits<double>::max());
  for (int round = 0; round < rounds; ++round) {
    for (std::size_t i = 0; i < runs.size(); ++i)
      smallest[i] = std::min(smallest[i], time_of(runs[i], calls[i]));
  }
  return smallest;
}

}  // namespace bench
