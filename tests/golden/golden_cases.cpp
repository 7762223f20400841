#include "golden_cases.h"

#include "text_format.h"

namespace golden {
namespace {

constexpr i32 never = 0;
constexpr i32 as_sink = 1;
constexpr i32 always = 2;

constexpr u32 every_format = 0xFFFFFFFF;
constexpr u32 no_format = 0;
constexpr u32 pcm = 0x0001;
constexpr u32 ac3 = 0x0002;
constexpr u32 dts = 0x0040;
constexpr u32 eac3 = 0x0200;
constexpr u32 dts_hd = 0x0400;

constexpr bool filter = true;
constexpr bool no_filter = false;

constexpr video_mode_t no_mode{0, 0, 0, 0};
constexpr video_mode_t mode_1080p50{1920, 1080, 0, 50};
constexpr video_mode_t mode_1080p24{1920, 1080, 0, 24};
constexpr video_mode_t mode_1080i50{1920, 1080, 1, 50};
constexpr video_mode_t mode_720p60{1280, 720, 0, 60};
/// Of a computer: no video identification code has it.
constexpr video_mode_t mode_1680x1050{1680, 1050, 0, 60};

const char *name_of_3d_mode(i32 mode) {
  return mode == always ? "always" : mode == as_sink ? "as the sink" : "never";
}

std::string name_of(const video_mode_t &mode) {
  if (mode.width == 0) return "none";
  return format("%ux%u%c%u", mode.width, mode.height, mode.interlaced == 1 ? 'i' : 'p', mode.refresh);
}

}  // namespace

std::string golden_case_t::settings() const {
  return format("port %u, latency %u/%u/%u/%u ms, 3D %s, audio mask 0x%X, sink filter %s, current mode %s", port,
                latency_ms[0], latency_ms[1], latency_ms[2], latency_ms[3], name_of_3d_mode(hdmi_3d_mode), audio_mask,
                audio_sink_filter ? "on" : "off", name_of(current_mode).c_str());
}

const std::vector<golden_case_t> &golden_cases() {
  // Between them: each 3D mode, latencies that are none, added to the sink's, and beyond what can be told, masks that
  // let everything, something and nothing through, current modes that are offered already, that are not, and that
  // have no video identification code.
  static const std::vector<golden_case_t> cases = {
      {"tv_4k", "default", 0, {0, 0, 0, 0}, as_sink, every_format, no_filter, no_mode},
      {"tv_1080p_3d", "default", 1, {40, 20, 60, 20}, always, every_format, filter, no_mode},
      {"tv_720p_50hz", "default", 2, {0, 0, 0, 0}, always, pcm | ac3, no_filter, no_mode},
      {"av_receiver", "default", 1, {30, 0, 50, 0}, as_sink, every_format, filter, mode_1080p24},
      {"monitor_base_block", "default", 0, {0, 0, 0, 0}, as_sink, every_format, no_filter, no_mode},

      {"tv_4k", "receiver_50hz", 3, {45, 35, 65, 35}, as_sink, every_format, no_filter, mode_1080p50},
      {"tv_1080p_3d", "receiver_50hz", 0, {45, 35, 65, 35}, as_sink, pcm | ac3 | dts, no_filter, mode_720p60},
      {"tv_720p_50hz", "receiver_50hz", 0, {500, 500, 501, 501}, never, every_format, filter, mode_1080i50},
      {"av_receiver",
       "receiver_50hz",
       1,
       {45, 35, 65, 35},
       always,
       pcm | ac3 | dts | eac3 | dts_hd,
       no_filter,
       mode_1080p24},
      {"monitor_base_block", "receiver_50hz", 2, {45, 35, 65, 35}, never, every_format, no_filter, mode_1680x1050},

      {"tv_4k", "minimal", 0, {450, 400, 450, 400}, never, every_format, no_filter, no_mode},
      {"tv_1080p_3d", "minimal", 1, {700, 700, 700, 700}, always, pcm, no_filter, no_mode},
      {"tv_720p_50hz", "minimal", 2, {0, 0, 0, 0}, as_sink, every_format, no_filter, mode_1080i50},
      {"av_receiver", "minimal", 3, {20, 0, 20, 0}, never, no_format, no_filter, no_mode},
      {"monitor_base_block", "minimal", 14, {0, 0, 0, 0}, as_sink, every_format, filter, no_mode},
  };
  return cases;
}

}  // namespace golden
