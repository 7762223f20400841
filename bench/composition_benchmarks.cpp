#include <array>
#include <cstdint>
#include <string>

#include "edid_composer/platform/platform_values_reader.h"
#include "measured.h"
#include "platforms.h"
#include "registration.h"
#include "sinks.h"
#include "stack_meter.h"
#include "support/observation.h"

namespace bench {
namespace {

using output_t = std::array<u8, 256>;
using u64_t = std::uint64_t;

/// Measures a composition's time and heap calls, and the stack below it.
template <typename operation_t>
void measure_with_stack(benchmark::State &state, operation_t operation) {
  operation();
  state.counters["stack"] = static_cast<double>(stack_use_of(operation));
  measure(state, operation);
}

void run_with_values(benchmark::State &state, const sink_t &sink) {
  load_default_platform();
  values_t values;
  edid_composer::_read_platform_values(values.get(), nullptr);
  const compose_cfg_t cfg = sample_settings();
  output_t output;
  measure_with_stack(state, [&] {
    compose_edid_internal(sink.data(), sink.size(), output.data(), output.size(), &cfg, values.get());
  });
}

void count(const compose_decision_t *, void *decisions) {
  ++*static_cast<u64_t *>(decisions);
}

/// A composition from values that were read beforehand, with an observer or with a null pointer for one.
void run_observed(benchmark::State &state, const sink_t &sink, compose_observer_t observer) {
  load_default_platform();
  values_t values;
  edid_composer::_read_platform_values(values.get(), nullptr);
  const compose_cfg_t cfg = sample_settings();
  output_t output;
  u64_t decisions = 0;
  const auto compose = [&] {
    test_support::compose_observed({sink.data(), sink.size()}, output, &cfg, values.get(), observer, &decisions);
  };
  compose();
  state.counters["decisions"] = static_cast<double>(decisions);
  measure_with_stack(state, compose);
}

void run_with_store(benchmark::State &state, const sink_t &sink) {
  load_default_platform();
  const compose_cfg_t cfg = sample_settings();
  output_t output;
  measure_with_stack(state, [&] { compose_edid(sink.data(), sink.size(), output.data(), output.size(), &cfg); });
}

}  // namespace

void register_composition_benchmarks() {
  for (const auto &sink : sample_sinks()) {
    benchmark::RegisterBenchmark(("compose/with_values/" + sink.name).c_str(),
                                 [&sink](benchmark::State &state) { run_with_values(state, sink); });
    benchmark::RegisterBenchmark(("compose/with_store/" + sink.name).c_str(),
                                 [&sink](benchmark::State &state) { run_with_store(state, sink); });
    benchmark::RegisterBenchmark(("compose/not_observed/" + sink.name).c_str(),
                                 [&sink](benchmark::State &state) { run_observed(state, sink, nullptr); });
    benchmark::RegisterBenchmark(("compose/observed/" + sink.name).c_str(),
                                 [&sink](benchmark::State &state) { run_observed(state, sink, count); });
  }
}

}  // namespace bench
