// How deep the stack of an operation gets.
#pragma once

#include <cstddef>
#include <functional>

namespace bench {

/// Bytes of stack that @p operation touches, run on a thread of its own whose stack was painted before; less what an
/// empty operation touches. Run it once beforehand: what the first run of a function takes to be bound is not its own.
/// Measure times before: the C library's heap is slower for good once a process has had a second thread.
/// Throws std::runtime_error when there can be no such thread.
std::size_t stack_use_of(const std::function<void()> &operation);

}  // namespace bench
