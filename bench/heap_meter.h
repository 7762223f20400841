// Counts the heap calls of the whole program, which it sees by defining malloc(), calloc(), realloc() and free()
// itself.
#pragma once

#include <cstdint>

namespace bench {

struct heap_use_t {
  std::uintmax_t allocations;  ///< Calls of malloc, calloc and realloc.
  std::uintmax_t frees;        ///< Calls of free with something to free.
  std::uintmax_t bytes;        ///< What was asked for.
};

/// Since the program began. Exact as long as one thread is at work.
heap_use_t heap_use();

/// What @p operation adds to it.
template <typename operation_t>
heap_use_t heap_use_of(operation_t operation) {
  const heap_use_t before = heap_use();
  operation();
  const heap_use_t after = heap_use();
  return {after.allocations - before.allocations, after.frees - before.frees, after.bytes - before.bytes};
}

}  // namespace bench
