// Measures the operations on the sinks of a folder, and on hostile ones, and writes the times as JSON.
//
// Usage: edid_composer_bench FOLDER RESULTS
#include <cstdio>
#include <cstdlib>
#include <string>
#include <utility>
#include <vector>

#include "operations.h"
#include "program.h"
#include "sinks.h"
#include "timing.h"

namespace {

constexpr std::size_t block_size = 128;

/// The list entries that decoding a sink makes.
std::size_t entries_of(const bench::bytes_t &sink) {
  edid_t edid;
  edid_prepare(&edid);
  decode_edid_block_0(sink.data(), &edid);
  if (sink.size() > block_size) {
    decode_edid_extensions(sink.data() + block_size, static_cast<u32>(sink.size() - block_size), &edid);
  }
  const auto size = [](const ll_list_t &list) { return static_cast<std::size_t>(ll_size(&list)); };
  const std::size_t entries =
      size(edid.std_timings) + size(edid.dtd_list) + size(edid.video_list) + size(edid.audio_list);
  edid_destroy(&edid);
  return entries;
}

/// The heap calls of that many entries, an entry and its payload each, as a program makes them that does nothing else.
void call_heap(std::vector<void *> *blocks) {
  for (std::size_t i = 0; i < blocks->size(); ++i)
    (*blocks)[i] = std::malloc(i % 2 == 0 ? sizeof(ll_entry_t) : sizeof(short_video_desc_t));
  for (void *block : *blocks)
    std::free(block);
}

/// Writes one JSON object: what the sink is, and the time of each operation.
void write_times(const bench::sink_t &sink, const char *what, const bench::platform_t &platform, int rounds,
                 std::FILE *results) {
  std::vector<void *> blocks(2 * entries_of(sink.bytes));
  bench::runs_t runs{[&] { call_heap(&blocks); }};
  for (const auto &operation : bench::operations)
    runs.emplace_back([&] { operation.run(sink.bytes, platform); });
  const std::vector<double> times = bench::smallest_times(runs, rounds);
  std::fprintf(results, "{\"name\": \"%s\", \"what\": \"%s\", \"bytes\": %zu, \"entries\": %zu, \"heap_calls\": %.1f",
               sink.name.c_str(), what, sink.bytes.size(), blocks.size() / 2, times[0]);
  for (std::size_t i = 0; i < bench::operations.size(); ++i)
    std::fprintf(results, ", \"%s\": %.1f", bench::operations[i].name, times[i + 1]);
  std::fprintf(results, "}");
}

void measure(const char *folder, std::FILE *results) {
  constexpr int rounds = 2000;
  constexpr int hostile_rounds = 60;
  bench::platform_t platform;
  const char *separator = "";
  std::fprintf(results, "{\"sinks\": [");
  for (const auto &sink : bench::sinks_of(folder)) {
    std::fprintf(results, "%s\n", std::exchange(separator, ","));
    write_times(sink, "a file", platform, rounds, results);
  }
  std::fprintf(results, "],\n\"hostile\": [");
  bench::make_heaviest(&platform);
  separator = "";
  for (const auto &family : bench::hostile_families()) {
    for (const std::size_t size : {256, 4096, 32768}) {
      std::fprintf(results, "%s\n", std::exchange(separator, ","));
      write_times({family.name, bench::hostile_sink(family, size)}, family.what, platform, hostile_rounds, results);
    }
  }
  std::fprintf(results, "]}\n");
}

}  // namespace

int main(int count, char **arguments) {
  return bench::run_program(count, arguments, measure);
}
