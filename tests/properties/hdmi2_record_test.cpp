// A record of HDMI 2 comes back from the data blocks that it is encoded as, and any bytes are read as a record that
// does.
#include <gtest/gtest.h>

#include <algorithm>
#include <cstring>
#include <iterator>

#include "property_runs.h"
#include "support/edid_builder.h"
#include "support/output_capture.h"

namespace properties {
namespace {

using test_support::bytes_t;

constexpr u32 block_size = 128;
constexpr std::size_t collection_size = 123;

hdmi2_t empty_record() {
  hdmi2_t record;
  std::memset(&record, 0, sizeof record);
  record.size = sizeof record;
  return record;
}

void fill_bytes(random_source_t &random, u8 *bytes, u32 count) {
  std::generate_n(bytes, count, [&] { return random.byte(); });
}

void fill_forum(random_source_t &random, hdmi2_t *record) {
  record->forum_present = 1;
  record->forum_version = random.byte();
  record->max_tmds_rate = 5 * random.byte();
  for (u8 hdmi2_t::*flag : {&hdmi2_t::scdc, &hdmi2_t::read_request, &hdmi2_t::scramble_low, &hdmi2_t::uhd_vic,
                            &hdmi2_t::dc_48bit_420, &hdmi2_t::dc_36bit_420, &hdmi2_t::dc_30bit_420}) {
    record->*flag = random.flag();
  }
  record->frl_rate = static_cast<u8>(random.between(0, 15));
  record->vrr_present = random.flag();
  record->allm_present = record->vrr_present | random.flag();
  if (record->allm_present != 0) record->allm = random.flag();
  if (record->vrr_present == 0) return;
  record->vrr_min = static_cast<u8>(random.between(0, 63));
  record->vrr_max = random.between(0, 1023);
}

void fill_picture(random_source_t &random, hdmi2_t *record) {
  record->video_capability_present = random.flag();
  if (record->video_capability_present != 0) {
    record->ycc_quantization = random.flag();
    record->rgb_quantization = random.flag();
    for (u8 hdmi2_t::*scan : {&hdmi2_t::preferred_scan, &hdmi2_t::it_scan, &hdmi2_t::ce_scan})
      record->*scan = static_cast<u8>(random.between(0, 3));
  }
  record->colorimetry_present = random.flag();
  if (record->colorimetry_present != 0) {
    record->colorimetry = random.byte();
    record->gamut_metadata = random.byte();
  }
  record->hdr_static_present = random.flag();
  if (record->hdr_static_present != 0) {
    record->eotfs = random.byte();
    record->metadata_types = random.byte();
    record->luminance_count = static_cast<u8>(random.between(0, 3));
    fill_bytes(random, record->luminance, record->luminance_count);
  }
}

void fill_modes(random_source_t &random, hdmi2_t *record) {
  record->svd_count = random.between(0, random.chance(70) ? 31 : HDMI2_MOST_SVDS);
  fill_bytes(random, record->svds, record->svd_count);
  record->y420_count = static_cast<u8>(random.chance(50) ? random.between(0, 30) : 0);
  fill_bytes(random, record->y420_vics, record->y420_count);
  record->y420_map_present = random.flag();
  if (record->y420_map_present == 0) return;
  record->y420_map_bytes = static_cast<u8>(random.between(0, 30));
  for (u32 bit = 0; bit < std::min(record->svd_count, 8U * record->y420_map_bytes); ++bit)
    record->y420_map[bit / 8] = static_cast<u8>(record->y420_map[bit / 8] | random.flag() << bit % 8);
}

void fill_passed_on(random_source_t &random, hdmi2_t *record) {
  struct row_t {
    hdmi2_block_t hdmi2_t::*member;
    u32 least;
    bytes_t identifier;
  };
  const row_t rows[] = {{&hdmi2_t::hdr_dynamic, 4, {0x07}},
                        {&hdmi2_t::hdr10plus, 5, {0x01, 0x8B, 0x84, 0x90}},
                        {&hdmi2_t::dolby_vision, 9, {0x01, 0x46, 0xD0, 0x00}},
                        {&hdmi2_t::freesync, 8, {0x1A, 0x00, 0x00}}};
  for (const row_t &row : rows) {
    if (random.chance(50)) continue;
    hdmi2_block_t &block = record->*row.member;
    block.length = static_cast<u8>(random.between(row.least, HDMI2_MOST_BLOCK_BYTES));
    fill_bytes(random, block.payload, block.length);
    std::copy(row.identifier.begin(), row.identifier.end(), block.payload);
  }
}

/// A record whose values are such as blocks can hold.
hdmi2_t random_canonical_record(random_source_t &random) {
  hdmi2_t record = empty_record();
  if (random.flag() != 0) fill_forum(random, &record);
  fill_picture(random, &record);
  fill_modes(random, &record);
  fill_passed_on(random, &record);
  return record;
}

/// Data blocks in as few extensions as hold them, after a base block.
bytes_t sink_of(const bytes_t &blocks) {
  std::vector<bytes_t> collections(1);
  for (std::size_t at = 0; at < blocks.size();) {
    const std::size_t size = 1 + (blocks[at] & 0x1FU);
    if (collections.back().size() + size > collection_size) collections.emplace_back();
    collections.back().insert(collections.back().end(), blocks.begin() + static_cast<std::ptrdiff_t>(at),
                              blocks.begin() + static_cast<std::ptrdiff_t>(at + size));
    at += size;
  }
  bytes_t edid = test_support::base_block_builder_t().extensions(static_cast<u8>(collections.size())).build();
  for (const bytes_t &collection : collections)
    edid = test_support::join(edid, test_support::extension_builder_t().block(collection).build());
  return edid;
}

bytes_t encoded(const hdmi2_t &record) {
  bytes_t blocks(2048);
  u32 used = 0;
  EXPECT_EQ(test_support::output_of(
                [&] { EXPECT_TRUE(encode_hdmi2(&record, blocks.data(), static_cast<u32>(blocks.size()), &used)); }),
            "");
  blocks.resize(used);
  return blocks;
}

hdmi2_t decoded(const bytes_t &edid, std::string *lines) {
  hdmi2_t record;
  std::memset(&record, 0xA5, sizeof record);
  record.size = sizeof record;
  *lines =
      test_support::output_of([&] { EXPECT_TRUE(decode_hdmi2(edid.data(), static_cast<u32>(edid.size()), &record)); });
  return record;
}

std::string report_of(const hdmi2_t &record) {
  return test_support::output_of([&] { EXPECT_TRUE(print_hdmi2(&record, "")); });
}

void expect_equal(const hdmi2_t &actual, const hdmi2_t &expected) {
  EXPECT_EQ(report_of(actual), report_of(expected));
  EXPECT_EQ(std::memcmp(&actual, &expected, sizeof actual), 0);
}

/// An extension of random data blocks, most of them such as are read.
bytes_t random_extension(random_source_t &random) {
  constexpr u8 extended_tags[] = {0x00, 0x01, 0x05, 0x06, 0x07, 0x0E, 0x0F, 0x79};
  const bytes_t ouis[] = {{0xD8, 0x5D, 0xC4}, {0x1A, 0x00, 0x00}, {0x8B, 0x84, 0x90}, {0x46, 0xD0, 0x00}};
  bytes_t extension = {2, 3, static_cast<u8>(random.between(4, 127)), 0};
  while (extension.size() < 127) {
    const u8 tag = static_cast<u8>(random.between(0, 9) < 3 ? 2 : random.between(0, 9) < 5 ? 7 : random.between(0, 7));
    extension.push_back(static_cast<u8>(tag << 5 | random.between(0, 15)));
    if (tag == 7) extension.push_back(extended_tags[random.between(0, 7)]);
    if (tag == 3 || (tag == 7 && extension.back() == 0x01)) {
      const bytes_t &oui = ouis[random.between(0, 3)];
      extension.insert(extension.end(), oui.begin(), oui.end());
    }
    for (u32 i = random.between(0, 10); i > 0; --i)
      extension.push_back(random.byte());
  }
  extension.resize(block_size);
  test_support::mend_checksum(extension, 0);
  return extension;
}

TEST(Hdmi2Record, ComesBackFromItsBytes) {
  u32 compared = 0;
  for_each_run(2000, [&](random_source_t &random) {
    const hdmi2_t record = random_canonical_record(random);
    std::string lines;
    // As encoded, descriptors may need more extensions than are read.
    const bytes_t edid = sink_of(encoded(record));
    const hdmi2_t back = decoded(edid, &lines);
    if (edid.size() > 9 * block_size) return;
    EXPECT_EQ(lines, "");
    expect_equal(back, record);
    ++compared;
  });
  expect_at_least(1500, compared, "records in up to eight extensions");
}

TEST(Hdmi2Record, OfAnySinkComesBackFromItsBytes) {
  u32 with_blocks = 0;
  for_each_run(2000, [&](random_source_t &random) {
    const u32 extensions = random.between(1, 3);
    bytes_t edid = test_support::base_block_builder_t().extensions(static_cast<u8>(extensions)).build();
    for (u32 i = 0; i < extensions; ++i)
      edid = test_support::join(edid, random_extension(random));
    std::string lines;
    const hdmi2_t record = decoded(edid, &lines);
    for (const std::string &line : test_support::lines_in(lines))
      EXPECT_NE(line.find("decode_hdmi2() WARNING: "), std::string::npos) << line;
    const bytes_t blocks = encoded(record);
    with_blocks += blocks.empty() ? 0 : 1;
    const hdmi2_t back = decoded(sink_of(blocks), &lines);
    EXPECT_EQ(lines, "");
    expect_equal(back, record);
  });
  expect_at_least(1000, with_blocks, "sinks with blocks");
}

}  // namespace
}  // namespace properties
