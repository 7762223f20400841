// Everything that records and decoders say.
#include <cstring>

#include "diagnostics_walk.h"
#include "support/edid_builder.h"
#include "support/records.h"

namespace diagnostics_walk {
namespace {

using test_support::base_block_builder_t;
using test_support::bytes_t;
using test_support::data_block;
using test_support::extension_builder_t;
using test_support::scoped_edid_t;

row_t codec_error(const char *function, const char *message, std::function<void()> provoke) {
  return error("edid_decode_encode", function, message, std::move(provoke));
}

row_t codec_warning(const char *function, const char *message, std::function<void()> provoke) {
  return warning("edid_decode_encode", function, message, std::move(provoke));
}

/// Hands a prepared record over, of which one list counts as not initialised.
std::function<void()> without_list(ll_list_t edid_t::*list, void (*action)(edid_t *)) {
  return [=] {
    scoped_edid_t edid;
    u32 &magic = (edid.get()->*list).magic;
    const u32 right = magic;
    magic = 0;
    action(edid.get());
    magic = right;
  };
}

/// Hands a prepared record over, of which one list holds elements of another type.
std::function<void()> with_foreign_list(ll_list_t edid_t::*list, const std::function<void(edid_t *)> &action) {
  return [=] {
    scoped_edid_t edid;
    ll_delete_list(&(edid.get()->*list));
    ll_init(&(edid.get()->*list), "int");
    action(edid.get());
  };
}

void destroy(edid_t *edid) {
  edid_destroy(edid);
}

/// Destroys a record of which one list is corrupt, and what is left of it.
std::function<void()> destroying_corrupt(ll_list_t edid_t::*list) {
  return [=] {
    edid_t edid;
    edid_prepare(&edid);
    (edid.*list).size = 1;
    edid_destroy(&edid);
    (edid.*list).size = 0;
    for (ll_list_t *left : {&edid.std_timings, &edid.dtd_list, &edid.video_list, &edid.audio_list}) {
      if (ll_is_initialized(left)) ll_delete_list(left);
    }
  };
}

std::vector<row_t> records() {
  return {
      codec_error("edid_destroy", "List is not initialized. List:standard_timing_list.",
                  without_list(&edid_t::std_timings, destroy)),
      codec_error("edid_destroy", "List is not initialized. List:detailed_timing_list.",
                  without_list(&edid_t::dtd_list, destroy)),
      codec_error("edid_destroy", "List is not initialized. List:short_video_description_timing_list.",
                  without_list(&edid_t::video_list, destroy)),
      codec_error("edid_destroy", "List is not initialized. List:short_audio_description_timing_list.",
                  without_list(&edid_t::audio_list, destroy)),
      codec_error("edid_destroy", "Failed deleting list: standard_timing_list.",
                  destroying_corrupt(&edid_t::std_timings)),
      codec_error("edid_destroy", "Failed deleting list: detailed_timing_list.", destroying_corrupt(&edid_t::dtd_list)),
      codec_error("edid_destroy", "Failed deleting list: short_video_description_list.",
                  destroying_corrupt(&edid_t::video_list)),
      codec_error("edid_destroy", "Failed deleting list: short_audio_description_list.",
                  destroying_corrupt(&edid_t::audio_list)),
  };
}

void decode_good_base_block(edid_t *edid) {
  decode_edid_block_0(base_block_builder_t().build().data(), edid);
}

std::function<void()> decoding(const bytes_t &base_block) {
  return [=] { decode_edid_block_0(base_block.data(), scoped_edid_t().get()); };
}

bytes_t with_bad_checksum(bytes_t block) {
  block.back() ^= 0xFF;
  return block;
}

bytes_t with_tag(u8 tag) {
  bytes_t descriptor = test_support::dummy_descriptor();
  descriptor[3] = tag;
  return base_block_builder_t().descriptor(1, descriptor).build();
}

bytes_t analog_timing() {
  bytes_t descriptor = test_support::timing_descriptor(test_support::timing_of_vic(16));
  descriptor[17] = 0;
  return base_block_builder_t().descriptor(0, descriptor).build();
}

bytes_t malformed_descriptor() {
  bytes_t descriptor = test_support::dummy_descriptor();
  descriptor[2] = 0x0A;
  return base_block_builder_t().descriptor(2, descriptor).build();
}

std::vector<row_t> base_blocks() {
  const char *const decoder = "decode_edid_block_0";
  const bytes_t with_timing =
      base_block_builder_t().descriptor(0, test_support::timing_descriptor(test_support::timing_of_vic(5))).build();
  return {
      codec_error(decoder, "Function called with edid_block set to NULL.",
                  [] { decode_edid_block_0(nullptr, nullptr); }),
      codec_error(decoder, "Function called with edid set to NULL.",
                  [] { decode_edid_block_0(base_block_builder_t().build().data(), nullptr); }),
      codec_error(decoder, "standard_timing_list: List not initialized.",
                  without_list(&edid_t::std_timings, decode_good_base_block)),
      codec_error(decoder, "detailed_timing_list: List not initialized.",
                  without_list(&edid_t::dtd_list, decode_good_base_block)),
      codec_error(decoder, "short_video_description_list: List not initialized.",
                  without_list(&edid_t::video_list, decode_good_base_block)),
      codec_error(decoder, "short_audio_description_list: List not initialized.",
                  without_list(&edid_t::audio_list, decode_good_base_block)),
      codec_error(decoder, "Failed verifying the header. Expected:  ffffffffffff00 Received:  ffffffffffff01",
                  decoding(base_block_builder_t().byte(0, 1).build())),
      codec_error(decoder, "Edid failed the checksum. Calculated:0x*",
                  decoding(with_bad_checksum(base_block_builder_t().build()))),
      codec_error(decoder, "Failed EDID Version/Revision check. Expected:1.3 Recieved:1.2",
                  decoding(base_block_builder_t().byte(19, 2).build())),
      codec_warning(decoder, "EDID inappropriately set to analog. Continuing.",
                    decoding(base_block_builder_t().byte(20, 0).build())),
      codec_error("_decode_edid_dtd",
                  "Malformed DTD: The DTD's pixel clock is 0 indicating that the byte 0x2 and byte 0x4 should be zero, "
                  "but they are not. Byte2:0x0A Byte4:0x00",
                  decoding(malformed_descriptor())),
      codec_error(decoder, "Failed decoding #2 DTD. 0x0 0x0 0xa 0x10 *", decoding(malformed_descriptor())),
      codec_warning("_decode_edid_dtd", "Additional monitor color point specified. Ignoring.",
                    decoding(with_tag(0xFB))),
      codec_warning("_decode_edid_dtd", "Additional standard timings specified. Ignoring.", decoding(with_tag(0xFA))),
      codec_warning("_decode_edid_dtd", "Unknown data tag within DTD timing. Ignoring. tag=0x5", decoding(with_tag(5))),
      trace("_decode_edid_dtd", "Detailed timing is not set to digital. Val:0x0 Continuing.",
            decoding(analog_timing())),
      trace("_decode_edid_dtd", "Added DTD: WxH=1920x540i pixel:74250000", decoding(with_timing)),
      codec_error(
          "_decode_edid_dtd", "Failed adding entry to the back.",
          with_foreign_list(&edid_t::dtd_list, [=](edid_t *edid) { decode_edid_block_0(with_timing.data(), edid); })),
      codec_error("_decode_edid_standard_timing", "Failed adding entry to the back of the list.",
                  with_foreign_list(&edid_t::std_timings,
                                    [](edid_t *edid) {
                                      decode_edid_block_0(
                                          base_block_builder_t().standard_timing(0, 0x81, 0x80).build().data(), edid);
                                    })),
      codec_error(decoder, "Failed decoding #8 standard timing. Val1:0x81 Val2:0x80",
                  with_foreign_list(&edid_t::std_timings,
                                    [](edid_t *edid) {
                                      decode_edid_block_0(
                                          base_block_builder_t().standard_timing(7, 0x81, 0x80).build().data(), edid);
                                    })),
  };
}

std::function<void()> decoding_extension(const bytes_t &extension) {
  return [=] { decode_edid_extensions(extension.data(), static_cast<u32>(extension.size()), scoped_edid_t().get()); };
}

std::function<void()> decoding_block(const bytes_t &block) {
  return decoding_extension(extension_builder_t().block(block).build());
}

/// A block of one video descriptor, and a vendor block with HDMI video behind it.
std::function<void()> decoding_3d(const bytes_t &payload_behind_length) {
  const bytes_t header{0x10, 0x00, 0x00, 0x00, 0x20, 0x80, static_cast<u8>(payload_behind_length.size())};
  const bytes_t payload = test_support::join(header, payload_behind_length);
  return decoding_extension(
      extension_builder_t().block(test_support::video_block({16})).block(test_support::hdmi_block(payload)).build());
}

std::vector<row_t> extensions() {
  const char *const decoder = "decode_edid_extensions";
  const bytes_t good = extension_builder_t().build();
  return {
      codec_error(decoder, "Function called with edid_extension set to NULL.",
                  [] { decode_edid_extensions(nullptr, 128, nullptr); }),
      codec_error(decoder, "Function called with edid set to NULL.",
                  [=] { decode_edid_extensions(good.data(), 128, nullptr); }),
      codec_error(decoder, "The extension is not a CEA extension. Expected=0x2 Received=0xF0",
                  decoding_extension(extension_builder_t().byte(0, 0xF0).build())),
      codec_error(decoder, "Extension is the wrong version. Expected=0x3 Received=0x1",
                  decoding_extension(extension_builder_t().byte(1, 1).build())),
      codec_error(decoder, "Edid failed the checksum. Calculated:0x*", decoding_extension(with_bad_checksum(good))),
      codec_error(decoder, "EDID DTD offset value is larger than the block. Offset:111\n",
                  decoding_extension(extension_builder_t().byte(2, 111).build())),
      codec_error(
          decoder,
          "Malformed EDID: The CEA extension data block specifies a tag with a length whose total bytes exceeds "
          "the length of the CEA extension's data block. Tag:2 Len:2 Current Byte:0 Data Block Len:2",
          decoding_extension(extension_builder_t().block({0x42, 0x10}).build())),
      codec_warning(decoder, "Speaker allocation block is longer than expected. Expected=3 Actual=2 Continuing...",
                    decoding_block(data_block(4, {0, 0}))),
      codec_warning(decoder, "Failed to decode audio format. Index:0 byte3:0x01 byte2:0x02 byte1:0x03",
                    decoding_block(test_support::audio_block({1, 2, 3}))),
      codec_error("decode_edid_short_audio", "Unrecognized audio type found in audio format. Expected:1-15 Received:0",
                  decoding_block(test_support::audio_block({1, 2, 3}))),
      codec_error("decode_edid_short_audio", "Function called with \"audio\" parameter set to NULL. audio=(nil)",
                  [] { decode_edid_short_audio(9, 7, 5, nullptr); }),
      codec_error(decoder, "Failed adding entry to the back of the list.",
                  with_foreign_list(
                      &edid_t::audio_list,
                      [](edid_t *edid) {
                        const bytes_t block = extension_builder_t().block(test_support::audio_block({9, 7, 5})).build();
                        decode_edid_extensions(block.data(), 128, edid);
                      })),
      codec_error(decoder, "Failed adding entry to the back.",
                  with_foreign_list(&edid_t::video_list,
                                    [](edid_t *edid) {
                                      const bytes_t block =
                                          extension_builder_t().block(test_support::video_block({16})).build();
                                      decode_edid_extensions(block.data(), 128, edid);
                                    })),
      trace(decoder, "Reserved code. Len=1", decoding_block(data_block(0, {0}))),
      trace(decoder, "Audio Data Block. Len=3", decoding_block(test_support::audio_block({9, 7, 5}))),
      trace(decoder, "Video Data Block. Len=1", decoding_block(test_support::video_block({16}))),
      trace(decoder, "Vendor Specific Data Block. Len=5", decoding_block(test_support::hdmi_block({0x10, 0}))),
      trace(decoder, "Speaker Allocation Data Block. Len=3", decoding_block(data_block(4, {1, 0, 0}))),
      trace(decoder, "VESA DTC Data Block. Ignoring. Len=2", decoding_block(data_block(5, {0, 0}))),
      trace(decoder, "Reserved Code:6. Ignoring. Len=0", decoding_block(data_block(6, {}))),
      trace(decoder, "Extended Data block. Ignoring. ExtTag:0x0 Len=2", decoding_block(data_block(7, {0, 0xCF}))),
  };
}

std::vector<row_t> vendor_blocks() {
  const char *const decoder = "_decode_edid_vendor_block";
  return {
      codec_error(decoder,
                  "Failed decoding the vendor block. Length not long enough to contain the vendor's id. Length=2",
                  decoding_block(data_block(3, {3, 0x0C}))),
      codec_error(decoder,
                  "Failed decoding the hdmi block. The length is required to be at least 5 bytes long. Length=4",
                  decoding_block(data_block(3, {3, 0x0C, 0, 0x10}))),
      trace(decoder, "Unrecognized vendor block. Ignoring. Vendor=0xC45DD8",
            decoding_block(data_block(3, {0xD8, 0x5D, 0xC4, 0, 0}))),
      trace(decoder, " start parsing 3D and 4Kx2K stuff true", decoding_3d({})),
      trace(decoder, " 3D_present 1", decoding_3d({})),
      trace(decoder, " 3D_multi_present 0", decoding_3d({})),
      trace(decoder, " image_size 0", decoding_3d({})),
      trace(decoder, " 3D_len 1", decoding_3d({0x00})),
      trace(decoder, " 4k_2k_vic_len 0", decoding_3d({})),
      codec_warning(decoder, "Index out of range. index:2 Len:1", decoding_3d({0x20})),
      codec_error(decoder,
                  "The Vendor Specific Data Block (VSDB) 3D description references an index (1) that doesn't exist. "
                  "Continuing. List len:1",
                  decoding_3d({0x10})),
      codec_error(decoder, "It should not arrive here.", decoding_3d({0x07})),
  };
}

WALK(Records, records());
WALK(BaseBlocks, base_blocks());
WALK(Extensions, extensions());
WALK(VendorBlocks, vendor_blocks());

}  // namespace
}  // namespace diagnostics_walk
