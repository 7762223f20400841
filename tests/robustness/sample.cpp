#include "sample.h"

#include "support/hex_text.h"

namespace robustness {
namespace {

using test_support::bytes_t;
using test_support::timing_descriptor;
using test_support::timing_of_vic;

// A display descriptor whose second byte should be 0: the base block's decoding stops there.
bytes_t malformed_descriptor() {
  bytes_t descriptor(18);
  descriptor[2] = 1;
  return descriptor;
}

// A header whose block overruns the collection: the extension's decoding stops there.
const bytes_t overrunning_block{0xFF};

}  // namespace

bytes_t sample_sink_t::build() const {
  test_support::base_block_builder_t base;
  base.extensions(1);
  for (u32 i = 0; i < std_timings.size(); ++i)
    base.standard_timing(i, std_timings[i][0], std_timings[i][1]);
  u32 slot = 0;
  for (const u32 vic : base_timings)
    base.descriptor(slot++, timing_descriptor(timing_of_vic(vic)));
  base.descriptor(slot++, end == end_t::behind_base_timings ? malformed_descriptor()
                                                            : test_support::text_descriptor(0xFC, "Television"));
  base.descriptor(slot, test_support::range_limits_descriptor(48, 62, 14, 70, 15));

  test_support::extension_builder_t extension;
  extension.flags(0x70).block(test_support::video_block(video));
  if (end != end_t::behind_video) extension.block(test_support::audio_block(audio));
  if (end == end_t::none) {
    extension.block(test_support::data_block(4, {0x01, 0, 0})).block(test_support::hdmi_block(hdmi));
  } else {
    extension.block(overrunning_block);
  }
  for (const u32 vic : extension_timings)
    extension.timing(vic == 0 ? bytes_t(18) : timing_descriptor(timing_of_vic(vic)));
  return test_support::join(base.build(), extension.build());
}

sample_sink_t rich_sink() {
  sample_sink_t sink;
  sink.std_timings = {{0x81, 0x80}, {0x31, 0x40}};
  sink.base_timings = {16, 4};
  sink.extension_timings = {5, 2};
  sink.video = {0x90, 4, 5, 34};
  sink.audio = {0x15, 0x07, 0x50, 0x35, 0x06, 0x10};
  return sink;
}

test_support::platform_configuration_t rich_configuration() {
  test_support::platform_configuration_t configuration;
  configuration.audio = {0x07070F, 0x500715, 0xC0063E};
  configuration.video_50_priority = {{31, 5}, {19, 5}, {20, 2}, {17, 0}};
  configuration.video_50_additional = {{18, 0}};
  configuration.video_60_priority = {{16, 5}, {4, 5}, {5, 2}, {2, 0}, {3, 0}, {1, 0}, {33, 0}};
  configuration.video_60_additional = {{3, 0}, {1, 0}, {2, 0}, {4, 4}};
  configuration.modes_4k_x_2k_priority = {3, 1};
  configuration.modes_4k_x_2k_addition = {1, 2};
  configuration.std_timings = {{1280, 2, 60}, {1920, 3, 75}};
  configuration.current_mode_set_to_priority = 1;
  configuration.audio_pass_through = 1;
  configuration.dc_36bit = 1;
  configuration.manufacturer_id = "TST";
  configuration.monitor_name = "Living room";
  configuration.monitor_serial = "SN-0042";
  configuration.established_timings_2 = 0x18;
  return configuration;
}

compose_cfg_t rich_settings() {
  compose_cfg_t cfg = test_support::plain_settings();
  cfg.hdmi_current_mode = {1920, 1080, 0, 60};
  cfg.hdmi_3d_mode = 2;
  cfg.edid_latency[0] = 20;
  cfg.port = 2;
  return cfg;
}

std::string words_of(const test_support::composition_t &composition) {
  if (!composition.rest_untouched) return "wrote where it may not\n";
  if (!composition.result) return "refused\n";
  const u8 *const bytes = composition.bytes.data();
  if (test_support::block_sum(bytes) != 0 || test_support::block_sum(bytes + 128) != 0) return "wrong checksum\n";
  return test_support::hex_lines(composition.bytes);
}

}  // namespace robustness
