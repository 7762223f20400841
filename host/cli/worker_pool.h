// Doing numbered pieces of work in several processes, with the results in order.
#pragma once

#include <functional>
#include <string>

#include "worker_process.h"

namespace edid_cli {

/// What came of one piece of work.
struct outcome_t {
  bool is_done = false;
  std::string text;  ///< The result; of work whose process ended over it, how that came.
};

/// Does the work of the numbers 0 to @p count - 1 in @p jobs processes, and calls @p take with each number and its
/// outcome, in order. What is kept waiting for its turn is bounded. A process that ends over its work is replaced.
/// Throws bad_input_t.
void run_in_workers(std::size_t count, std::size_t jobs, const work_t &work,
                    const std::function<void(std::size_t, const outcome_t &)> &take);

}  // namespace edid_cli
