// The codes of short video descriptors, and the marks of the 4:2:0 capability map.
#include "edid_composer/hdmi2/codec/short_video_descriptors.h"

#include "codec_cases.h"

namespace hdmi2_test {

using edid_composer::decode_svd;
using edid_composer::is_marked_420;

TEST(ShortVideoDescriptor, HasANativeFlagUpToVic64Only) {
  for (u32 code = 0; code < 256; ++code) {
    const edid_composer::svd_t svd = decode_svd(static_cast<u8>(code));
    const bool whole = (code >= 65 && code <= 127) || code >= 193;
    EXPECT_EQ(svd.vic, whole ? code : code % 128) << code;
    EXPECT_EQ(svd.native, code >= 128 && code <= 192) << code;
    EXPECT_EQ(edid_composer::svd_vic(static_cast<u8>(code)), svd.vic);
  }
}

TEST(ShortVideoDescriptor, IsMarkedByItsBitOfTheMap) {
  hdmi2_t record = empty_record();
  record.svd_count = 12;
  record.y420_map_present = 1;
  record.y420_map_bytes = 2;
  record.y420_map[0] = 0x81;
  record.y420_map[1] = 0xFC;
  for (u32 i = 0; i < 300; ++i)
    EXPECT_EQ(is_marked_420(record, i), i == 0 || i == 7 || i == 10 || i == 11) << i;
  record.y420_map_bytes = 1;
  EXPECT_FALSE(is_marked_420(record, 10));
}

TEST(ShortVideoDescriptor, IsMarkedByAnEmptyMap) {
  hdmi2_t record = empty_record();
  record.svd_count = 300;
  EXPECT_FALSE(is_marked_420(record, 0));
  record.y420_map_present = 1;
  EXPECT_TRUE(is_marked_420(record, 0));
  EXPECT_TRUE(is_marked_420(record, 299));
  EXPECT_FALSE(is_marked_420(record, 300));
  // More bytes than there can be.
  record.y420_map_bytes = 255;
  std::memset(record.y420_map, 0xFF, sizeof record.y420_map);
  EXPECT_TRUE(is_marked_420(record, 239));
  EXPECT_FALSE(is_marked_420(record, 240));
}

}  // namespace hdmi2_test
