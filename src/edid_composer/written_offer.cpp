#include "edid_composer/written_offer.h"

#include <algorithm>

#include "edid_decode_encode/cea_extension_layout.h"
#include "edid_decode_encode/checksum.h"
#include "linked_list/walk.h"

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
  codes_t hdmi_vics;
  u32 audio_formats;
};

void read_hdmi_vics(const byte_view_t &block, u32 length, codes_t *vics) {
  namespace layout = hdmi_vendor_block;
  constexpr u8 video_present = 0x20;
  if (block.little_endian_16(layout::oui) + (u32{block[layout::oui + 2]} << 16) != layout::hdmi_oui) return;
  const u8 flags = block[layout::video_flags];
  u32 video = layout::latencies;
  if ((flags & layout::latency_present) != 0) video += 2;
  if ((flags & layout::i_latency_present) != 0) video += 2;
  if (length < video || (flags & video_present) == 0) return;
  const u32 count = u32{block[video + 1]} >> layout::vic_length_shift;
  for (u32 i = 0; i < count; ++i)
    vics->add(block[video + 2 + i] & layout::vic_mask);
}

/// Reads the data blocks as every source does, without a word: what the decoders print is for the sink's EDID.
written_offer_t read_offer(const byte_view_t &extension) {
  written_offer_t offer{};
  const u32 end = std::min<u32>(extension[cea_extension::timings_offset], block_size - 1);
  for (u32 offset = cea_extension::data_blocks; offset < end;) {
    const byte_view_t block = extension.from(offset);
    const u32 length = block[0] & data_block::length_mask;
    if (offset + length >= end) break;
    switch (u32{block[0]} >> data_block::tag_shift) {
      case data_block::audio:
        offer.audio_formats += length / short_audio::size;
        break;
      case data_block::video:
        for (u32 i = 1; i <= length; ++i)
          offer.vics.add(block[i] & short_video::vic_mask);
        break;
      case data_block::vendor_specific:
        read_hdmi_vics(block, length, &offer.hdmi_vics);
        break;
      default:
        break;
    }
    offset += length + 1;
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

/// Formats stand in the order in which they were chosen, but for basic audio, which was put in front of them.
void place_audio_formats(decisions_t *decisions, u32 count) {
  i32 position = 0;
  for (const bool basic : {true, false}) {
    for (auto &decision : walk<compose_decision_t>(LIST_AS(decisions->site(), decisions->list()))) {
      if (decision.subject != COMPOSE_SUBJECT_AUDIO_FORMAT || !is_chosen(decision)) continue;
      if ((decision.origins == COMPOSE_ORIGIN_LIBRARY) == basic) place(&decision, position++, count);
    }
  }
}

}  // namespace

void settle_decisions(decisions_t *decisions, const u8 *new_edid) {
  const written_offer_t offer = read_offer({new_edid + block_size, block_size});
  for (auto &decision : walk<compose_decision_t>(LIST_AS(decisions->site(), decisions->list()))) {
    if (!is_chosen(decision)) continue;
    if (decision.subject == COMPOSE_SUBJECT_VIDEO_MODE) {
      place(&decision, offer.vics.place_of(decision.code, short_video::vic_mask), offer.vics.count);
    } else if (decision.subject == COMPOSE_SUBJECT_4K_MODE) {
      place(&decision, offer.hdmi_vics.place_of(decision.code, hdmi_vendor_block::vic_mask), offer.hdmi_vics.count);
    }
  }
  place_audio_formats(decisions, offer.audio_formats);
}

}  // namespace edid_composer
