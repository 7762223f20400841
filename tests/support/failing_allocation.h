// Allocations that fail when a test wants them to.
#pragma once

namespace test_support {

/// How many allocations fail, from the one that a test names on.
enum class failing_t { only_that_one, all_from_there_on };

/// While it lives, the @p nth malloc() or calloc() from its construction on (counted from 1) fails. Works on code that
/// is linked statically, such as the library in unit_tests; calls from within shared libraries are not seen.
class failing_allocation_t {
 public:
  explicit failing_allocation_t(int nth, failing_t failing = failing_t::only_that_one);
  ~failing_allocation_t();
  failing_allocation_t(const failing_allocation_t &) = delete;
  failing_allocation_t &operator=(const failing_allocation_t &) = delete;

  /// Tells whether the allocation has failed yet.
  bool happened() const;
};

/// Hears of each block that such a malloc() gave; null when nobody listens.
extern void (*allocation_listener)(void *block);

}  // namespace test_support
