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
    select_and_populate(&new_edid);
  }
  ~situation_t() {
    edid_destroy(&downstream);
    edid_destroy(&new_edid);
  }
  situation_t(const situation_t &) = delete;
  situation_t &operator=(const situation_t &) = delete;

  inputs_t inputs() { return {downstream, *values.get(), cfg}; }
  void select_video(ll_list_t *list) { _filter_video_modes(inputs(), list, &journal); }
  void select_audio(ll_list_t *list) { _filter_audio_formats(inputs(), list, &journal); }
  void select_and_populate(edid_t *edid) {
    select_video(&edid->video_list);
    select_audio(&edid->audio_list);
    _populate_new_edid(inputs(), _filter_4k_modes(inputs()).selected, edid);
  }

  compose_cfg_t cfg = sample_settings();
  values_t values;
  journal_t journal{false};
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

/// A list that lasts as long as the stage's output does.
template <typename operation_t>
void with_list(const char *type, operation_t operation) {
  ll_list_t list{};
  ll_init(&list, type);
  operation(&list);
  ll_delete_list(&list);
}

void add_stages(const sink_t &sink) {
  add("select_video_modes", sink, [](situation_t *situation) {
    with_list("short_video_desc_t", [&](ll_list_t *list) { situation->select_video(list); });
  });
  add("select_4k_modes", sink,
      [](situation_t *situation) { benchmark::DoNotOptimize(_filter_4k_modes(situation->inputs())); });
  add("select_audio_formats", sink, [](situation_t *situation) {
    with_list("short_audio_desc_t", [&](ll_list_t *list) { situation->select_audio(list); });
  });
  add("select_and_populate", sink, [](situation_t *situation) {
    edid_t edid;
    edid_prepare(&edid);
    situation->select_and_populate(&edid);
    edid_destroy(&edid);
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
