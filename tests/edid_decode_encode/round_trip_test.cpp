// What is encoded and decoded again is the record that it was, but for what the bytes have no room for.
#include "encoder_fixture.h"

namespace codec_test {
namespace {

// Decodes 256 bytes, both blocks without a word.
void decode(const bytes_t &bytes, edid_t *edid) {
  EXPECT_EQ(output_of([&] {
              EXPECT_EQ(decode_base_block(slice(bytes, 0, 128), edid), 1);
              EXPECT_EQ(decode_extension(slice(bytes, 128, 128), edid), 1);
            }),
            "");
}

void fill_base_block(edid_t *edid) {
  edid->product_code = 0xBEEF;
  edid->serial_number = 0x87654321;
  edid->week = 42;
  edid->h_size_cm = 121;
  edid->v_size_cm = 68;
  edid->gamma = 120;
  edid->suspend = 1;
  edid->standard_colorspace = 1;
  edid->preferred_timing = 1;
  edid->red_x = 655;
  edid->red_y = 338;
  edid->green_x = 307;
  edid->green_y = 614;
  edid->blue_x = 154;
  edid->blue_y = 61;
  edid->white_x = 320;
  edid->white_y = 337;
  edid->est_timings_1 = 0x21;
  edid->est_timings_2 = 0x08;
  edid->man_timings = 0x80;
  append(edid->std_timings, std_timing_t{1280, 2, 60});
  append(edid->std_timings, std_timing_t{1920, 3, 75});
  set_text(edid->monitor_name, "TEST MONITOR");
  set_text(edid->serial_string, "SN 0815");
  set_range_limits(edid);
}

void fill_extension(edid_t *edid) {
  edid->underscan = 1;
  append_video(edid, 16, 0x07, 1);
  append_video(edid, 4, 0x02);
  append_video(edid, 34, 0x88);
  append_video(edid, 5, 0x00, 1);
  append(edid->audio_list, short_audio_desc_t{1, 8, 0x7F, 7, 0, 0, 0});
  append(edid->audio_list, short_audio_desc_t{2, 6, 0x07, 0, 640, 0, 0});
  append(edid->audio_list, short_audio_desc_t{10, 8, 0x06, 0, 0, 3, 0});
  append(edid->audio_list, short_audio_desc_t{14, 2, 0x04, 0, 0, 0, 5});
  append(edid->audio_list, short_audio_desc_t{18, 6, 0x06, 0, 0, 0, 0});
  edid->speaker[0] = 0x4F;
  const u8 address[] = {2, 1, 4, 15};
  std::memcpy(edid->physical_address, address, 4);
  edid->dc_36bit = 1;
  edid->dc_y444 = 1;
  edid->max_tmds_clock = 225;
  edid->supports_ai = 1;
  edid->cnc1 = 1;
  edid->cnc3 = 1;
  edid->hdmi_video_present = 1;
  edid->video_latency = 20;
  edid->audio_latency = 40;
  edid->i_video_latency = 60;
  edid->i_audio_latency = 500;
  edid->hdmi_3d_present = 1;
  edid->image_size = 2;
  edid->hdmi_vic_len = 3;
  edid->hdmi_vic[0] = 3;
  edid->hdmi_vic[1] = 1;
  edid->hdmi_vic[2] = 4;
  edid->xvycc601 = 1;
  edid->xvycc709 = 1;
}

// What decoding adds to an encoded record: what the encoder fixes, and the extension's own timing.
fields_t additions_to(const bytes_t &bytes) {
  return together({{"valid", "1"},
                   {"digital", "1"},
                   {"extension_count", "1"},
                   {"checksum", std::to_string(bytes[127])},
                   {"basic_audio", "1"},
                   {"ycbcr_444", "1"},
                   {"ycbcr_422", "1"},
                   {"hdmi_present", "1"}},
                  prefixed("dtd_list[2].", fields_of(test_support::timing_of_vic(1))));
}

}  // namespace

TEST(RoundTrip, GivesARichRecordBack) {
  minimal_record_t record;
  fill_base_block(record.get());
  fill_extension(record.get());
  const fields_t before = fields_of(*record.get());
  const bytes_t bytes = encoded(record.get(), 1);
  scoped_edid_t again;
  decode(bytes, again.get());
  EXPECT_EQ(difference(before, fields_of(*again.get())), additions_to(bytes));
}

TEST(RoundTrip, GivesTheSameBytesTwice) {
  minimal_record_t record;
  fill_base_block(record.get());
  fill_extension(record.get());
  const bytes_t bytes = encoded(record.get(), 1);
  scoped_edid_t again;
  decode(bytes, again.get());
  ASSERT_TRUE(ll_delete_entry_at(&again->dtd_list, 2));
  EXPECT_EQ(encoded(again.get(), 1), bytes);
}

TEST(RoundTrip, LosesTheMandatory3dStructuresOfARecord) {
  minimal_record_t record;
  fill_base_block(record.get());
  record->hdmi_video_present = 1;
  record->hdmi_3d_present = 1;
  append_video(record.get(), 32, 0x07);
  append_video(record.get(), 20, 0x06);
  scoped_edid_t again;
  decode(encoded(record.get()), again.get());
  EXPECT_EQ(test_support::modes_of(again->video_list),
            (std::vector<test_support::mode_pair_t>{{32, 0x02}, {20, 0x04}}));
}

TEST(RoundTrip, KeepsEveryPairOfStructuresAndPositions) {
  for (u32 mask = 0; mask < 256; ++mask) {
    minimal_record_t record;
    fill_base_block(record.get());
    record->hdmi_video_present = 1;
    record->hdmi_3d_present = 1;
    append_video(record.get(), 33);
    append_video(record.get(), 16, mask);
    append_video(record.get(), 31, 255 - mask);
    scoped_edid_t again;
    decode(encoded(record.get()), again.get());
    EXPECT_EQ(test_support::modes_of(again->video_list),
              (std::vector<test_support::mode_pair_t>{{33, 0}, {16, mask}, {31, 255 - mask}}));
  }
}

TEST(RoundTrip, KeepsEachVicsTiming) {
  for (u32 vic = 1; vic <= 64; ++vic) {
    SCOPED_TRACE(vic);
    minimal_record_t record;
    fill_base_block(record.get());
    element_at<detailed_timing_t>(record->dtd_list, 0) = test_support::timing_of_vic(vic);
    scoped_edid_t again;
    decode(encoded(record.get()), again.get());
    detailed_timing_t expected = test_support::timing_of_vic(vic);
    // The front porches of VICs 60 to 62 have more than the 10 bits of a descriptor.
    expected.h_sync_offset %= 1024;
    const auto timings = elements_of<detailed_timing_t>(again->dtd_list);
    ASSERT_EQ(timings.size(), 3u);
    EXPECT_EQ(fields_of(timings[0]), fields_of(expected));
  }
}

TEST(RoundTrip, ReadsCountAndChecksumOfANamelessRecordAsATiming) {
  minimal_record_t record;
  fill_base_block(record.get());
  set_text(record->monitor_name, "");
  const bytes_t bytes = encoded(record.get());
  scoped_edid_t again;
  decode(bytes, again.get());
  EXPECT_EQ(again->extension_count, 0);
  EXPECT_EQ(again->checksum, 0);
  const auto timings = elements_of<detailed_timing_t>(again->dtd_list);
  ASSERT_EQ(timings.size(), 4u);
  detailed_timing_t expected{};
  expected.valid = 1;
  expected.pixel_clock = (1u + 256u * bytes[109]) * 10000;
  expected.progressive = 1;
  EXPECT_EQ(fields_of(timings[2]), fields_of(expected));
}

TEST(RoundTrip, ReadsAFullVideoBlockOf32AsEmptyAndItsDescriptorsAsHeaders) {
  minimal_record_t record;
  fill_base_block(record.get());
  set_text(record->serial_string, "");
  for (u32 i = 0; i < 32; ++i)
    append_video(record.get(), 0);
  const encoding_t encoding = encode(record.get());
  ASSERT_EQ(encoding.result, 1);
  scoped_edid_t again;
  ASSERT_EQ(decode_base_block(slice(encoding.bytes, 0, 128), again.get()), 1);
  EXPECT_EQ(decode_extension(slice(encoding.bytes, 128, 128), again.get()), 1);
  EXPECT_EQ(again->video_list.size, 0u);
  EXPECT_EQ(again->audio_list.size, 1u);
  EXPECT_EQ(again->hdmi_present, 1);
}

}  // namespace codec_test
