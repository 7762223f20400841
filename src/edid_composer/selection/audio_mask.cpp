#include "edid_composer/selection/audio_mask.h"

#include "linked_list/typed_list.h"

namespace edid_composer {

u32 _audio_type_to_audio_mask(u32 type) {
  // Type 15, the extension escape, has no bit: the types after it take the bits that follow type 14's.
  if (type >= 1 && type <= 14) return 1U << (type - 1);
  if (type >= 16 && type <= 18) return 1U << (type - 2);
  return 0;
}

u32 _create_audio_mask(const ll_list_t *list) {
  REPORTS_AS(_create_audio_mask);
  u32 mask = 0;
  for (const auto &audio : walk<const short_audio_desc_t>(LIST(list, "list")))
    mask |= _audio_type_to_audio_mask(audio.type);
  return mask;
}

namespace {

REPORTS_AS(_filter_audio_list_with_mask);

/// The formats after the first, from the last on.
void trace_backwards(const ll_list_t &formats, entry_arena_t *arena) {
  record_blocks_t<const short_audio_desc_t *> after_first(arena);
  bool is_first = true;
  for (const auto &audio : elements<const short_audio_desc_t>(formats.head)) {
    if (!is_first) static_cast<void>(after_first.add(&audio, site));
    is_first = false;
  }
  after_first.visit_backwards([](const short_audio_desc_t *audio) {
    log_trace(site, __LINE__, "\t\tFormat:");
    print_audio_structure(audio);
  });
}

}  // namespace

void _filter_audio_list_with_mask(ll_list_t *formats, u32 mask, entry_arena_t *arena, journal_t *journal) {
  LOG_TRACE("\tMask:0x%08X", mask);
  LOG_TRACE("%s() - Printing reverse formats\n", site.operation);
  if (is_tracing()) trace_backwards(*formats, arena);
  // kept: the first format is never examined.
  unlink_elements<short_audio_desc_t>(formats, 1, [&](i32 place, const short_audio_desc_t &audio) {
    const u32 bit = _audio_type_to_audio_mask(audio.type);
    if ((bit & mask) != 0) return false;
    journal->note({.subject = COMPOSE_SUBJECT_AUDIO_FORMAT,
                   .index = place,
                   .reason = bit == 0 ? COMPOSE_REASON_TYPE_WITHOUT_BIT : COMPOSE_REASON_AUDIO_MASK,
                   .values = bit == 0 ? reason_values(mask) : reason_values(mask, bit)});
    return true;
  });
}

}  // namespace edid_composer
