#include "edid_composer/new_edid/population.h"

#include <cstring>

#include "edid_composer/new_edid/video_descriptors.h"
#include "linked_list/linked_list.h"
#include "text_field.h"

namespace edid_composer {
namespace {

REPORTS_AS(_populate_new_edid);

void set_identity(const platform_values_t &platform, edid_t *new_edid) {
  new_edid->product_code = platform.product_id;
  new_edid->serial_number = platform.serial;
  new_edid->week = static_cast<u8>(platform.week & 0xFF);
  new_edid->year = platform.year;
  std::strncpy(new_edid->manufacturer, platform.manufacturer_id, sizeof new_edid->manufacturer);
  std::strncpy(new_edid->monitor_name, platform.monitor_name, sizeof new_edid->monitor_name);
  std::strncpy(new_edid->serial_string, platform.monitor_serial, sizeof new_edid->serial_string);
  LOG_TRACE("\tProduct Code    = 0x%X", new_edid->product_code);
  LOG_TRACE("\tSerial Number   = 0x%X", new_edid->serial_number);
  LOG_TRACE("\tweek            = %d", new_edid->week);
  LOG_TRACE("\tyear            = %d", new_edid->year);
  LOG_TRACE("\tManufacturer ID = %s", text_field_t(new_edid->manufacturer).c_str());
  LOG_TRACE("\tMonitor Name    = %s", text_field_t(new_edid->monitor_name).c_str());
}

/// What every composed EDID says of its display. kept: fixed, whatever the display and the modes are.
void set_display(edid_t *new_edid) {
  new_edid->version = 1;
  new_edid->revision = 3;
  new_edid->digital = 1;
  new_edid->h_size_cm = 160;
  new_edid->v_size_cm = 90;
  new_edid->gamma = 120;  // 2.20
  new_edid->standby = 0;
  new_edid->suspend = 0;
  new_edid->active_off = 0;
  new_edid->standard_colorspace = 1;
  new_edid->preferred_timing = 1;
  new_edid->gtf = 0;
  new_edid->min_v_rate = 49;
  new_edid->max_v_rate = 61;
  new_edid->min_h_rate = 15;
  new_edid->max_h_rate = 70;
  new_edid->max_pixel_clock = 150;
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

void set_chromaticity(const edid_t &sink, edid_t *new_edid) {
  for (const auto &[coordinate, default_val] : chromaticity) {
    new_edid->*coordinate = sink.valid != 0 ? sink.*coordinate : default_val;
  }
}

bool set_base_timings(const platform_values_t &platform, edid_t *new_edid, entry_arena_t *arena) {
  constexpr u32 vga_60 = 0x20;
  new_edid->est_timings_1 = platform.established_timings_1 | vga_60;
  new_edid->est_timings_2 = platform.established_timings_2;
  new_edid->man_timings = platform.manufacturer_timings;
  return copy_list(&platform.std_timings, &new_edid->std_timings, sizeof(std_timing_t), arena);
}

void set_extension_flags(const platform_values_t &platform, edid_t *new_edid) {
  new_edid->underscan = platform.underscan != 0;
  new_edid->basic_audio = 1;
  new_edid->ycbcr_444 = 1;
  new_edid->ycbcr_422 = 1;
  new_edid->hdmi_present = 1;
}

/// Whether 3D is offered, as the caller asks for it.
compose_reason offer_3d(const inputs_t &inputs) {
  constexpr i32 always = 2;
  constexpr i32 as_sink = 1;
  if (inputs.settings.hdmi_3d_mode == always) return COMPOSE_REASON_3D_ALWAYS;
  if (inputs.settings.hdmi_3d_mode != as_sink) return COMPOSE_REASON_3D_OFF;
  return inputs.sink.hdmi_3d_present != 0 ? COMPOSE_REASON_3D_OF_SINK : COMPOSE_REASON_3D_NOT_IN_SINK;
}

void set_3d(compose_reason reason, edid_t *new_edid) {
  const bool offered = reason == COMPOSE_REASON_3D_ALWAYS || reason == COMPOSE_REASON_3D_OF_SINK;
  new_edid->hdmi_3d_present = offered;
  if (offered) new_edid->image_size = 1;
}

void set_4k_modes(const hdmi_vics_t &modes_4k, edid_t *new_edid) {
  std::copy(modes_4k.begin(), modes_4k.end(), new_edid->hdmi_vic);
  new_edid->hdmi_vic_len = static_cast<u8>(modes_4k.size());
}

void set_deep_color(const deep_color_t &deep_color, edid_t *new_edid) {
  new_edid->dc_48bit = 0;
  new_edid->dc_36bit = deep_color.bits_36;
  new_edid->dc_30bit = deep_color.bits_30;
  new_edid->dc_y444 = deep_color.any();
  new_edid->dvi_dual = 0;
}

/// A tri-state: off, on, or as the sink.
template <typename number_t>
u8 tri_state(number_t platform_value, u8 sink_value) {
  constexpr number_t as_sink = 2;
  return (platform_value == as_sink ? sink_value != 0 : platform_value != 0) ? 1 : 0;
}

void set_content_types(const platform_values_t &platform, const edid_t &sink, edid_t *new_edid) {
  new_edid->supports_ai = tri_state(platform.supports_ai, sink.supports_ai);
  new_edid->cnc0 = tri_state(platform.cnc0, sink.cnc0);
  new_edid->cnc1 = tri_state(platform.cnc1, sink.cnc1);
  new_edid->cnc2 = tri_state(platform.cnc2, sink.cnc2);
  new_edid->cnc3 = tri_state(platform.cnc3, sink.cnc3);
}

void set_speakers(const platform_values_t &platform, edid_t *new_edid) {
  const auto entry = static_cast<u32>(platform.speaker_entry);
  for (u32 i = 0; i < 3; ++i)
    new_edid->speaker[i] = static_cast<u8>(entry >> 8 * i & 0xFF);
  LOG_TRACE("\tspeaker = 3:0x%02X 2:0x%02X 1:0x%02X", new_edid->speaker[2], new_edid->speaker[1], new_edid->speaker[0]);
}

}  // namespace

population_t _populate_new_edid(const inputs_t &inputs, const hdmi_vics_t &modes_4k, edid_t *new_edid) {
  const auto &[sink, platform, settings, arena] = inputs;
  population_t population;
  LOG_TRACE("Setting up the new EDID:");
  set_identity(platform, new_edid);
  for (u32 which = 0; which < latency_count; ++which) {
    population.latencies[which] = add_latencies(inputs, which);
    new_edid->*latency_fields[which] = population.latencies[which].sum_ms;
  }
  population.reason_of_3d = offer_3d(inputs);
  set_3d(population.reason_of_3d, new_edid);
  set_4k_modes(modes_4k, new_edid);
  set_display(new_edid);
  set_chromaticity(sink, new_edid);
  if (!set_base_timings(platform, new_edid, arena)) return population;
  set_extension_flags(platform, new_edid);
  population.physical_address = place_input(inputs);
  std::memcpy(new_edid->physical_address, population.physical_address.parts, sizeof new_edid->physical_address);
  population.deep_color = offer_deep_color(platform);
  set_deep_color(population.deep_color, new_edid);
  population.tmds_clock = declare_tmds_clock(inputs, new_edid->video_list, modes_4k.size() != 0, population.deep_color);
  new_edid->max_tmds_clock = population.tmds_clock.held_mhz();
  set_content_types(platform, sink, new_edid);
  set_speakers(platform, new_edid);

  population.modes_before_padding = static_cast<i32>(new_edid->video_list.size);
  if (!pad_video_modes(&new_edid->video_list, arena)) return population;
  trace_video_modes(&new_edid->video_list);
  if (!add_detailed_timings(new_edid->video_list, &new_edid->dtd_list, arena)) return population;
  LOG_TRACE("\tEncoding the VIC list up to 31 modes. Total:%d", new_edid->video_list.size);
  new_edid->hdmi_video_present = new_edid->hdmi_3d_present != 0 || new_edid->hdmi_vic_len != 0;
  new_edid->xvycc601 = tri_state(platform.xvYCC601, sink.xvycc601);
  new_edid->xvycc709 = tri_state(platform.xvYCC709, sink.xvycc709);
  population.complete = true;
  return population;
}

}  // namespace edid_composer
