#include "edid_composer/explain/value_explanation.h"

#include "edid_decode_encode/base_block_layout.h"
#include "edid_decode_encode/cea_extension_layout.h"
#include "edid_decode_encode/checksum.h"
#include "edid_decode_encode/hdmi_vendor_block_layout.h"

namespace edid_composer {
namespace {

/// @p is_declared says whether the block holds the latency's field.
void explain_latency(u32 which, const latency_t &latency, bool is_declared, decisions_t *decisions) {
  switch (latency.reason) {
    case COMPOSE_REASON_LATENCY_TOO_LONG:
      decisions->note(COMPOSE_SUBJECT_LATENCY, which, COMPOSE_VERDICT_CHANGED, latency.reason,
                      reason_values(latency.own_ms, latency.sink_ms));
      break;
    case COMPOSE_REASON_LATENCY_NONE:
      decisions->note(COMPOSE_SUBJECT_LATENCY, which, is_declared ? COMPOSE_VERDICT_OFFERED : COMPOSE_VERDICT_LEFT_OUT,
                      latency.reason);
      break;
    default: {
      const u16 declared_ms = hdmi_vendor_block::latency_ms(hdmi_vendor_block::latency_code(latency.sum_ms));
      decisions->note(COMPOSE_SUBJECT_LATENCY, which,
                      declared_ms == latency.sum_ms ? COMPOSE_VERDICT_OFFERED : COMPOSE_VERDICT_CHANGED, latency.reason,
                      reason_values(latency.own_ms, latency.sink_ms, declared_ms));
    }
  }
}

void explain_3d(const inputs_t &inputs, compose_reason reason, decisions_t *decisions) {
  const bool offered = reason == COMPOSE_REASON_3D_ALWAYS || reason == COMPOSE_REASON_3D_OF_SINK;
  decisions->note(COMPOSE_SUBJECT_3D, offered, offered ? COMPOSE_VERDICT_OFFERED : COMPOSE_VERDICT_LEFT_OUT, reason,
                  reason_values(inputs.settings.hdmi_3d_mode, inputs.sink.hdmi_3d_present != 0));
}

/// As in compose_decision_t::code: 0x1230 for 1.2.3.0.
u32 as_number(const u8 (&address)[4]) {
  return (address[0] & 0xFU) << 12 | (address[1] & 0xFU) << 8 | (address[2] & 0xFU) << 4 | (address[3] & 0xFU);
}

void explain_address(const physical_address_t &address, const edid_t &sink, decisions_t *decisions) {
  const bool of_root = address.reason == COMPOSE_REASON_ADDRESS_OF_ROOT;
  const bool has_sink = !of_root && address.reason != COMPOSE_REASON_ADDRESS_WITHOUT_SINK;
  const bool placed = of_root || address.reason == COMPOSE_REASON_ADDRESS_BELOW_SINK;
  decisions->note(COMPOSE_SUBJECT_PHYSICAL_ADDRESS, as_number(address.parts),
                  placed ? COMPOSE_VERDICT_OFFERED : COMPOSE_VERDICT_LEFT_OUT, address.reason,
                  reason_values(address.port, has_sink ? as_number(sink.physical_address) : 0));
}

void explain_depth(u32 bits, bool offered, decisions_t *decisions) {
  decisions->note(COMPOSE_SUBJECT_DEEP_COLOR, bits, offered ? COMPOSE_VERDICT_OFFERED : COMPOSE_VERDICT_LEFT_OUT,
                  COMPOSE_REASON_DEEP_COLOR_OF_PLATFORM, reason_values(offered));
}

/// The platform offers it only where the sink has it, which it hasn't.
void leave_out_depth(u32 bits, decisions_t *decisions) {
  constexpr i32 as_sink = 2;
  decisions->note(COMPOSE_SUBJECT_DEEP_COLOR, bits, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_SINK_WITHOUT,
                  reason_values(as_sink, 0));
}

void explain_deep_color(const deep_color_t &deep_color, decisions_t *decisions) {
  if (deep_color.sink_lacks_30) {
    leave_out_depth(30, decisions);
  } else {
    explain_depth(30, deep_color.bits_30, decisions);
  }
  if (deep_color.sink_lacks_36) {
    leave_out_depth(36, decisions);
  } else if (deep_color.requires_36) {
    decisions->note(COMPOSE_SUBJECT_DEEP_COLOR, 36, COMPOSE_VERDICT_CHANGED, COMPOSE_REASON_DEEP_COLOR_REQUIRED);
  } else {
    explain_depth(36, deep_color.bits_36, decisions);
  }
  decisions->note(COMPOSE_SUBJECT_DEEP_COLOR, 48, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_DEEP_COLOR_NEVER);
}

compose_verdict verdict_of_clock(const tmds_clock_t &clock, u32 declared_mhz) {
  if (declared_mhz != clock.wanted_mhz || clock.reason == COMPOSE_REASON_TMDS_LIMITED) return COMPOSE_VERDICT_CHANGED;
  return declared_mhz != 0 ? COMPOSE_VERDICT_OFFERED : COMPOSE_VERDICT_LEFT_OUT;
}

void explain_tmds_clock(const tmds_clock_t &clock, const edid_t &sink, decisions_t *decisions) {
  constexpr u32 kilohertz = 1000;
  const u32 declared_mhz = hdmi_vendor_block::declared_tmds_clock(clock.held_mhz());
  compose_reason reason = clock.reason;
  reason_values_t values = reason_values(clock.pixel_clock / kilohertz, clock.percent_of_that, sink.max_tmds_clock);
  if (clock.held_mhz() != clock.wanted_mhz) {
    reason = COMPOSE_REASON_TMDS_LARGEST;
    values = reason_values(clock.wanted_mhz, declared_mhz);
  } else if (clock.reason == COMPOSE_REASON_TMDS_OVERRIDE) {
    values = reason_values(clock.wanted_mhz, sink.max_tmds_clock);
  } else if (clock.reason >= COMPOSE_REASON_TMDS_OF_LINK) {
    values = clock.values;
  }
  decisions->note(COMPOSE_SUBJECT_TMDS_CLOCK, declared_mhz, verdict_of_clock(clock, declared_mhz), reason, values);
}

}  // namespace

void explain_values(const inputs_t &inputs, const population_t &population, const edid_t &record,
                    decisions_t *decisions) {
  const hdmi_vendor_block::latency_fields_t fields = hdmi_vendor_block::latency_fields(record);
  for (u32 which = 0; which < latency_count; ++which) {
    const bool is_interlaced = which >= 2;
    explain_latency(which, population.latencies[which], is_interlaced ? fields.interlaced : fields.progressive,
                    decisions);
  }
  explain_3d(inputs, population.reason_of_3d, decisions);
  explain_address(population.physical_address, inputs.sink, decisions);
  explain_deep_color(population.deep_color, decisions);
  explain_tmds_clock(population.tmds_clock, inputs.sink, decisions);
}

void explain_room(const encoding_t &encoding, const u8 *new_edid, decisions_t *decisions) {
  constexpr u32 there = checksum_offset;
  constexpr u32 longest = data_block::length_mask;
  compose_verdict verdict = COMPOSE_VERDICT_CHANGED;
  compose_reason reason = COMPOSE_REASON_ROOM_ENOUGH;
  if (new_edid[base_block::extension_count] == 0) {
    reason = COMPOSE_REASON_NOT_ANNOUNCED;
  } else if (encoding.longest_block > longest) {
    reason = COMPOSE_REASON_BLOCK_TOO_LONG;
  } else if (encoding.extension_bytes > there) {
    reason = COMPOSE_REASON_ROOM_EXCEEDED;
  } else {
    verdict = COMPOSE_VERDICT_OFFERED;
  }
  decisions->note(COMPOSE_SUBJECT_EXTENSION_ROOM, encoding.extension_bytes, verdict, reason,
                  reason_values(encoding.extension_bytes, there, encoding.longest_block, longest));
}

}  // namespace edid_composer
