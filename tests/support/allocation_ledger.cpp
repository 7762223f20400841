#include "support/allocation_ledger.h"

#include <unordered_set>

#include "support/failing_allocation.h"

// The linker sends calls of free() here.
extern "C" void __real_free(void *block);
extern "C" void __wrap_free(void *block);

namespace {

int allocations = 0;
std::unordered_set<void *> blocks;

void note(void *block) {
  ++allocations;
  blocks.insert(block);
}

}  // namespace

void __wrap_free(void *block) {
  if (test_support::allocation_listener != nullptr) blocks.erase(block);
  __real_free(block);
}

namespace test_support {

allocation_ledger_t::allocation_ledger_t() {
  allocations = 0;
  blocks.clear();
  allocation_listener = note;
}

allocation_ledger_t::~allocation_ledger_t() {
  allocation_listener = nullptr;
}

int allocation_ledger_t::allocated() const {
  return allocations;
}

int allocation_ledger_t::outstanding() const {
  return static_cast<int>(blocks.size());
}

}  // namespace test_support
