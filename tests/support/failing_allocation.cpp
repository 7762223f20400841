#include "support/failing_allocation.h"

#include <cstddef>

// The linker sends calls of malloc() and calloc() here; the compiler makes the second of the first where a memset()
// follows.
extern "C" void *__real_malloc(std::size_t size);
extern "C" void *__wrap_malloc(std::size_t size);
extern "C" void *__real_calloc(std::size_t count, std::size_t size);
extern "C" void *__wrap_calloc(std::size_t count, std::size_t size);

namespace {

// Number of the allocation that is to fail, counted from the next one; 0 when none is.
int countdown = 0;
bool fails_for_good = false;

bool fails_now() {
  if (countdown == 0) return fails_for_good;
  if (--countdown > 0) return false;
  return true;
}

void *announced(void *block) {
  if (test_support::allocation_listener != nullptr) test_support::allocation_listener(block);
  return block;
}

}  // namespace

namespace test_support {

void (*allocation_listener)(void *block) = nullptr;

failing_allocation_t::failing_allocation_t(int nth, failing_t failing) {
  countdown = nth;
  fails_for_good = failing == failing_t::all_from_there_on;
}

failing_allocation_t::~failing_allocation_t() {
  countdown = 0;
  fails_for_good = false;
}

bool failing_allocation_t::happened() const {
  return countdown == 0;
}

}  // namespace test_support

void *__wrap_malloc(std::size_t size) {
  return fails_now() ? nullptr : announced(__real_malloc(size));
}

void *__wrap_calloc(std::size_t count, std::size_t size) {
  return fails_now() ? nullptr : announced(__real_calloc(count, size));
}
