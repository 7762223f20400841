#include "edid_composer/hdmi2/layer_encoder.h"

#include "diagnostics.h"
#include "edid_composer/hdmi2/codec/hdmi2_blocks.h"
#include "edid_decode_encode/base_block_encoder.h"
#include "edid_decode_encode/base_block_layout.h"
#include "edid_decode_encode/cea_extension_encoder.h"
#include "edid_decode_encode/checksum.h"
#include "edid_decode_encode/descriptor.h"
#include "edid_decode_encode/descriptor_layout.h"

namespace edid_composer {
namespace {

REPORTS_AS(encode_with_hdmi2);

/// A text descriptor and nothing after it.
struct text_descriptor_t {
  u8 bytes[descriptor_size + 1] = {};
  bool has_text;

  text_descriptor_t(u8 tag, const char *text) : has_text(_encode_string(bytes, tag, text)) {}
};

bool encode_base(const edid_t &edid, u8 *block) {
  constexpr u8 dummy[descriptor_size] = {0, 0, 0, display_descriptor::dummy};
  constexpr u8 one_extension = 1;
  byte_writer_t writer(block, block_size);
  if (!encode_up_to_timings(edid, block, &writer)) return false;
  const text_descriptor_t name(display_descriptor::name_text, edid.monitor_name);
  writer.put(name.has_text ? name.bytes : dummy, descriptor_size);
  encode_range_limits(edid, &writer);
  block[base_block::extension_count] = one_extension;
  block[checksum_offset] = _calculate_checksum({block, block_size});
  return true;
}

/// False when there is one, but no room for it.
bool encode_serial_text(const char *text, byte_writer_t *extension) {
  const text_descriptor_t serial(display_descriptor::serial_text, text);
  if (!serial.has_text) return true;
  if (extension->position() + descriptor_size > checksum_offset) {
    LOG_WARNING("Leaving out the serial number text for lack of room. Bytes missing:%u",
                extension->position() + descriptor_size - checksum_offset);
    return false;
  }
  extension->put(serial.bytes, descriptor_size);
  return true;
}

bool encode_extension(edid_t *edid, bool native_bit, const hdmi2_t &blocks, u8 *extension, encoding_t *encoding) {
  byte_writer_t writer(extension, block_size);
  if (!encode_up_to_hdmi_block(edid, native_bit, &writer, encoding)) return false;
  write_hdmi2_blocks(blocks, &writer);
  writer.put_at(cea_extension::timings_offset, low_byte(writer.position()));
  encode_extension_timing(&writer);
  encoding->text_left_out = !encode_serial_text(edid->serial_string, &writer);
  encode_extension_flags(*edid, &writer);
  encoding->extension_bytes = writer.position();
  writer.put_at(checksum_offset, _calculate_checksum({extension, block_size}));
  return true;
}

}  // namespace

encoding_t encode_with_hdmi2(u8 *edid_blocks, i32 size, edid_t *edid, const hdmi2_t &blocks,
                             const platform_values_t &values) {
  encoding_t encoding;
  encoding.complete = clear_for_encoding(edid_blocks, size, edid, &values) && encode_base(*edid, edid_blocks) &&
                      encode_extension(edid, values.native_bit != 0, blocks, edid_blocks + block_size, &encoding);
  return encoding;
}

}  // namespace edid_composer
