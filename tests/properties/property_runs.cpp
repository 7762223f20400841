#include "property_runs.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <string>

namespace properties {
namespace {

constexpr const char *runs_variable = "EDID_COMPOSER_PROPERTY_RUNS";
constexpr const char *seed_variable = "EDID_COMPOSER_PROPERTY_SEED";
constexpr std::uint64_t default_seed = 20140211;

/// Of the property that is being tried.
std::uint64_t usual_runs = 1;

std::uint64_t number_in_environment(const char *name, std::uint64_t otherwise) {
  const char *const text = std::getenv(name);
  return text == nullptr ? otherwise : std::strtoull(text, nullptr, 10);
}

}  // namespace

void for_each_run(u32 runs, const std::function<void(random_source_t &)> &property) {
  usual_runs = runs;
  const std::uint64_t count = number_in_environment(runs_variable, runs);
  const std::uint64_t first = number_in_environment(seed_variable, default_seed);
  for (std::uint64_t seed = first; seed < first + count; ++seed) {
    SCOPED_TRACE(std::string("to see this again: ") + runs_variable + "=1 " + seed_variable + "=" +
                 std::to_string(seed));
    random_source_t random(seed);
    property(random);
    if (testing::Test::HasFailure()) return;
  }
  testing::Test::RecordProperty("runs", static_cast<int>(count));
}

void expect_at_least(u32 least, u32 actual, const char *what) {
  testing::Test::RecordProperty(what, static_cast<int>(actual));
  if (testing::Test::HasFailure()) return;
  // In proportion to the number of runs; rounded down, as few runs may meet none.
  const std::uint64_t runs = number_in_environment(runs_variable, usual_runs);
  EXPECT_GE(actual, least * runs / usual_runs) << what;
}

}  // namespace properties
