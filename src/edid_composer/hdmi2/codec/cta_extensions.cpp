#include "edid_composer/hdmi2/codec/cta_extensions.h"

#include <algorithm>

#include "edid_decode_encode/base_block_layout.h"
#include "edid_decode_encode/cea_extension_layout.h"
#include "edid_decode_encode/checksum.h"

namespace edid_composer {
namespace {

namespace layout = cea_extension;

constexpr u32 most_extensions = 8;
/// Data blocks may take the room up to the checksum; what comes after an offset of today's decoders is not looked at.
constexpr u32 largest_timings_offset = checksum_offset;

bool is_readable(const byte_view_t &extension) {
  return extension[layout::tag] == layout::cea_tag && extension[layout::revision] == layout::supported_revision &&
         extension[layout::timings_offset] <= largest_timings_offset &&
         _calculate_checksum(extension) == extension[checksum_offset];
}

}  // namespace

cta_extensions_t::cta_extensions_t(const byte_view_t &edid)
    : edid_(edid),
      last_block_(std::min<u32>(edid[base_block::extension_count], std::max(edid.size() / block_size, 1U) - 1)) {}

bool cta_extensions_t::next() {
  while (count_ < most_extensions && block_ < last_block_) {
    ++block_;
    if (!is_readable(**this)) continue;
    ++count_;
    return true;
  }
  return false;
}

byte_view_t cta_extensions_t::operator*() const {
  return edid_.from(block_ * block_size).first(block_size);
}

u32 first_cta_extension(const byte_view_t &edid) {
  cta_extensions_t extensions(edid);
  return extensions.next() ? extensions.block() : 0;
}

}  // namespace edid_composer
