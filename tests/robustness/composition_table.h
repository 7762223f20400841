// What a composition of the sample comes to when an entry cannot be had, stage by stage.
#pragma once

#include "failure_table.h"
#include "sample.h"

namespace robustness {

using table_t = std::vector<stretch_t>;

/// Reading the configuration tree.
table_t reading_stretches();

/// Decoding the sink. @p values are those to compose from without a tree, or null.
table_t decoding_stretches(const platform_values_t *values);

/// Selecting modes and formats, and populating the new record.
table_t selecting_stretches();

/// Decoding the result again, for the log.
table_t inspecting_stretches(const test_support::bytes_t &composed);

/// The diagnostics among what @p action prints while tracing is on.
std::string traced_diagnostics_of(const std::function<void()> &action);

/// The tables one behind the other.
table_t join(const std::vector<table_t> &tables);

}  // namespace robustness
