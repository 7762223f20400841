// Doing numbered pieces of work on several threads, with the results in order.
#pragma once

#include <functional>

#include "batch/batch_result.h"

namespace edid_cli {

/// Does the work of a number, on any of the threads; must not throw.
using work_t = std::function<batch_result_t(std::size_t number)>;

/// Does the work of the numbers 0 to @p count - 1 on @p jobs threads, and calls @p take with each number and its
/// result, in order, on the calling thread. What is kept waiting for its turn is bounded. Throws bad_input_t when no
/// thread can be started.
void run_in_order(std::size_t count, std::size_t jobs, const work_t &work,
                  const std::function<void(std::size_t number, const batch_result_t &result)> &take);

}  // namespace edid_cli
