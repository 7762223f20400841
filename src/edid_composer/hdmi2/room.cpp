#include "edid_composer/hdmi2/room.h"

#include <algorithm>

#include "diagnostics.h"
#include "edid_composer/hdmi2/passed_blocks.h"
#include "edid_composer/hdmi2/ycbcr_420_blocks.h"
#include "edid_composer/new_edid/video_descriptors.h"
#include "edid_decode_encode/cea_extension_layout.h"
#include "edid_decode_encode/hdmi_vendor_block_encoder.h"
#include "linked_list/typed_list.h"

namespace edid_composer {
namespace {

REPORTS_AS(plan_within_room);

constexpr u32 most_modes = data_block::length_mask;
constexpr auto fewest_base_modes = static_cast<u32>(fewest_modes);

/// The order in which blocks are left out.
constexpr passed_block_t blocks_by_dispensability[] = {passed_freesync, passed_hdr_dynamic, passed_hdr10plus,
                                                       passed_dolby_vision};

u32 vic_at(const ll_list_t &modes, u32 place) {
  u32 index = 0;
  for (const auto &mode : elements<const short_video_desc_t>(modes.head)) {
    if (index++ == place) return mode.vic;
  }
  return 0;
}

void drop_base_mode(const base_offer_t &base, const char *why, u32 excess, plan_t *plan) {
  --plan->base_modes;
  const u32 vic = vic_at(base.record.video_list, plan->base_modes);
  LOG_WARNING("Leaving out VIC:%u %s for lack of room. %s:%u", vic, short_video_timing_string(vic), why, excess);
}

void drop_extended_mode(mode_place_t place, const char *why, u32 excess, plan_t *plan) {
  const u32 vic = plan->extended.drop_last(place);
  LOG_WARNING("Leaving out VIC:%u %s%s for lack of room. %s:%u", vic, extended_vic_string(vic),
              place == mode_place_t::ycbcr_420_block ? " in 4:2:0" : "", why, excess);
}

void drop_3d_structures(const char *why, u32 excess, plan_t *plan) {
  plan->structures_3d = false;
  LOG_WARNING("Leaving out the 3D structures that are not mandatory for lack of room. %s:%u", why, excess);
}

/// What a data block's length field can't hold, whatever room there is.
void bound_blocks(const base_offer_t &base, plan_t *plan) {
  extended_modes_t &extended = plan->extended;
  while (extended.count_in(mode_place_t::ycbcr_420_block) > most_420_only_modes)
    drop_extended_mode(mode_place_t::ycbcr_420_block, "Modes too many for the 4:2:0 video block", 1, plan);
  constexpr const char *why = "Modes too many for the video block";
  for (u32 modes = 0; (modes = plan->base_modes + extended.count_in(mode_place_t::video_block)) > most_modes;) {
    if (plan->base_modes > fewest_base_modes) {
      drop_base_mode(base, why, modes - most_modes, plan);
    } else {
      drop_extended_mode(mode_place_t::video_block, why, modes - most_modes, plan);
    }
  }
  const u32 hdmi_length = hdmi_vendor_block_length(base.record, planned_3d_bytes(base, *plan));
  if (hdmi_length > data_block::length_mask && planned_3d_bytes(base, *plan) != 0) {
    drop_3d_structures("Bytes too many for the HDMI block", hdmi_length - data_block::length_mask, plan);
  }
}

/// Leaves out what can be spared most easily. False when nothing is left that can be.
bool leave_out(const base_offer_t &base, const offer_t &offer, plan_t *plan) {
  constexpr const char *why = "Bytes missing";
  const u32 missing = offer.data_block_end - most_data_block_end;
  for (const passed_block_t which : blocks_by_dispensability) {
    if ((offer.blocks.*passed_blocks[which].block).length == 0) continue;
    plan->passed[which] = false;
    LOG_WARNING("Leaving out the %s for lack of room. %s:%u", passed_blocks[which].name, why, missing);
    return true;
  }
  if (planned_3d_bytes(base, *plan) != 0) {
    drop_3d_structures(why, missing, plan);
  } else if (plan->base_modes > fewest_base_modes) {
    drop_base_mode(base, why, missing, plan);
  } else if (plan->extended.count_in(mode_place_t::ycbcr_420_block) != 0) {
    drop_extended_mode(mode_place_t::ycbcr_420_block, why, missing, plan);
  } else if (plan->extended.count_in(mode_place_t::video_block) != 0) {
    drop_extended_mode(mode_place_t::video_block, why, missing, plan);
  } else {
    return false;
  }
  return true;
}

}  // namespace

plan_t plan_within_room(const layer_inputs_t &inputs, const base_offer_t &base, const link_rates_t &rates,
                        const extended_modes_t &chosen, offer_t *offer) {
  plan_t plan{.base_modes = base.record.video_list.size, .extended = chosen};
  bound_blocks(base, &plan);
  make_offer(inputs, base, rates, plan, offer);
  while (offer->data_block_end > most_data_block_end && leave_out(base, *offer, &plan))
    make_offer(inputs, base, rates, plan, offer);
  return plan;
}

}  // namespace edid_composer
