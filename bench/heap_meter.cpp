#include "heap_meter.h"

#include <cstddef>

// The C library's own allocator, under the names that stay when a program defines the usual ones.
extern "C" void *__libc_malloc(std::size_t size);
extern "C" void *__libc_calloc(std::size_t count, std::size_t size);
extern "C" void *__libc_realloc(void *block, std::size_t size);
extern "C" void __libc_free(void *block);

namespace {

bench::heap_use_t use;

void note(std::size_t bytes) {
  ++use.allocations;
  use.bytes += bytes;
}

}  // namespace

extern "C" void *malloc(std::size_t size) {
  note(size);
  return __libc_malloc(size);
}

extern "C" void *calloc(std::size_t count, std::size_t size) {
  note(count * size);
  return __libc_calloc(count, size);
}

extern "C" void *realloc(void *block, std::size_t size) {
  note(size);
  return __libc_realloc(block, size);
}

extern "C" void free(void *block) {
  if (block != nullptr) ++use.frees;
  __libc_free(block);
}

namespace bench {

heap_use_t heap_use() {
  return use;
}

}  // namespace bench
