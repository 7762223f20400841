// What holds for every composition, whatever the sink and the configuration.
#include <gtest/gtest.h>

#include <cstring>
#include <random>
#include <string>
#include <thread>
#include <vector>

#include "composition.h"
#include "extension_view.h"
#include "support/configuration_tree.h"
#include "support/edid_builder.h"
#include "support/hex_text.h"
#include "support/output_capture.h"
#include "support/records.h"

namespace {

using end_to_end::compose;
using test_support::append;
using test_support::append_modes;
using test_support::bytes_t;
using test_support::hex_lines;

bytes_t television() {
  return test_support::join(test_support::base_block_builder_t()
                                .descriptor(0, test_support::timing_descriptor(test_support::timing_of_vic(16)))
                                .descriptor(1, test_support::text_descriptor(0xFC, "Television"))
                                .extensions(1)
                                .build(),
                            test_support::extension_builder_t()
                                .block(test_support::video_block({0x90, 4, 5, 31, 20, 19}))
                                .block(test_support::audio_block({0x09, 0x07, 0x07, 0x15, 0x07, 0x50}))
                                .block(test_support::hdmi_block({0x10, 0x00, 0xB8, 0x2D, 0xA0, 0x0B, 0x0B, 0x80, 0x24,
                                                                 0x01, 0x01, 0x40, 0x06, 0x16}))
                                .build());
}

void fill(platform_values_t *values) {
  std::strcpy(values->monitor_name, "Box");
  append_modes(values->video_60_priority, {{16, 7}, {4, 7}, {5, 7}, {2, 0}, {1, 0}});
  append_modes(values->video_60_additional, {{2, 0}, {1, 0}});
  append_modes(values->video_50_priority, {{31, 7}, {19, 7}, {20, 7}, {17, 0}});
  append_modes(values->video_50_additional, {{17, 0}, {1, 0}});
  append(values->audio_list, i32{0x050709});
  append(values->audio_list, i32{0x500715});
  append(values->std_timings, std_timing_t{1280, 2, 60});
  values->modes_4k_x_2k_priority[0] = 1;
  values->audio_pass_through = 1;
}

TEST(Composition, ItsOutputDecodesToWhatWasPutIn) {
  test_support::scoped_values_t values;
  fill(values.get());
  compose_cfg_t cfg = test_support::plain_settings();
  cfg.hdmi_3d_mode = 2;
  const auto composition = compose(television(), cfg, values.get(), false);
  ASSERT_TRUE(composition.composed);
  test_support::scoped_edid_t edid;
  ASSERT_EQ(decode_edid_block_0(composition.bytes.data(), edid.get()), 1);
  ASSERT_EQ(decode_edid_extensions(composition.bytes.data() + 128, 128, edid.get()), 1);
  EXPECT_STREQ(edid->manufacturer, "YYY");
  EXPECT_STREQ(edid->monitor_name, "Box");
  EXPECT_EQ(edid->extension_count, 1);
  EXPECT_EQ(edid->hdmi_vic_len, 1);
  EXPECT_EQ(edid->hdmi_3d_present, 1);
  EXPECT_EQ(std::vector<u8>(edid->physical_address, edid->physical_address + 4), (std::vector<u8>{1, 1, 0, 0}));
  // The mandatory structures of 720p60 and 1080i60 are told by 3D_present and do not come back from the list.
  EXPECT_EQ(test_support::modes_of(edid->video_list),
            (std::vector<test_support::mode_pair_t>{{16, 4}, {4, 0}, {5, 0}, {2, 0}, {1, 0}}));
  EXPECT_EQ(test_support::audio_of(edid->audio_list),
            (std::vector<test_support::audio_words_t>{{1, 2, 7, 5, 0, 0, 0}, {2, 6, 7, 0, 640, 0, 0}}));
  EXPECT_EQ(test_support::std_timings_of(edid->std_timings),
            (std::vector<test_support::std_timing_words_t>{{1280, 2, 60}}));
}

TEST(Composition, MayBeTheSinkOfTheNextOne) {
  test_support::scoped_values_t values;
  fill(values.get());
  const compose_cfg_t cfg = test_support::plain_settings();
  bytes_t sink = television();
  std::vector<std::pair<u8, u8>> addresses;
  for (int level = 0; level < 5; ++level) {
    const auto composition = compose(sink, cfg, values.get(), false);
    ASSERT_TRUE(composition.composed);
    addresses.emplace_back(composition.bytes[composition.spa_offset], composition.bytes[composition.spa_offset + 1U]);
    sink = composition.bytes;
  }
  EXPECT_EQ(addresses,
            (std::vector<std::pair<u8, u8>>{{0x11, 0x00}, {0x11, 0x10}, {0x11, 0x11}, {0xFF, 0xFF}, {0xFF, 0xFF}}));
}

TEST(Composition, LeavesNothingBehindForTheNextOne) {
  test_support::scoped_values_t values;
  fill(values.get());
  const compose_cfg_t cfg = test_support::plain_settings();
  const auto before = compose({}, cfg, values.get(), false);
  compose(television(), cfg, values.get(), true);
  const auto after = compose({}, cfg, values.get(), false);
  EXPECT_EQ(hex_lines(before.bytes), hex_lines(after.bytes));
  EXPECT_EQ(before.output, after.output);
  EXPECT_FALSE(debug_enabled());
}

TEST(Composition, ReadsTheSettingsOnly) {
  test_support::scoped_values_t values;
  fill(values.get());
  compose_cfg_t cfg = test_support::plain_settings();
  cfg.hdmi_current_mode = {1920, 1080, 0, 60};
  u8 offset = 0;
  cfg.spa_offset = &offset;
  const compose_cfg_t before = cfg;
  bytes_t edid(256);
  const bytes_t sink = television();
  EXPECT_TRUE(compose_edid_internal(sink.data(), 256, edid.data(), 256, &cfg, values.get()));
  EXPECT_EQ(std::memcmp(&cfg, &before, sizeof cfg), 0);
}

TEST(Composition, OfSeveralThreadsFromTheSameValuesIsTheSame) {
  test_support::scoped_values_t values;
  fill(values.get());
  const compose_cfg_t cfg = test_support::plain_settings();
  const bytes_t sink = television();
  const auto expected = compose(sink, cfg, values.get(), false);
  std::vector<bytes_t> results(4, bytes_t(256));
  std::vector<std::thread> threads;
  for (bytes_t &result : results) {
    threads.emplace_back([&] {
      for (int i = 0; i < 50; ++i)
        compose_edid_internal(sink.data(), 256, result.data(), 256, &cfg, values.get());
    });
  }
  for (std::thread &thread : threads)
    thread.join();
  for (const bytes_t &result : results)
    EXPECT_EQ(hex_lines(result), hex_lines(expected.bytes));
}

TEST(Composition, OfADamagedSinkIsAlwaysAValidEdid) {
  test_support::scoped_values_t values;
  fill(values.get());
  std::mt19937 random(861);
  const bytes_t good = television();
  for (int round = 0; round < 2000; ++round) {
    bytes_t sink = good;
    // Damage after the header, mended checksums: the decoders have to look at every field.
    for (auto count = random() % 8 + 1; count > 0; --count)
      sink[8 + random() % 248] = static_cast<u8>(random());
    sink.resize(round % 3 == 0 ? 128 : 256);
    test_support::mend_checksum(sink, 0);
    if (sink.size() == 256) test_support::mend_checksum(sink, 128);
    compose_cfg_t cfg = test_support::plain_settings();
    cfg.hdmi_3d_mode = static_cast<i32>(random() % 3);
    cfg.port = static_cast<u32>(random() % 20);
    const auto composition = compose(sink, cfg, values.get(), round % 10 == 0);
    EXPECT_TRUE(composition.composed) << hex_lines(sink) << composition.output;
    end_to_end::expect_valid_edid(composition.bytes);
  }
}

TEST(Composition, AsksTheHostForTheConfigurationAnewEachTime) {
  test_support::configuration_tree_t tree;
  tree.fill_completely();
  const compose_cfg_t cfg = test_support::plain_settings();
  const auto first = compose({}, cfg, nullptr, false);
  const int lookups = tree.lookups();
  EXPECT_GT(lookups, 60);
  tree.set("monitor_name", std::string("Bedroom"));
  const auto second = compose({}, cfg, nullptr, false);
  EXPECT_EQ(tree.lookups(), 2 * lookups);
  EXPECT_EQ(end_to_end::text_of(first.bytes, 0xFC), "Living room");
  EXPECT_EQ(end_to_end::text_of(second.bytes, 0xFC), "Bedroom");
}

}  // namespace
