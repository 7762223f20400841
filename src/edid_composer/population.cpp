#include "edid_composer/population.h"

#include <algorithm>
#include <cstdint>
#include <cstring>
#include <iterator>

#include "diagnostics.h"
#include "edid_composer/decisions.h"
#include "edid_composer/physical_address.h"
#include "edid_composer/video_verdicts.h"
#include "linked_list/new_entry.h"
#include "linked_list/walk.h"
#include "output.h"
#include "text_field.h"

namespace edid_composer {
namespace {

constexpr std::int64_t megahertz = 1000000;

void set_identity(const site_t &site, const platform_values_t &values, edid_t *edid) {
  edid->product_code = values.product_id;
  edid->serial_number = values.serial;
  edid->week = static_cast<u8>(values.week & 0xFF);
  edid->year = values.year;
  std::strncpy(edid->manufacturer, values.manufacturer_id, sizeof edid->manufacturer);
  std::strncpy(edid->monitor_name, values.monitor_name, sizeof edid->monitor_name);
  std::strncpy(edid->serial_string, values.monitor_serial, sizeof edid->serial_string);
  LOG_TRACE_AS(site, "\tProduct Code    = 0x%X", edid->product_code);
  LOG_TRACE_AS(site, "\tSerial Number   = 0x%X", edid->serial_number);
  LOG_TRACE_AS(site, "\tweek            = %d", edid->week);
  LOG_TRACE_AS(site, "\tyear            = %d", edid->year);
  LOG_TRACE_AS(site, "\tManufacturer ID = %s", text_field_t(edid->manufacturer).c_str());
  LOG_TRACE_AS(site, "\tMonitor Name    = %s", text_field_t(edid->monitor_name).c_str());
}

constexpr u16 no_valid_latency = 65535;

/// The platform's own delay and the sink's, in sum.
u16 total_latency(u16 own_ms, u16 sink_ms) {
  constexpr u16 longest_ms = 500;
  return own_ms <= longest_ms && sink_ms <= longest_ms ? static_cast<u16>(own_ms + sink_ms) : no_valid_latency;
}

constexpr u16 edid_t::*latencies[] = {&edid_t::video_latency, &edid_t::audio_latency, &edid_t::i_video_latency,
                                      &edid_t::i_audio_latency};

/// The latency that a source reads: even milliseconds, up to 500.
u16 declared_latency(u16 latency_ms) {
  constexpr u32 longest_ms = 500;
  return static_cast<u16>(std::min<u32>(latency_ms, longest_ms) & ~1U);
}

void note_latencies(decisions_t *decisions, const u32 *platform_ms, const edid_t &sink, const edid_t &edid) {
  const bool interlaced = edid.i_video_latency != 0 || edid.i_audio_latency != 0;
  const bool progressive = interlaced || edid.video_latency != 0 || edid.audio_latency != 0;
  for (u32 which = 0; which < std::size(latencies); ++which) {
    const u16 own_ms = static_cast<u16>(platform_ms[which] & 0xFFFF);
    const u16 sink_ms = sink.*latencies[which];
    const u16 sum = edid.*latencies[which];
    const u16 declared = declared_latency(sum);
    if (sum == no_valid_latency) {
      decisions->note(COMPOSE_SUBJECT_LATENCY, which, COMPOSE_VERDICT_CHANGED, COMPOSE_REASON_LATENCY_TOO_LONG,
                      reason_values(own_ms, sink_ms));
    } else if (sum == 0) {
      const bool is_declared = which < 2 ? progressive : interlaced;
      decisions->note(COMPOSE_SUBJECT_LATENCY, which, is_declared ? COMPOSE_VERDICT_OFFERED : COMPOSE_VERDICT_LEFT_OUT,
                      COMPOSE_REASON_LATENCY_NONE);
    } else {
      decisions->note(COMPOSE_SUBJECT_LATENCY, which,
                      declared == sum ? COMPOSE_VERDICT_OFFERED : COMPOSE_VERDICT_CHANGED,
                      COMPOSE_REASON_LATENCY_OF_BOTH, reason_values(own_ms, sink_ms, declared));
    }
  }
}

void set_latencies(const u32 *platform_ms, const edid_t &sink, edid_t *edid, decisions_t *decisions) {
  for (u32 which = 0; which < std::size(latencies); ++which)
    edid->*latencies[which] = total_latency(static_cast<u16>(platform_ms[which] & 0xFFFF), sink.*latencies[which]);
  if (decisions != nullptr) note_latencies(decisions, platform_ms, sink, *edid);
}

constexpr i32 always_3d = 2;
constexpr i32 sink_3d = 1;

void note_3d(decisions_t *decisions, i32 hdmi_3d_mode, const edid_t &sink) {
  const bool in_sink = sink.hdmi_3d_present != 0;
  compose_reason reason = COMPOSE_REASON_3D_OFF;
  if (hdmi_3d_mode == always_3d) reason = COMPOSE_REASON_3D_ALWAYS;
  if (hdmi_3d_mode == sink_3d) reason = in_sink ? COMPOSE_REASON_3D_OF_SINK : COMPOSE_REASON_3D_NOT_IN_SINK;
  const bool offered = reason == COMPOSE_REASON_3D_ALWAYS || reason == COMPOSE_REASON_3D_OF_SINK;
  decisions->note(COMPOSE_SUBJECT_3D, offered, offered ? COMPOSE_VERDICT_OFFERED : COMPOSE_VERDICT_LEFT_OUT, reason,
                  reason_values(hdmi_3d_mode, in_sink));
}

void set_3d(i32 hdmi_3d_mode, const edid_t &sink, edid_t *edid, decisions_t *decisions) {
  const bool present = hdmi_3d_mode == always_3d || (hdmi_3d_mode == sink_3d && sink.hdmi_3d_present != 0);
  edid->hdmi_3d_present = present ? 1 : 0;
  if (present) edid->image_size = 1;
  if (decisions != nullptr) note_3d(decisions, hdmi_3d_mode, sink);
}

/// What every composed EDID says of its display.
void set_display(edid_t *edid) {
  edid->version = 1;
  edid->revision = 3;
  edid->digital = 1;
  edid->h_size_cm = 160;
  edid->v_size_cm = 90;
  edid->gamma = 120;  // 2.20
  edid->standby = 0;
  edid->suspend = 0;
  edid->active_off = 0;
  edid->standard_colorspace = 1;
  edid->preferred_timing = 1;
  edid->gtf = 0;
  edid->min_v_rate = 49;
  edid->max_v_rate = 61;
  edid->min_h_rate = 15;
  edid->max_h_rate = 70;
  edid->max_pixel_clock = 150;
}

/// A coordinate of the colour primaries, and what it is without a sink.
struct chromaticity_t {
  u32 edid_t::*coordinate;
  u32 default_val;
};

constexpr chromaticity_t chromaticity[] = {
    {&edid_t::red_x, 640},  {&edid_t::red_y, 348}, {&edid_t::green_x, 287}, {&edid_t::green_y, 609},
    {&edid_t::blue_x, 159}, {&edid_t::blue_y, 72}, {&edid_t::white_x, 290}, {&edid_t::white_y, 305},
};

void set_chromaticity(const edid_t &sink, edid_t *edid) {
  for (const auto &[coordinate, default_val] : chromaticity) {
    edid->*coordinate = sink.valid != 0 ? sink.*coordinate : default_val;
  }
}

bool set_base_timings(const platform_values_t &values, edid_t *edid) {
  constexpr u32 vga_60 = 0x20;
  edid->est_timings_1 = values.established_timings_1 | vga_60;
  edid->est_timings_2 = values.established_timings_2;
  edid->man_timings = values.manufacturer_timings;
  return ll_copy_list(&values.std_timings, &edid->std_timings, sizeof(std_timing_t));
}

void set_extension_flags(const platform_values_t &values, edid_t *edid) {
  edid->underscan = values.underscan != 0 ? 1 : 0;
  edid->basic_audio = 1;
  edid->ycbcr_444 = 1;
  edid->ycbcr_422 = 1;
  edid->hdmi_present = 1;
}

void note_deep_color(decisions_t *decisions, const platform_values_t &values, const edid_t &edid) {
  const auto note = [decisions](u32 bits, bool offered, bool configured) {
    decisions->note(COMPOSE_SUBJECT_DEEP_COLOR, bits, offered ? COMPOSE_VERDICT_OFFERED : COMPOSE_VERDICT_LEFT_OUT,
                    COMPOSE_REASON_DEEP_COLOR_OF_PLATFORM, reason_values(configured));
  };
  note(30, edid.dc_30bit != 0, values.dc_30bit != 0);
  if (edid.dc_36bit != 0 && values.dc_36bit == 0) {
    decisions->note(COMPOSE_SUBJECT_DEEP_COLOR, 36, COMPOSE_VERDICT_CHANGED, COMPOSE_REASON_DEEP_COLOR_REQUIRED);
  } else {
    note(36, edid.dc_36bit != 0, values.dc_36bit != 0);
  }
  decisions->note(COMPOSE_SUBJECT_DEEP_COLOR, 48, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_DEEP_COLOR_NEVER);
}

void set_deep_color(const site_t &site, const platform_values_t &values, edid_t *edid, decisions_t *decisions) {
  edid->supports_ai = 0;
  edid->dc_48bit = 0;
  edid->dc_30bit = values.dc_30bit != 0 ? 1 : 0;
  edid->dc_36bit = values.dc_36bit != 0 ? 1 : 0;
  LOG_TRACE_AS(site, "\tdc_30bit = %d", edid->dc_30bit);
  LOG_TRACE_AS(site, "\tdc_36bit = %d", edid->dc_36bit);
  if ((edid->dc_30bit != 0 || edid->dc_48bit != 0) && edid->dc_36bit != 1) {
    LOG_WARNING_AS(
        site,
        "The HDMI standard requires 36bit Deep Color to be supported when 30bit or 48bit is supported. Please "
        "correct this in your platform configuration file. DC_30bit:%s DC_36bit:%s DC_48bit:%s Setting 36bit "
        "support to true.",
        true_or_false(edid->dc_30bit != 0), true_or_false(edid->dc_36bit != 0), true_or_false(edid->dc_48bit != 0));
    edid->dc_36bit = 1;
  }
  edid->dc_y444 = edid->dc_30bit != 0 || edid->dc_36bit != 0 || edid->dc_48bit != 0 ? 1 : 0;
  edid->dvi_dual = 0;
  if (decisions != nullptr) note_deep_color(decisions, values, *edid);
}

/// The TMDS clock that a pixel takes, in percent of the pixel clock.
u32 deep_color_factor(const edid_t &edid) {
  if (edid.dc_48bit != 0) return 200;
  if (edid.dc_36bit != 0) return 150;
  if (edid.dc_30bit != 0) return 125;
  return 100;
}

/// A TMDS clock, and what it follows from.
struct tmds_clock_t {
  u32 mhz;  ///< 0 when it needn't be declared.
  compose_reason reason;
  u32 pixel_clock;  ///< Hz
  u32 factor;       ///< %
};

/// The clock that the offered modes need.
tmds_clock_t needed_tmds_clock(const platform_values_t &values, const ll_list_t *video_list, const edid_t &edid) {
  constexpr std::int64_t undeclared_below = 165 * megahertz;
  constexpr std::int64_t clock_of_4k_x_2k = 297 * megahertz;
  const u32 factor = deep_color_factor(edid);
  const u32 pixel_clock = _maximum_pixel_clock(video_list);
  if (factor == 100 && pixel_clock < undeclared_below && edid.hdmi_vic_len == 0 && values.tmds_override == 0) {
    return {0, COMPOSE_REASON_TMDS_NOT_NEEDED, pixel_clock, factor};
  }
  const std::int64_t of_modes = std::int64_t{pixel_clock} * factor / 100;
  const std::int64_t clock = edid.hdmi_vic_len != 0 ? std::max(of_modes, clock_of_4k_x_2k) : of_modes;
  // kept: a multiple of 5 goes up by 5 too.
  const auto mhz = static_cast<u32>(clock / megahertz);
  return {mhz + 5 - mhz % 5, clock > of_modes ? COMPOSE_REASON_TMDS_OF_4K_MODES : COMPOSE_REASON_TMDS_OF_MODES,
          pixel_clock, factor};
}

void note_tmds_clock(decisions_t *decisions, const tmds_clock_t &clock, u32 held, const edid_t &sink) {
  constexpr u32 kilohertz = 1000;
  constexpr u32 unit = 5;
  const u32 declared = held / unit * unit;
  compose_verdict verdict = declared != 0 ? COMPOSE_VERDICT_OFFERED : COMPOSE_VERDICT_LEFT_OUT;
  if (declared != clock.mhz) verdict = COMPOSE_VERDICT_CHANGED;
  if (held != clock.mhz) {
    decisions->note(COMPOSE_SUBJECT_TMDS_CLOCK, declared, verdict, COMPOSE_REASON_TMDS_LARGEST,
                    reason_values(clock.mhz, declared));
    return;
  }
  const bool overridden = clock.reason == COMPOSE_REASON_TMDS_OVERRIDE;
  decisions->note(COMPOSE_SUBJECT_TMDS_CLOCK, declared, verdict, clock.reason,
                  overridden ? reason_values(clock.mhz, sink.max_tmds_clock)
                             : reason_values(clock.pixel_clock / kilohertz, clock.factor, sink.max_tmds_clock));
}

void set_tmds_clock(const platform_values_t &values, const ll_list_t *video_list, const edid_t &sink, edid_t *edid,
                    decisions_t *decisions) {
  constexpr i32 lowest_override = 25;
  constexpr u32 highest = 1275;
  const bool overridden = values.tmds_override >= lowest_override;
  const tmds_clock_t clock =
      overridden ? tmds_clock_t{static_cast<u32>(values.tmds_override), COMPOSE_REASON_TMDS_OVERRIDE, 0, 0}
                 : needed_tmds_clock(values, video_list, *edid);
  edid->max_tmds_clock = std::min(clock.mhz, highest);
  if (decisions != nullptr) note_tmds_clock(decisions, clock, edid->max_tmds_clock, sink);
}

/// A tri-state: off, on, or as the sink.
template <typename number_t>
u8 tri_state(number_t platform_value, u8 sink_value) {
  constexpr number_t as_sink = 2;
  return (platform_value == as_sink ? sink_value != 0 : platform_value != 0) ? 1 : 0;
}

void set_content_types(const platform_values_t &values, const edid_t &sink, edid_t *edid) {
  edid->supports_ai = tri_state(values.supports_ai, sink.supports_ai);
  edid->cnc0 = tri_state(values.cnc0, sink.cnc0);
  edid->cnc1 = tri_state(values.cnc1, sink.cnc1);
  edid->cnc2 = tri_state(values.cnc2, sink.cnc2);
  edid->cnc3 = tri_state(values.cnc3, sink.cnc3);
}

void set_speakers(const site_t &site, const platform_values_t &values, edid_t *edid) {
  const auto entry = static_cast<u32>(values.speaker_entry);
  for (u32 i = 0; i < 3; ++i)
    edid->speaker[i] = static_cast<u8>(entry >> 8 * i & 0xFF);
  LOG_TRACE_AS(site, "\tspeaker = 3:0x%02X 2:0x%02X 1:0x%02X", edid->speaker[2], edid->speaker[1], edid->speaker[0]);
}

constexpr i32 fewest_modes = 4;
constexpr u32 padding_vic = 1;

void note_padding(decisions_t *decisions, i32 chosen) {
  const bool enough = chosen >= fewest_modes;
  decisions->note(COMPOSE_SUBJECT_PADDING, enough ? 0 : static_cast<u32>(fewest_modes - chosen),
                  enough ? COMPOSE_VERDICT_LEFT_OUT : COMPOSE_VERDICT_OFFERED,
                  enough ? COMPOSE_REASON_ENOUGH_MODES : COMPOSE_REASON_TOO_FEW_MODES,
                  reason_values(chosen, fewest_modes));
  if (!enough) offer_mode(decisions, padding_vic, COMPOSE_ORIGIN_LIBRARY, COMPOSE_REASON_PADS_THE_LIST);
}

/// Appends VIC 1 until there are enough modes.
bool pad_video_modes(const site_t &site, ll_list_t *video_list, decisions_t *decisions) {
  if (decisions != nullptr) note_padding(decisions, ll_size(video_list));
  for (i32 size = ll_size(video_list); size < fewest_modes; size = ll_size(video_list)) {
    LOG_ERROR_AS(site,
                 "The number of video formats to be encoded is less than 4! Padding until 4 is reached. Check the "
                 "platform configuration file is correct. Number in the video list:%d",
                 size);
    const short_video_desc_t vga{.native = 0, .vic = padding_vic, .stereo = 0};
    if (!append(video_list, vga, HERE_AS(site))) return false;
  }
  return true;
}

void trace_video_modes(const site_t &site, const ll_list_t *video_list) {
  if (!debug_enabled()) return;
  log_trace(HERE_AS(site), "\tNew EDID List of VICs:");
  for (const auto &video : walk<const short_video_desc_t>(LIST_AS(site, video_list))) {
    print("\t\tVIC:%d %s %s %s %s %s\n", video.vic, short_video_timing_string(video.vic),
          (video.stereo & STEREO_FRAME_PACKING) != 0 ? "FP" : "",
          (video.stereo & STEREO_SIDE_BY_SIDE_HALF) != 0 ? "SBSH" : "",
          (video.stereo & STEREO_TOP_AND_BOTTOM) != 0 ? "TBH" : "", video.native != 0 ? "Native" : "      ");
  }
  log_trace(HERE_AS(site), "\tEncoding the video timings: Num:%d", ll_size(video_list));
  log_trace(HERE_AS(site), "\tCreating the first 2 DTDs.");
}

/// The first modes as detailed timings: the first of them is the preferred mode.
enum class timings_result_t { done, no_such_mode, failed };

timings_result_t add_detailed_timings(const site_t &site, const ll_list_t *video_list, edid_t *edid) {
  constexpr i32 count = 2;
  for (i32 i = 0; i < count; ++i) {
    void *payload = nullptr;
    if (!ll_entry_at(video_list, i, &payload)) {
      LOG_ERROR_AS(site, "Failed reading from an linked list. index:%d ptr:%p", i, address(payload));
      return timings_result_t::no_such_mode;
    }
    const u32 vic = static_cast<const short_video_desc_t *>(payload)->vic;
    LOG_TRACE_AS(site, "\t\tVIC:%d %s", vic, short_video_timing_string(vic));
    detailed_timing_t timing{};
    if (convert_vic_to_dtd(vic, &timing) != 1) {
      LOG_ERROR_AS(site, "Error converting vic to dtd. Vic:%d:%s", vic, short_video_timing_string(vic));
      return timings_result_t::failed;
    }
    if (!append(&edid->dtd_list, timing, HERE_AS(site))) return timings_result_t::failed;
  }
  return timings_result_t::done;
}

bool add_short_video_descriptors(const site_t &site, const ll_list_t *video_list, edid_t *edid) {
  LOG_TRACE_AS(site, "\tEncoding the VIC list up to 31 modes. Total:%d", ll_size(video_list));
  for (const auto &mode : walk<const short_video_desc_t>(LIST_AS(site, video_list))) {
    const short_video_desc_t video{.native = 0, .vic = mode.vic, .stereo = mode.stereo};
    if (!append(&edid->video_list, video, HERE_AS(site))) return false;
  }
  return true;
}

}  // namespace

u32 _populate_new_edid(edid_t *new_edid, ll_list_t *video_list, const edid_t *downstream, u8 port, i32 hdmi_3d_mode,
                       const u32 *edid_latency, const platform_values_t *platform_values, decisions_t *decisions) {
  const platform_values_t &values = *platform_values;
  const edid_t &sink = *downstream;
  LOG_TRACE("Setting up the new EDID:");
  set_identity(HERE, values, new_edid);
  if (edid_latency == nullptr) {
    LOG_ERROR("Empty edid_latency pointer.");
    return 0;
  }
  set_latencies(edid_latency, sink, new_edid, decisions);
  set_3d(hdmi_3d_mode, sink, new_edid, decisions);
  set_display(new_edid);
  set_chromaticity(sink, new_edid);
  if (!set_base_timings(values, new_edid)) return 0;
  set_extension_flags(values, new_edid);
  set_physical_address(HERE, values.is_tv != 0, sink, port, new_edid, decisions);
  set_deep_color(HERE, values, new_edid, decisions);
  set_tmds_clock(values, video_list, sink, new_edid, decisions);
  set_content_types(values, sink, new_edid);
  set_speakers(HERE, values, new_edid);

  if (!pad_video_modes(HERE, video_list, decisions)) return 0;
  trace_video_modes(HERE, video_list);
  switch (add_detailed_timings(HERE, video_list, new_edid)) {
    case timings_result_t::done:
      break;
    case timings_result_t::no_such_mode:
      return 1;  // kept: not a failure. With the padding above it does not come to this.
    case timings_result_t::failed:
      return 0;
  }
  if (!add_short_video_descriptors(HERE, video_list, new_edid)) return 0;
  new_edid->hdmi_video_present = new_edid->hdmi_3d_present != 0 || new_edid->hdmi_vic_len != 0 ? 1 : 0;
  new_edid->xvycc601 = tri_state(values.xvYCC601, sink.xvycc601);
  new_edid->xvycc709 = tri_state(values.xvYCC709, sink.xvycc709);
  return 1;
}

}  // namespace edid_composer
