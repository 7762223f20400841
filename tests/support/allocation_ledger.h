// What the library has allocated and not freed.
#pragma once

namespace test_support {

/// Keeps account of the malloc() or calloc() and free() calls of statically linked code while it lives, one at a time.
/// For executables that are linked with allocation_wrapping (see robustness/CMakeLists.txt).
class allocation_ledger_t {
 public:
  allocation_ledger_t();
  ~allocation_ledger_t();
  allocation_ledger_t(const allocation_ledger_t &) = delete;
  allocation_ledger_t &operator=(const allocation_ledger_t &) = delete;

  /// Number of allocations that succeeded.
  int allocated() const;
  /// Number of their blocks that have not been freed.
  int outstanding() const;
};

}  // namespace test_support
