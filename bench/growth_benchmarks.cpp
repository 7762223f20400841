#include <array>
#include <string>

#include "measured.h"
#include "platforms.h"
#include "registration.h"
#include "sinks.h"

namespace bench {
namespace {

using output_t = std::array<u8, 256>;

void run_decode(benchmark::State &state, const sink_t &sink) {
  constexpr u32 block_size = 128;
  measure(state, [&] {
    edid_t edid;
    edid_prepare(&edid);
    decode_edid_block_0(sink.data(), &edid);
    decode_edid_extensions(sink.data() + block_size, block_size, &edid);
    edid_destroy(&edid);
  });
}

void run_compose(benchmark::State &state, const sink_t &sink, values_t *values) {
  const compose_cfg_t cfg = sample_settings();
  output_t output;
  measure(state,
          [&] { compose_edid_internal(sink.data(), sink.size(), output.data(), output.size(), &cfg, values->get()); });
}

/// Composes with the sample's values, of which @p change makes what grows.
template <typename change_t>
void run_compose_with(benchmark::State &state, const sink_t &sink, change_t change) {
  values_t values;
  fill_sample(&values);
  change(&values);
  run_compose(state, sink, &values);
}

u32 length(const benchmark::State &state) {
  return static_cast<u32>(state.range(0));
}

void unchanged(values_t *) {}

}  // namespace

void register_growth_benchmarks() {
  const std::vector<std::int64_t> video{1, 2, 5, 10, 20, 30, 40, 50, 60, 70, 80};
  const std::vector<std::int64_t> audio{1, 2, 4, 6, 8, 10, 12, 14, 16, 18};
  const std::vector<std::int64_t> priority{1, 2, 4, 8, 16, 24, 32, 40, 48, 56, 64};
  benchmark::RegisterBenchmark("growth/decode_video", [](benchmark::State &state) {
    run_decode(state, sink_with_video(length(state)));
  })->ArgsProduct({video});
  benchmark::RegisterBenchmark("growth/compose_video", [](benchmark::State &state) {
    run_compose_with(state, sink_with_video(length(state)), unchanged);
  })->ArgsProduct({video});
  benchmark::RegisterBenchmark("growth/decode_audio", [](benchmark::State &state) {
    run_decode(state, sink_with_audio(length(state)));
  })->ArgsProduct({audio});
  benchmark::RegisterBenchmark("growth/compose_audio", [](benchmark::State &state) {
    run_compose_with(state, sink_with_audio(length(state)), unchanged);
  })->ArgsProduct({audio});
  benchmark::RegisterBenchmark("growth/compose_priority", [](benchmark::State &state) {
    run_compose_with(state, sink_with_every_vic(),
                     [&](values_t *values) { prioritize_first_vics(values, length(state)); });
  })->ArgsProduct({priority});
}

}  // namespace bench
