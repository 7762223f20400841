// The extensions of an EDID that are read for HDMI 2: announced by the base block, there, and CTA-861 extensions of
// revision 3 with a right checksum. Others are passed over.
#pragma once

#include "bytes.h"

namespace edid_composer {

/// Goes through the extensions of a whole EDID:
///
///   cta_extensions_t extensions(edid);
///   while (extensions.next()) read(*extensions);
class cta_extensions_t {
 public:
  explicit cta_extensions_t(const byte_view_t &edid);

  /// Moves to the next extension that is read. False at the end, and after the eighth.
  bool next();

  /// The 128 bytes of the extension.
  byte_view_t operator*() const;
  /// Its number among the blocks of the EDID; the base block is 0.
  u32 block() const { return block_; }

 private:
  byte_view_t edid_;
  u32 last_block_;
  u32 block_ = 0;
  u32 count_ = 0;
};

/// Number of the first such extension among the blocks of @p edid; 0: there is none.
u32 first_cta_extension(const byte_view_t &edid);

}  // namespace edid_composer
