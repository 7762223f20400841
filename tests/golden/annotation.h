// What the bytes of an EDID are, told from the bytes alone: EDID 1.3, CEA-861, HDMI 1.4.
#pragma once

#include <span>
#include <string>

#include "annotated_hex.h"
#include "edid_composer.h"

namespace golden {

inline constexpr std::size_t block_size = 128;

/// The annotated text of 256 bytes: base block and CEA-861 extension.
std::string annotated(std::span<const u8> edid);

/// Each writes the bytes it is named after, from the current position on.
void annotate_base_block(annotated_hex_t &hex);
void annotate_extension(annotated_hex_t &hex);
void annotate_descriptor(annotated_hex_t &hex);
/// The bytes behind the header byte of a vendor-specific data block.
void annotate_vendor_block(annotated_hex_t &hex, std::size_t length);
void annotate_audio_block(annotated_hex_t &hex, std::size_t length);
/// The last byte of a block that begins at @p block.
void annotate_checksum(annotated_hex_t &hex, std::span<const u8> block);

}  // namespace golden
