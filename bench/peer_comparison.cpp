// The operations' times against libdisplay-info's: what it takes to parse and destroy the same sink.
//
// Usage: edid_composer_peer_comparison FOLDER RESULTS
// Measures the sinks of FOLDER that have 256 bytes and that both sides read, and writes one JSON object: for each
// operation the mean time of a sink in nanoseconds, and its ratio to the peer's.
#include <algorithm>
#include <cstdio>
#include <functional>
#include <stdexcept>
#include <string>
#include <utility>
#include <vector>

#include "operations.h"
#include "program.h"
#include "sinks.h"
#include "timing.h"

extern "C" {
#include <libdisplay-info/info.h>
}

namespace {

using bench::bytes_t;

bool parse_by_peer(const bytes_t &sink) {
  di_info *const info = di_info_parse_edid(sink.data(), sink.size());
  if (info == nullptr) return false;
  di_info_destroy(info);
  return true;
}

std::vector<bytes_t> readable_sinks(const char *folder) {
  constexpr std::size_t edid_size = 256;
  std::vector<bytes_t> sinks;
  for (auto &sink : bench::sinks_of(folder)) {
    if (sink.bytes.size() == edid_size && bench::decode(sink.bytes) && parse_by_peer(sink.bytes)) {
      sinks.push_back(std::move(sink.bytes));
    }
  }
  return sinks;
}

/// The times of the peer and of each operation, summed over the sinks.
std::vector<double> sums_of(const std::vector<bytes_t> &sinks) {
  constexpr int rounds = 400;
  const bench::platform_t platform;
  std::vector<double> sums(1 + bench::operations.size());
  for (const bytes_t &sink : sinks) {
    bench::runs_t runs{[&] { parse_by_peer(sink); }};
    for (const auto &operation : bench::operations)
      runs.emplace_back([&] { operation.run(sink, platform); });
    const std::vector<double> times = bench::smallest_times(runs, rounds);
    std::transform(sums.begin(), sums.end(), times.begin(), sums.begin(), std::plus<>());
  }
  return sums;
}

void measure(const char *folder, std::FILE *results) {
  const std::vector<bytes_t> sinks = readable_sinks(folder);
  if (sinks.empty()) throw std::runtime_error(std::string(folder) + ": no EDID of 256 bytes that both sides read");
  const std::vector<double> sums = sums_of(sinks);
  const auto count = static_cast<double>(sinks.size());
  std::fprintf(results, "{\"sinks\": %zu, \"peer_ns\": %.1f, \"operations\": {", sinks.size(), sums[0] / count);
  for (std::size_t i = 0; i < bench::operations.size(); ++i) {
    std::fprintf(results, "%s\n  \"%s\": {\"ns\": %.1f, \"ratio\": %.3f}", i == 0 ? "" : ",", bench::operations[i].name,
                 sums[i + 1] / count, sums[i + 1] / sums[0]);
  }
  std::fprintf(results, "\n}}\n");
}

}  // namespace

int main(int count, char **arguments) {
  return bench::run_program(count, arguments, measure);
}
