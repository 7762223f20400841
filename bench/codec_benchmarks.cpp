#include <string>

#include "edid_composer.h"
#include "measured.h"
#include "registration.h"
#include "sinks.h"

namespace bench {
namespace {

constexpr u32 block_size = 128;

void decode_base_block(const sink_t &sink, edid_t *edid) {
  decode_edid_block_0(sink.data(), edid);
}

void decode_extension(const sink_t &sink, edid_t *edid) {
  if (sink.size() > block_size) decode_edid_extensions(sink.data() + block_size, sink.size() - block_size, edid);
}

void decode_all(const sink_t &sink, edid_t *edid) {
  decode_base_block(sink, edid);
  decode_extension(sink, edid);
}

/// The list entries that a record holds.
i32 entries_of(const edid_t &edid) {
  return ll_size(&edid.std_timings) + ll_size(&edid.dtd_list) + ll_size(&edid.video_list) + ll_size(&edid.audio_list);
}

/// Between prepare and destroy, as a record must not be decoded into twice.
void add(const std::string &name, const sink_t &sink, void (*decode)(const sink_t &, edid_t *)) {
  benchmark::RegisterBenchmark(("codec/" + name + "/" + sink.name).c_str(), [&sink, decode](benchmark::State &state) {
    i32 entries = 0;
    const auto run = [&](bool count_entries) {
      edid_t edid;
      edid_prepare(&edid);
      decode(sink, &edid);
      if (count_entries) entries = entries_of(edid);
      edid_destroy(&edid);
    };
    run(true);
    state.counters["entries"] = entries;
    measure(state, [&] { run(false); });
  });
}

void add_report(const std::string &name, const sink_t &sink, u8 brief) {
  benchmark::RegisterBenchmark(("codec/" + name + "/" + sink.name).c_str(), [&sink, brief](benchmark::State &state) {
    edid_t edid;
    edid_prepare(&edid);
    decode_all(sink, &edid);
    measure(state, [&] { print_edid_struct(&edid, brief, "Sink"); });
    edid_destroy(&edid);
  });
}

}  // namespace

void register_codec_benchmarks() {
  benchmark::RegisterBenchmark("codec/prepare_and_destroy", [](benchmark::State &state) {
    measure(state, [] {
      edid_t edid;
      edid_prepare(&edid);
      edid_destroy(&edid);
    });
  });
  for (const auto &sink : sample_sinks()) {
    add("decode_base_block", sink, decode_base_block);
    if (sink.size() > block_size) add("decode_extension", sink, decode_extension);
    add("decode_and_destroy", sink, decode_all);
    add_report("report", sink, 0);
    add_report("brief_report", sink, 1);
  }
}

}  // namespace bench
