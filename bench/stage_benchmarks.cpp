// The stages of a composition by themselves, with the records that they are given in the pipeline.
#include <array>
#include <string>

#include "edid_composer/audio_formats.h"
#include "edid_composer/modes_4k_x_2k.h"
#include "edid_composer/platform_values_reader.h"
#include "edid_composer/population.h"
#include "edid_composer/video_modes.h"
#include "measured.h"
#include "platforms.h"
#include "registration.h"
#include "sinks.h"

namespace bench {
namespace {

constexpr u32 block_size = 128;
constexpr u8 first_port = 1;
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
    ll_init(&modes, "short_video_desc_t");
    edid_prepare(&new_edid);
    select_video(&modes);
    _filter_4k_modes(&downstream, &new_edid, values.get());
    select_audio(&new_edid.audio_list);
    populate(&new_edid);
  }
  ~situation_t() {
    edid_destroy(&downstream);
    edid_destroy(&new_edid);
    ll_delete_list(&modes);
  }
  situation_t(const situation_t &) = delete;
  situation_t &operator=(const situation_t &) = delete;

  void select_video(ll_list_t *list) { _filter_video_modes(&downstream, &cfg, list, values.get()); }
  void select_audio(ll_list_t *list) { _filter_audio_formats(&downstream, cfg.audio_mask, 0, list, values.get()); }
  void populate(edid_t *edid) {
    _populate_new_edid(edid, &modes, &downstream, first_port, cfg.hdmi_3d_mode, cfg.edid_latency, values.get());
  }

  compose_cfg_t cfg = sample_settings();
  values_t values;
  edid_t downstream;
  edid_t new_edid;
  ll_list_t modes{};
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
  add("select_4k_modes", sink, [](situation_t *situation) {
    _filter_4k_modes(&situation->downstream, &situation->new_edid, situation->values.get());
  });
  add("select_audio_formats", sink, [](situation_t *situation) {
    with_list("short_audio_desc_t", [&](ll_list_t *list) { situation->select_audio(list); });
  });
  add("populate", sink, [](situation_t *situation) {
    edid_t edid;
    edid_prepare(&edid);
    situation->populate(&edid);
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
