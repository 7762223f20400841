// Smallest times: what disturbs a measurement only makes it longer.
#pragma once

#include <functional>
#include <vector>

namespace bench {

using runs_t = std::vector<std::function<void()>>;

/// Keeps the process on the core that it runs on, so that no measurement pays for a move.
void stay_on_this_core();

/// The smallest processor time of one run of each, in nanoseconds. They take turns, @p rounds times, so that a change
/// of the machine's speed meets all of them.
std::vector<double> smallest_times(const runs_t &runs, int rounds);

}  // namespace bench
