#include "edid_composer/explain/written_offer.h"

#include <algorithm>

#include "edid_decode_encode/checksum.h"
#include "edid_decode_encode/data_blocks.h"
#include "edid_decode_encode/hdmi_vendor_block_layout.h"
#include "edid_decode_encode/short_audio.h"

namespace edid_composer {
namespace {

/// Codes in the order in which they stand in the EDID.
struct codes_t {
  u8 codes[block_size];
  u32 count;

  void add(u8 code) {
    if (count < block_size) codes[count++] = code;
  }
  /// Place of a code's low bits, as a descriptor keeps them; -1 when it isn't there.
  i32 place_of(u32 code, u8 mask) const {
    const u8 *const end = codes + count;
    const u8 *const found = std::find(codes, end, static_cast<u8>(code & mask));
    return found == end ? -1 : static_cast<i32>(found - codes);
  }
};

struct written_offer_t {
  codes_t vics;
  codes_t svds;      ///< The same, as they stand.
  codes_t svds_420;  ///< Of the 4:2:0 video block.
  codes_t hdmi_vics;
  u32 audio_formats;
};

void read_hdmi_vics(const byte_view_t &block, u32 length, codes_t *vics) {
  namespace layout = hdmi_vendor_block;
  const u8 flags = block[layout::video_flags];
  const u32 video = layout::video_fields(layout::latency_fields(flags));
  if (layout::oui_of(block) != layout::hdmi_oui || length < video || (flags & layout::video_present) == 0) return;
  const u32 count = u32{block[video + 1]} >> layout::vic_length_shift;
  for (u32 i = 0; i < count; ++i)
    vics->add(block[video + 2 + i] & layout::vic_mask);
}

/// Reads without a word: what the decoders print is for the sink's EDID. The checksum is no part of a data block.
written_offer_t read_offer(const byte_view_t &extension) {
  written_offer_t offer{};
  data_blocks_t blocks(extension);
  while (blocks.next() && blocks->offset + blocks->length < checksum_offset) {
    const byte_view_t block = extension.from(blocks->offset);
    switch (blocks->tag) {
      case data_block::audio:
        offer.audio_formats += blocks->length / short_audio_size;
        break;
      case data_block::video:
        for (u32 i = 1; i <= blocks->length; ++i) {
          offer.vics.add(block[i] & short_video::vic_mask);
          offer.svds.add(block[i]);
        }
        break;
      case data_block::extended:
        if (block[1] != data_block::extended_420_video) break;
        for (u32 i = 2; i <= blocks->length; ++i)
          offer.svds_420.add(block[i]);
        break;
      case data_block::vendor_specific:
        read_hdmi_vics(block, blocks->length, &offer.hdmi_vics);
        break;
      default:
        break;
    }
  }
  return offer;
}

/// A candidate whose descriptor is at @p position, or nowhere among @p count.
void place(compose_decision_t *decision, i32 position, u32 count) {
  if (position >= 0 && position < static_cast<i32>(count)) {
    decision->position = position;
  } else {
    decide(decision, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_NO_ROOM, reason_values(count));
  }
}

/// Formats stand in the order in which they were chosen, after basic audio where that was put first.
void place_audio_formats(u32 count, decisions_t *decisions) {
  i32 position = 0;
  const auto place_those = [&](bool of_library) {
    for (compose_decision_t &decision : decisions->all()) {
      if (decision.subject != COMPOSE_SUBJECT_AUDIO_FORMAT || !is_chosen(decision)) continue;
      if ((decision.origins == COMPOSE_ORIGIN_LIBRARY) == of_library) place(&decision, position++, count);
    }
  };
  place_those(true);
  place_those(false);
}

/// A mode above VIC 64 stands in one of two blocks, by its whole code.
void place_extended_mode(const written_offer_t &offer, compose_decision_t *decision) {
  constexpr u8 whole_code = 0xFF;
  const codes_t &svds = decision->reason == COMPOSE_REASON_ONLY_IN_420 ? offer.svds_420 : offer.svds;
  place(decision, svds.place_of(decision->code, whole_code), svds.count);
}

}  // namespace

void place_candidates(const u8 *new_edid, decisions_t *decisions) {
  const written_offer_t offer = read_offer({new_edid + block_size, block_size});
  for (compose_decision_t &decision : decisions->all()) {
    if (!is_chosen(decision)) continue;
    if (decision.subject == COMPOSE_SUBJECT_VIDEO_MODE) {
      place(&decision, offer.vics.place_of(decision.code, short_video::vic_mask), offer.vics.count);
    } else if (decision.subject == COMPOSE_SUBJECT_4K_MODE) {
      place(&decision, offer.hdmi_vics.place_of(decision.code, hdmi_vendor_block::vic_mask), offer.hdmi_vics.count);
    } else if (decision.subject == COMPOSE_SUBJECT_EXTENDED_MODE) {
      place_extended_mode(offer, &decision);
    }
  }
  place_audio_formats(offer.audio_formats, decisions);
}

}  // namespace edid_composer
