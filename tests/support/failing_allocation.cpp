#include "support/failing_allocation.h"

#include <cstddef>

// The linker sends calls of malloc() here: see the options of test_support.
extern "C" void *__real_malloc(std::size_t size);
extern "C" void *__wrap_malloc(std::size_t size);

namespace {

// Number of the allocation that is to fail, counted from the next one; 0 when none is.
int countdown = 0;
bool fails_for_good = false;

bool fails_now() {
  if (countdown == 0) return fails_for_good;
  if (--countdown > 0) return false;
  return true;
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
  if (fails_now()) return nullptr;
  void *const block = __real_malloc(size);
  if (test_support::allocation_listener != nullptr) test_support::allocation_listener(block);
  return block;
}
