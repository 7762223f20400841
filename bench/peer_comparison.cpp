// Times against libdisplay-info's parsing of the same sinks: decode, compose, compose with the store, compose observed.
//
// Usage: edid_composer_peer_comparison FOLDER [ROUNDS [OPERATION]]
// FOLDER holds raw EDIDs; those of 256 bytes that both sides read are measured. All operations run in turn on one core,
// and the smallest time of each counts: what disturbs a measurement only makes it longer. Prints one JSON object. With
// the name of an operation only that one runs, for a profiler.
#include <sched.h>

#include <algorithm>
#include <array>
#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <limits>
#include <string>
#include <vector>

#include "edid_composer/platform/platform_values_reader.h"
#include "platforms.h"

extern "C" {
#include <libdisplay-info/info.h>
}

namespace {

using bytes_t = std::vector<u8>;
using bench::values_t;

constexpr std::size_t edid_size = 256;

bool decode(const bytes_t &sink) {
  edid_t edid;
  edid_prepare(&edid);
  const bool read = decode_edid_block_0(sink.data(), &edid) == 1 &&
                    decode_edid_extensions(sink.data() + edid_size / 2, edid_size / 2, &edid) == 1;
  edid_destroy(&edid);
  return read;
}

bool parse_by_peer(const bytes_t &sink) {
  di_info *const info = di_info_parse_edid(sink.data(), sink.size());
  if (info == nullptr) return false;
  di_info_destroy(info);
  return true;
}

void ignore_decision(const compose_decision_t *, void *) {}

/// One of the measured operations.
struct operation_t {
  const char *name;
  void (*run)(const bytes_t &sink, const platform_values_t *values);
};

void compose(const bytes_t &sink, const platform_values_t *values, compose_observer_t observer) {
  static std::array<u8, edid_size> output;
  const compose_cfg_t settings = bench::sample_settings();
  compose_request_t request{};
  request.size = sizeof request;
  request.sink = sink.data();
  request.sink_bytes = static_cast<u32>(sink.size());
  request.new_edid = output.data();
  request.new_edid_bytes = static_cast<u32>(output.size());
  request.settings = &settings;
  request.platform_values = values;
  request.observer = observer;
  compose_result_t result{};
  result.size = sizeof result;
  compose_edid_request(&request, &result);
}

constexpr operation_t operations[] = {
    {"peer_parse", [](const bytes_t &sink, const platform_values_t *) { static_cast<void>(parse_by_peer(sink)); }},
    {"decode", [](const bytes_t &sink, const platform_values_t *) { static_cast<void>(decode(sink)); }},
    {"compose", [](const bytes_t &sink, const platform_values_t *values) { compose(sink, values, nullptr); }},
    {"compose_with_store", [](const bytes_t &sink, const platform_values_t *) { compose(sink, nullptr, nullptr); }},
    {"compose_observed",
     [](const bytes_t &sink, const platform_values_t *values) { compose(sink, values, ignore_decision); }},
};

/// Smallest time of each operation for one sink, nanoseconds.
using times_t = std::array<double, std::size(operations)>;

times_t measure(const bytes_t &sink, const platform_values_t *values, int rounds, const std::string &only) {
  using clock = std::chrono::steady_clock;
  constexpr int calls = 16;
  times_t smallest;
  smallest.fill(std::numeric_limits<double>::max());
  for (int round = 0; round < rounds; ++round) {
    for (std::size_t i = 0; i < smallest.size(); ++i) {
      if (!only.empty() && only != operations[i].name) continue;
      const auto begin = clock::now();
      for (int call = 0; call < calls; ++call)
        operations[i].run(sink, values);
      const std::chrono::duration<double, std::nano> time = clock::now() - begin;
      smallest[i] = std::min(smallest[i], time.count() / calls);
    }
  }
  return smallest;
}

std::vector<bytes_t> readable_sinks(const char *folder) {
  std::vector<bytes_t> sinks;
  for (const auto &file : std::filesystem::directory_iterator(folder)) {
    if (!file.is_regular_file() || file.file_size() != edid_size) continue;
    std::ifstream stream(file.path(), std::ios::binary);
    bytes_t sink{std::istreambuf_iterator<char>(stream), {}};
    if (decode(sink) && parse_by_peer(sink)) sinks.push_back(std::move(sink));
  }
  return sinks;
}

/// On one core, so that no operation pays for a move.
void stay_on_this_core() {
  cpu_set_t cores;
  CPU_ZERO(&cores);
  CPU_SET(static_cast<unsigned>(sched_getcpu()), &cores);
  sched_setaffinity(0, sizeof cores, &cores);
}

}  // namespace

int main(int count, char **arguments) {
  if (count < 2 || count > 4) {
    std::fprintf(stderr, "usage: %s FOLDER [ROUNDS [OPERATION]]\n", arguments[0]);
    return 2;
  }
  const int rounds = count >= 3 ? std::max(std::atoi(arguments[2]), 1) : 400;
  stay_on_this_core();
  // Lines about what a sink lacks cost time that depends on where they go.
  if (std::freopen("/dev/null", "w", stdout) == nullptr) return 2;
  bench::load_default_platform();
  values_t values;
  edid_composer::_read_platform_values(values.get(), nullptr);
  const std::vector<bytes_t> sinks = readable_sinks(arguments[1]);
  if (sinks.empty()) {
    std::fprintf(stderr, "%s: no EDID of %zu bytes that both sides read\n", arguments[1], edid_size);
    return 2;
  }
  times_t total{};
  for (const bytes_t &sink : sinks) {
    const times_t times = measure(sink, values.get(), rounds, count == 4 ? arguments[3] : "");
    std::transform(total.begin(), total.end(), times.begin(), total.begin(), std::plus<>());
  }
  std::fprintf(stderr, "{\"sinks\": %zu", sinks.size());
  for (std::size_t i = 0; i < total.size(); ++i) {
    std::fprintf(stderr, ", \"%s_ns\": %.0f, \"%s_ratio\": %.2f", operations[i].name,
                 total[i] / static_cast<double>(sinks.size()), operations[i].name, total[i] / total[0]);
  }
  std::fprintf(stderr, "}\n");
  return 0;
}
