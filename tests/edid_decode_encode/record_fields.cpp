#include "record_fields.h"

#include <cstddef>

namespace codec_test {
namespace {

// The text of a character array up to its NUL, or all of it.
template <std::size_t size>
std::string text_in(const char (&field)[size]) {
  std::size_t length = 0;
  while (length < size && field[length] != '\0')
    ++length;
  return std::string(field, length);
}

template <typename record_t>
void add_entries(fields_t &fields, const std::string &name, const ll_list_t &list) {
  std::size_t index = 0;
  for (const ll_entry_t *entry = list.head; entry != nullptr; entry = entry->next, ++index) {
    const auto &record = *static_cast<const record_t *>(entry->data);
    fields.merge(prefixed(name + "[" + std::to_string(index) + "].", fields_of(record)));
  }
}

void add_base_block(fields_t &fields, const edid_t &edid) {
  const auto add = [&](const char *name, u32 value) { fields[name] = std::to_string(value); };
  add("valid", edid.valid);
  fields["manufacturer"] = text_in(edid.manufacturer);
  add("product_code", edid.product_code);
  add("serial_number", edid.serial_number);
  add("week", edid.week);
  add("year", edid.year);
  add("version", edid.version);
  add("revision", edid.revision);
  add("digital", edid.digital);
  add("h_size_cm", edid.h_size_cm);
  add("v_size_cm", edid.v_size_cm);
  add("gamma", edid.gamma);
  add("standby", edid.standby);
  add("suspend", edid.suspend);
  add("active_off", edid.active_off);
  add("standard_colorspace", edid.standard_colorspace);
  add("preferred_timing", edid.preferred_timing);
  add("gtf", edid.gtf);
  add("red_x", edid.red_x);
  add("red_y", edid.red_y);
  add("green_x", edid.green_x);
  add("green_y", edid.green_y);
  add("blue_x", edid.blue_x);
  add("blue_y", edid.blue_y);
  add("white_x", edid.white_x);
  add("white_y", edid.white_y);
  add("est_timings_1", edid.est_timings_1);
  add("est_timings_2", edid.est_timings_2);
  add("man_timings", edid.man_timings);
  add_entries<std_timing_t>(fields, "std_timings", edid.std_timings);
  add_entries<detailed_timing_t>(fields, "dtd_list", edid.dtd_list);
  fields["serial_string"] = text_in(edid.serial_string);
  fields["data_string"] = text_in(edid.data_string);
  fields["monitor_name"] = text_in(edid.monitor_name);
  add("min_v_rate", edid.min_v_rate);
  add("max_v_rate", edid.max_v_rate);
  add("min_h_rate", edid.min_h_rate);
  add("max_h_rate", edid.max_h_rate);
  add("max_pixel_clock", edid.max_pixel_clock);
  add("extension_count", edid.extension_count);
  add("checksum", edid.checksum);
}

void add_extension(fields_t &fields, const edid_t &edid) {
  const auto add = [&](const std::string &name, u32 value) { fields[name] = std::to_string(value); };
  add("underscan", edid.underscan);
  add("basic_audio", edid.basic_audio);
  add("ycbcr_444", edid.ycbcr_444);
  add("ycbcr_422", edid.ycbcr_422);
  add_entries<short_video_desc_t>(fields, "video_list", edid.video_list);
  add_entries<short_audio_desc_t>(fields, "audio_list", edid.audio_list);
  for (std::size_t i = 0; i < 3; ++i)
    add("speaker[" + std::to_string(i) + "]", edid.speaker[i]);
  add("hdmi_present", edid.hdmi_present);
  for (std::size_t i = 0; i < 4; ++i)
    add("physical_address[" + std::to_string(i) + "]", edid.physical_address[i]);
  add("dc_48bit", edid.dc_48bit);
  add("dc_36bit", edid.dc_36bit);
  add("dc_30bit", edid.dc_30bit);
  add("dc_y444", edid.dc_y444);
  add("dvi_dual", edid.dvi_dual);
  add("max_tmds_clock", edid.max_tmds_clock);
  add("supports_ai", edid.supports_ai);
  add("cnc0", edid.cnc0);
  add("cnc1", edid.cnc1);
  add("cnc2", edid.cnc2);
  add("cnc3", edid.cnc3);
  add("hdmi_video_present", edid.hdmi_video_present);
  add("video_latency", edid.video_latency);
  add("audio_latency", edid.audio_latency);
  add("i_video_latency", edid.i_video_latency);
  add("i_audio_latency", edid.i_audio_latency);
  add("hdmi_3d_present", edid.hdmi_3d_present);
  add("image_size", edid.image_size);
  add("hdmi_vic_len", edid.hdmi_vic_len);
  for (std::size_t i = 0; i < 7; ++i)
    add("hdmi_vic[" + std::to_string(i) + "]", edid.hdmi_vic[i]);
  add("xvycc601", edid.xvycc601);
  add("xvycc709", edid.xvycc709);
}

}  // namespace

fields_t fields_of(const detailed_timing_t &timing) {
  return {{"valid", std::to_string(timing.valid)},
          {"pixel_clock", std::to_string(timing.pixel_clock)},
          {"h_active", std::to_string(timing.h_active)},
          {"h_blanking", std::to_string(timing.h_blanking)},
          {"h_sync_offset", std::to_string(timing.h_sync_offset)},
          {"h_sync_width", std::to_string(timing.h_sync_width)},
          {"h_border", std::to_string(timing.h_border)},
          {"v_active", std::to_string(timing.v_active)},
          {"v_blanking", std::to_string(timing.v_blanking)},
          {"v_sync_offset", std::to_string(timing.v_sync_offset)},
          {"v_sync_width", std::to_string(timing.v_sync_width)},
          {"v_border", std::to_string(timing.v_border)},
          {"h_image_size", std::to_string(timing.h_image_size)},
          {"v_image_size", std::to_string(timing.v_image_size)},
          {"progressive", std::to_string(timing.progressive)},
          {"stereo", std::to_string(timing.stereo)},
          {"h_sync_positive", std::to_string(timing.h_sync_positive)},
          {"v_sync_positive", std::to_string(timing.v_sync_positive)}};
}

fields_t fields_of(const std_timing_t &timing) {
  return {{"h_active", std::to_string(timing.h_active)},
          {"aspect_ratio", std::to_string(timing.aspect_ratio)},
          {"refresh_rate", std::to_string(timing.refresh_rate)}};
}

fields_t fields_of(const short_video_desc_t &video) {
  return {{"native", std::to_string(video.native)},
          {"vic", std::to_string(video.vic)},
          {"stereo", std::to_string(video.stereo)}};
}

fields_t fields_of(const short_audio_desc_t &audio) {
  return {{"type", std::to_string(audio.type)},
          {"channels", std::to_string(audio.channels)},
          {"frequencies", std::to_string(audio.frequencies)},
          {"pcm_bits", std::to_string(audio.pcm_bits)},
          {"max_bitrate", std::to_string(audio.max_bitrate)},
          {"value", std::to_string(audio.value)},
          {"wma_profile", std::to_string(audio.wma_profile)}};
}

fields_t fields_of(const edid_t &edid) {
  fields_t fields;
  add_base_block(fields, edid);
  add_extension(fields, edid);
  return fields;
}

fields_t difference(const fields_t &before, const fields_t &after) {
  fields_t changed;
  for (const auto &[name, value] : after) {
    const auto old = before.find(name);
    if (old == before.end() || old->second != value) changed[name] = value;
  }
  for (const auto &[name, value] : before) {
    if (after.count(name) == 0) changed[name] = "(gone)";
  }
  return changed;
}

fields_t prefixed(const std::string &prefix, const fields_t &fields) {
  fields_t renamed;
  for (const auto &[name, value] : fields)
    renamed[prefix + name] = value;
  return renamed;
}

fields_t together(fields_t a, const fields_t &b) {
  a.insert(b.begin(), b.end());
  return a;
}

}  // namespace codec_test
