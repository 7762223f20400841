// The stages of a composition by themselves, with the records that they are given in the pipeline.
#include <array>
#include <string>

#include "edid_composer/new_edid/population.h"
#include "edid_composer/platform/platform_values_reader.h"
#include "edid_composer/selection/audio_formats.h"
#include "edid_composer/selection/modes_4k_x_2k.h"
#include "edid_composer/selection/video_modes.h"
#include "measured.h"
#include "platforms.h"
#include "registration.h"
#include "sinks.h"

namespace bench {
namespace {

constexpr u32 block_size = 128;
using namespace edid_composer;  // NOLINT(google-build-using-namespace): the stages are what is measured here

/// What the stages of one composition hand on, up to the new record.
class situation_t {
 public:
  explicit situation_t(const sink_t &sink) {
    load_default_platform();
    _read_platform_values(values.get(), nullptr);
    edid_prepare(&downstream);
    decode_edid_block_0(sink.data(), &downstream);
    if (sink.size() > block_size) decode_edid_extensions(sink.data() + block_size, block_size, &downstream);
    edid_prepare(&new_edid);
    select_and_populate(&new_edid, &arena);
  }
  ~situation_t() { edid_destroy(&downstream); }
  situation_t(const situation_t &) = delete;
  situation_t &operator=(const situation_t &) = delete;

  inputs_t inputs(entry_arena_t *entries) { return {downstream, *values.get(), cfg, entries}; }
  void select_and_populate(edid_t *edid, entry_arena_t *entries) {
    journal_t journal(false, entries);
    _filter_video_modes(inputs(entries), &edid->video_list, &journal);
    _filter_audio_formats(inputs(entries), &edid->audio_list, &journal);
    _populate_new_edid(inputs(entries), _filter_4k_modes(inputs(entries)).selected, edid);
  }

  compose_cfg_t cfg = sample_settings();
  values_t values;
  entry_arena_t arena;
  edid_t downstream;
  edid_t new_edid;
};

template <typename operation_t>
void add(const std::string &name, const sink_t &sink, operation_t operation) {
  benchmark::RegisterBenchmark(("stage/" + name + "/" + sink.name).c_str(),
                               [&sink, operation](benchmark::State &state) {
                                 situation_t situation(sink);
                                 measure(state, [&] { operation(&situation); });
                               });
}

/// Runs a stage that fills a list, which goes with its arena.
template <typename record_t, typename stage_t>
void run_stage(situation_t *situation, stage_t stage) {
  entry_arena_t arena;
  journal_t journal(false, &arena);
  ll_list_t list{};
  static_cast<void>(init_list<record_t>(&list));
  stage(situation->inputs(&arena), &list, &journal);
}

void add_stages(const sink_t &sink) {
  add("select_video_modes", sink,
      [](situation_t *situation) { run_stage<short_video_desc_t>(situation, _filter_video_modes); });
  add("select_4k_modes", sink,
      [](situation_t *situation) { benchmark::DoNotOptimize(_filter_4k_modes(situation->inputs(nullptr))); });
  add("select_audio_formats", sink,
      [](situation_t *situation) { run_stage<short_audio_desc_t>(situation, _filter_audio_formats); });
  add("select_and_populate", sink, [](situation_t *situation) {
    entry_arena_t arena;
    edid_t edid{};
    edid_prepare(&edid);
    situation->select_and_populate(&edid, &arena);
  });
  add("encode", sink, [](situation_t *situation) {
    std::array<u8, 2 * block_size> bytes;
    encode_edid(bytes.data(), static_cast<i32>(bytes.size()), &situation->new_edid, nullptr, situation->values.get());
    benchmark::DoNotOptimize(bytes);
  });
}

}  // namespace

void register_stage_benchmarks() {
  benchmark::RegisterBenchmark("stage/read_platform_values", [](benchmark::State &state) {
    load_default_platform();
    measure(state, [] {
      values_t values;
      _read_platform_values(values.get(), nullptr);
    });
  });
  for (const auto &sink : sample_sinks())
    add_stages(sink);
}

}  // namespace bench
