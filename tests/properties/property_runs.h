// Tries a property on one random input after the other.
#pragma once

#include <functional>

#include "random_source.h"

namespace properties {

/// Calls @p property with @p runs sources of random numbers, or as many as the environment asks for, and stops at the
/// first one that a check fails with. Failures name its seed.
void for_each_run(u32 runs, const std::function<void(random_source_t &)> &property);

/// Checks that the inputs held what the property is about: at least @p least times in the usual number of runs, and in
/// proportion in another number. Passes when the property failed.
void expect_at_least(u32 least, u32 actual, const char *what);

}  // namespace properties
