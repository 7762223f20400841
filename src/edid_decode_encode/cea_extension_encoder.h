// Encoding of the CEA-861 extension (CEA-861, section 7.5).
#pragma once

#include "bytes.h"
#include "edid_decode_encode/encoder.h"

namespace edid_composer {

/// Writes the 128 bytes of @p extension, which hold 0, and fills @p encoding.
///
/// @param edid changed where the descriptors order it: 3D masks, extended audio types.
/// @param native_bit whether native video descriptors and the first one are marked.
/// @return false when a descriptor can't be encoded.
bool encode_cea_extension(edid_t *edid, bool native_bit, u8 *extension, encoding_t *encoding);

// Its parts, for who adds data blocks of its own.

/// Writes what stands before the colorimetry block. False when a descriptor can't be encoded.
bool encode_up_to_hdmi_block(edid_t *edid, bool native_bit, byte_writer_t *extension, encoding_t *encoding);
/// Puts the extension's detailed timing: that of VIC 1, whatever a record holds.
void encode_extension_timing(byte_writer_t *extension);
/// Writes the byte of the underscan, audio and YCbCr flags.
void encode_extension_flags(const edid_t &edid, byte_writer_t *extension);

}  // namespace edid_composer
