// The video part of the HDMI vendor-specific data block: 4Kx2K codes and 3D structures.
#include "vendor_block_decoding.h"

namespace codec_test {
namespace {

using test_support::hdmi_block;
using test_support::mode_pair_t;

constexpr const char *function = "_decode_edid_vendor_block";

// An HDMI block without latencies, with @p video from byte 9 on.
bytes_t video_part(const bytes_t &video) {
  return hdmi_block(test_support::join({0x00, 0x00, 0x00, 0x00, 0x20}, video));
}

std::vector<u32> codes_of(const edid_t &edid) {
  return std::vector<u32>(edid.hdmi_vic, edid.hdmi_vic + 7);
}

// A record with this many video entries.
void fill(edid_t *edid, u32 entries) {
  for (u32 i = 0; i < entries; ++i)
    append_video(edid, 16 + i);
}

// The 3D masks of a record with @p entries video entries after decoding, and what was printed on the way.
struct outcome_t {
  std::vector<u32> masks;
  std::string output;
};

outcome_t outcome_of(u32 entries, const bytes_t &video) {
  scoped_edid_t edid;
  fill(edid.get(), entries);
  outcome_t outcome;
  outcome.output = output_of([&] { EXPECT_TRUE(decode_vendor_block(video_part(video), edid.get())); });
  u32 vic = 16;
  for (const mode_pair_t &mode : test_support::modes_of(edid->video_list)) {
    EXPECT_EQ(mode.first, vic++);
    outcome.masks.push_back(mode.second);
  }
  return outcome;
}

using masks_t = std::vector<u32>;

std::string doubtful_index(u32 index, u32 size) {
  return test_support::error_line("linked_list", "ll_entry_at",
                                  "Index Out of Range: Requesting a value outside the range of the list. Index:" +
                                      std::to_string(index) + " Size:" + std::to_string(size)) +
         codec_error(function, "The Vendor Specific Data Block (VSDB) 3D description references an index (" +
                                   std::to_string(index) +
                                   ") that doesn't exist. Continuing. List len:" + std::to_string(size));
}

std::string index_out_of_range(u32 index, u32 size) {
  return codec_warning(function, "Index out of range. index:" + std::to_string(index) + " Len:" + std::to_string(size));
}

}  // namespace

TEST(HdmiVideoDecoder, DecodesTheFlagsAndTracesAllOfThem) {
  const struct {
    u8 flags;
    const char *present;
    const char *multi;
    const char *image_size;
  } cases[] = {{0x00, "0", "0", "0"}, {0x80, "1", "0", "0"}, {0x20, "0", "1", "0"}, {0x40, "0", "2", "0"},
               {0x08, "0", "0", "1"}, {0x10, "0", "0", "2"}, {0x07, "0", "0", "0"}, {0xFF, "1", "3", "3"}};
  for (const auto &each : cases) {
    SCOPED_TRACE(u32{each.flags});
    scoped_edid_t edid;
    EXPECT_EQ(traced_output_of([&] {
                EXPECT_TRUE(decode_vendor_block(video_part({each.flags, 0x00}), edid.get()));
              }),
              trace_line(function, " start parsing 3D and 4Kx2K stuff true") +
                  trace_line(function, std::string(" 3D_present ") + each.present) +
                  trace_line(function, std::string(" 3D_multi_present ") + each.multi) +
                  trace_line(function, std::string(" image_size ") + each.image_size) +
                  trace_line(function, " 3D_len 0") + trace_line(function, " 4k_2k_vic_len 0"));
    EXPECT_EQ(u32{edid->hdmi_3d_present}, each.present[0] == '1' ? 1u : 0u);
    EXPECT_EQ(std::to_string(edid->image_size), each.image_size);
  }
}

TEST(HdmiVideoDecoder, DecodesTheLengthsOfBothParts) {
  for (u32 vics = 0; vics < 8; ++vics) {
    for (const u32 structures : {0u, 1u, 2u, 4u, 8u, 16u, 31u}) {
      SCOPED_TRACE(std::to_string(vics) + " and " + std::to_string(structures));
      scoped_edid_t edid;
      // The codes lie after the block.
      const bytes_t block =
          test_support::join(video_part({0x00, byte_of(vics << 5 | structures)}), {1, 2, 3, 4, 5, 6, 7});
      EXPECT_EQ(traced_output_of([&] { EXPECT_TRUE(decode_vendor_block(block, edid.get())); }),
                trace_line(function, " start parsing 3D and 4Kx2K stuff true") + trace_line(function, " 3D_present 0") +
                    trace_line(function, " 3D_multi_present 0") + trace_line(function, " image_size 0") +
                    trace_line(function, " 3D_len " + std::to_string(structures)) +
                    trace_line(function, " 4k_2k_vic_len " + std::to_string(vics)));
      EXPECT_EQ(edid->hdmi_vic_len, vics);
      std::vector<u32> expected(7, 0);
      for (u32 i = 0; i < vics; ++i)
        expected[i] = i + 1;
      EXPECT_EQ(codes_of(*edid.get()), expected);
    }
  }
}

TEST(HdmiVideoDecoder, DropsTheTopBitOfTheCodes) {
  scoped_edid_t edid;
  EXPECT_TRUE(decode_vendor_block(video_part({0x00, 0x60, 0x81, 0x7F, 0xFF}), edid.get()));
  EXPECT_EQ(codes_of(*edid.get()), (std::vector<u32>{1, 127, 127, 0, 0, 0, 0}));
}

TEST(HdmiVideoDecoder, IsNotReadWithoutTheVideoFlag) {
  scoped_edid_t edid;
  EXPECT_EQ(traced_output_of([&] {
              EXPECT_TRUE(decode_vendor_block(hdmi_block({0, 0, 0, 0, 0x1F, 0x98, 0x60, 1, 2, 3}), edid.get()));
            }),
            "");
  EXPECT_EQ(edid->hdmi_3d_present, 0);
  EXPECT_EQ(edid->hdmi_vic_len, 0);
}

TEST(HdmiVideoDecoder, IsReadFromTheByteBehindTheLatencies) {
  const struct {
    u8 flags;
    bytes_t latencies;
  } cases[] = {{0x20, {}}, {0x60, {}}, {0xA0, {1, 1}}, {0xE0, {1, 1, 1, 1}}};
  for (const auto &each : cases) {
    SCOPED_TRACE(u32{each.flags});
    // As long as the length reaches the first byte of the video part, that part is read, and no sooner.
    for (u32 bytes_of_video = 0; bytes_of_video < 4; ++bytes_of_video) {
      SCOPED_TRACE(bytes_of_video);
      bytes_t payload = {0, 0, 0, 0, each.flags};
      payload.insert(payload.end(), each.latencies.begin(), each.latencies.end());
      const bytes_t video = {0x90, 0x40, 0x03, 0x04};
      payload.insert(payload.end(), video.begin(), video.begin() + bytes_of_video);
      bytes_t block = hdmi_block(payload);
      block.insert(block.end(), video.begin() + bytes_of_video, video.end());
      scoped_edid_t edid;
      EXPECT_TRUE(decode_vendor_block(block, edid.get()));
      EXPECT_EQ(edid->hdmi_video_present, 1);
      EXPECT_EQ(edid->hdmi_3d_present, bytes_of_video == 0 ? 0 : 1);
      EXPECT_EQ(edid->image_size, bytes_of_video == 0 ? 0 : 2);
      EXPECT_EQ(edid->hdmi_vic_len, bytes_of_video == 0 ? 0 : 2);
      EXPECT_EQ(codes_of(*edid.get()),
                bytes_of_video == 0 ? std::vector<u32>(7, 0) : (std::vector<u32>{3, 4, 0, 0, 0, 0, 0}));
    }
  }
}

TEST(Hdmi3dDecoder, MarksTheFirst16EntriesForMulti1) {
  const outcome_t of_20 = outcome_of(20, {0xA0, 0x02, 0x00, 0x01});
  masks_t expected(20, 0);
  std::fill_n(expected.begin(), 16, 1u);
  EXPECT_EQ(of_20.masks, expected);
  EXPECT_EQ(of_20.output, "");
  EXPECT_EQ(outcome_of(3, {0xA0, 0x02, 0x00, 0x01}).masks, (masks_t{1, 1, 1}));
  EXPECT_EQ(outcome_of(0, {0xA0, 0x02, 0x00, 0x01}).output, "");
}

TEST(Hdmi3dDecoder, MarksTheMaskedEntriesForMulti2) {
  EXPECT_EQ(outcome_of(4, {0xC0, 0x04, 0x00, 0x01, 0x00, 0x05}).masks, (masks_t{1, 0, 1, 0}));
  for (u32 bit = 0; bit < 16; ++bit) {
    SCOPED_TRACE(bit);
    masks_t expected(17, 0);
    expected[bit] = 2;
    const outcome_t outcome = outcome_of(17, {0xC0, 0x04, 0x01, 0x00, byte_of(1u << bit >> 8), byte_of(1u << bit)});
    EXPECT_EQ(outcome.masks, expected);
    EXPECT_EQ(outcome.output, "");
  }
}

TEST(Hdmi3dDecoder, TranslatesEachBitOf3dStructureAll) {
  const u32 masks[16] = {0x01, 0x08, 0x10, 0x20, 0x40, 0x80, 0x04, 0x00, 0x02, 0, 0, 0, 0, 0, 0, 0x02};
  for (u32 bit = 0; bit < 16; ++bit) {
    EXPECT_EQ(outcome_of(1, {0xA0, 0x02, byte_of(1u << bit >> 8), byte_of(1u << bit)}).masks, (masks_t{masks[bit]}))
        << bit;
  }
  EXPECT_EQ(outcome_of(1, {0xA0, 0x02, 0x01, 0x41}).masks, (masks_t{0x07}));
  EXPECT_EQ(outcome_of(1, {0xA0, 0x02, 0xFF, 0xFF}).masks, (masks_t{0xFF}));
}

TEST(Hdmi3dDecoder, ReadsNeitherAllNorMaskForMulti0And3) {
  // The four bytes are entries of 2D_VIC_order: index 0, structures 0, 1, 2 and 3.
  for (const u8 flags : {u8{0x80}, u8{0xE0}}) {
    EXPECT_EQ(outcome_of(2, {flags, 0x04, 0x00, 0x01, 0x02, 0x03}).masks, (masks_t{0x01 | 0x08 | 0x10 | 0x20, 0}));
  }
}

TEST(Hdmi3dDecoder, ReadsEntriesBehindAllAndMask) {
  EXPECT_EQ(outcome_of(3, {0xA0, 0x03, 0x00, 0x01, 0x26}).masks, (masks_t{1, 1, 5}));
  EXPECT_EQ(outcome_of(3, {0xC0, 0x05, 0x00, 0x01, 0x00, 0x02, 0x26}).masks, (masks_t{0, 1, 4}));
}

TEST(Hdmi3dDecoder, ReadsEntriesBehindTheCodes) {
  EXPECT_EQ(outcome_of(2, {0x80, 0x41, 0x01, 0x02, 0x16}).masks, (masks_t{0, 4}));
  EXPECT_EQ(outcome_of(2, {0xA0, 0x42, 0x01, 0x02, 0x00, 0x40}).masks, (masks_t{4, 4}));
}

TEST(Hdmi3dDecoder, IsNotReadWithout3dPresentOrLength) {
  EXPECT_EQ(outcome_of(2, {0x20, 0x03, 0xFF, 0xFF, 0x00}).masks, (masks_t{0, 0}));
  EXPECT_EQ(outcome_of(2, {0xA0, 0x00, 0xFF, 0xFF, 0x00}).masks, (masks_t{0, 0}));
}

TEST(Hdmi3dDecoder, ReadsAllAndMaskEvenWhenTheLengthDoesNotCoverThem) {
  EXPECT_EQ(outcome_of(2, {0xA0, 0x01, 0x00, 0x01, 0x16}).masks, (masks_t{1, 1}));
  EXPECT_EQ(outcome_of(2, {0xC0, 0x01, 0x00, 0x01, 0x00, 0x02, 0x16}).masks, (masks_t{0, 1}));
}

TEST(Hdmi3dDecoder, TranslatesEachStructureOfAnEntry) {
  const std::pair<u32, u32> structures[] = {{0, 0x01}, {1, 0x08}, {2, 0x10}, {3, 0x20},
                                            {4, 0x40}, {5, 0x80}, {6, 0x04}, {8, 0x02}};
  for (const auto &[structure, mask] : structures) {
    for (u32 index = 0; index < 16; ++index) {
      SCOPED_TRACE(std::to_string(structure) + " of " + std::to_string(index));
      masks_t expected(16, 0);
      expected[index] = mask;
      const bytes_t entry =
          structure == 8 ? bytes_t{byte_of(index << 4 | 8), 0xFF} : bytes_t{byte_of(index << 4 | structure)};
      const outcome_t outcome =
          outcome_of(16, test_support::join({0x80, byte_of(static_cast<u32>(entry.size()))}, entry));
      EXPECT_EQ(outcome.masks, expected);
      EXPECT_EQ(outcome.output, "");
    }
  }
}

TEST(Hdmi3dDecoder, AddsStructuresToThoseThatAreThere) {
  EXPECT_EQ(outcome_of(1, {0x80, 0x04, 0x00, 0x06, 0x08, 0x10}).masks, (masks_t{0x01 | 0x04 | 0x02}));
}

TEST(Hdmi3dDecoder, SkipsTheDetailByteOfSideBySideHalf) {
  EXPECT_EQ(outcome_of(3, {0x80, 0x02, 0x28, 0x10}).masks, (masks_t{0, 0, 2}));
  EXPECT_EQ(outcome_of(3, {0x80, 0x03, 0x28, 0x10, 0x06}).masks, (masks_t{4, 0, 2}));
  // A detail byte that the length leaves out ends the entries all the same.
  EXPECT_EQ(outcome_of(3, {0x80, 0x01, 0x28, 0x10}).masks, (masks_t{0, 0, 2}));
}

TEST(Hdmi3dDecoder, RefusesStructuresThatThereAreNot) {
  for (const u32 structure : {7u, 9u, 10u, 11u, 12u, 13u, 14u, 15u}) {
    SCOPED_TRACE(structure);
    const outcome_t outcome = outcome_of(2, {0x80, 0x02, byte_of(structure), 0x16});
    EXPECT_EQ(outcome.output, codec_error(function, "It should not arrive here."));
    EXPECT_EQ(outcome.masks, (masks_t{0, 4}));
  }
}

TEST(Hdmi3dDecoder, WarnsOfAnIndexBehindTheListAndSkipsTheWholeEntry) {
  const outcome_t outcome = outcome_of(2, {0x80, 0x04, 0x36, 0xF8, 0x10, 0x16});
  EXPECT_EQ(outcome.output, index_out_of_range(3, 2) + index_out_of_range(15, 2));
  EXPECT_EQ(outcome.masks, (masks_t{0, 4}));
}

TEST(Hdmi3dDecoder, ReportsAnIndexJustBehindTheListAndReadsItsDetailByteAsAnEntry) {
  const outcome_t outcome = outcome_of(2, {0x80, 0x03, 0x26, 0x28, 0x10});
  EXPECT_EQ(outcome.output, doubtful_index(2, 2) + doubtful_index(2, 2));
  EXPECT_EQ(outcome.masks, (masks_t{0, 1}));
}

TEST(Hdmi3dDecoder, ReportsEveryIndexOfABlockBeforeTheVideoBlock) {
  const outcome_t outcome = outcome_of(0, {0xA0, 0x05, 0xFF, 0xFF, 0x00, 0x16, 0x0F});
  EXPECT_EQ(outcome.output, doubtful_index(0, 0) + index_out_of_range(1, 0) + doubtful_index(0, 0));

  scoped_edid_t edid;
  const bytes_t collection = all_of({video_part({0xA0, 0x02, 0x00, 0x01}), test_support::video_block({4})});
  EXPECT_EQ(output_of([&] { EXPECT_EQ(decode_extension(extension_of(collection), edid.get()), 1); }), "");
  EXPECT_EQ(test_support::modes_of(edid->video_list), (std::vector<mode_pair_t>{{4, 0}}));
}

TEST(Hdmi3dDecoder, IsBoundedByIts3dLengthAloneNotByTheBlock) {
  // The block ends with its length byte; the entries are taken from the speaker block after it.
  scoped_edid_t edid;
  const bytes_t collection = all_of({test_support::video_block({4, 5, 16, 32, 34}), video_part({0x80, 0x03}),
                                     test_support::data_block(4, {0x06, 0x16, 0x00})});
  EXPECT_EQ(output_of([&] { EXPECT_EQ(decode_extension(extension_of(collection), edid.get()), 1); }),
            index_out_of_range(8, 5));
  EXPECT_EQ(test_support::modes_of(edid->video_list),
            (std::vector<mode_pair_t>{{4, 4}, {5, 4}, {16, 0}, {32, 0}, {34, 0}}));
}

TEST(Hdmi3dDecoder, ReadsMissingBytesAsFramePackingOfEntry0) {
  scoped_edid_t edid;
  fill(edid.get(), 2);
  EXPECT_EQ(output_of([&] { EXPECT_TRUE(decode_vendor_block(video_part({0x80, 0x1F}), edid.get())); }), "");
  EXPECT_EQ(test_support::modes_of(edid->video_list), (std::vector<mode_pair_t>{{16, 1}, {17, 0}}));
}

}  // namespace codec_test
