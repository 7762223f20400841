// A plain reader of CEA-861 extensions, to look into EDIDs without the library's own decoder.
#pragma once

#include <optional>
#include <string>
#include <vector>

#include "edid_composer.h"

namespace end_to_end {

/// A data block of the extension.
struct data_block_t {
  u8 tag = 0;
  std::size_t offset = 0;  ///< Of its header byte, in the EDID.
  std::vector<u8> payload;
};

/// The data blocks of the extension of an EDID of 256 bytes, in order; those of a shorter one are none.
std::vector<data_block_t> data_blocks_of(const std::vector<u8> &edid);

/// The HDMI vendor-specific data block (HDMI 1.4a, section 8.3.2).
std::optional<data_block_t> hdmi_block_of(const std::vector<u8> &edid);

/// The VICs of the video data blocks (CEA-861, section 7.5.1), without their native bits.
std::vector<u8> vics_of(const std::vector<u8> &edid);

/// The VICs of the detailed timings in both blocks: those that agree with CEA-861 in pixel clock, raster, scan and
/// exact picture shape.
std::vector<u8> timing_vics_of(const std::vector<u8> &edid);

/// The text of the descriptor with this tag (EDID 1.3, section 3.10.3); empty when there is none.
std::string text_of(const std::vector<u8> &edid, u8 tag);

}  // namespace end_to_end
