#include "edid_composer/physical_address.h"

#include "edid_composer/decisions.h"

namespace edid_composer {
namespace {

constexpr u8 no_address = 0x0F;

void set(u8 *address, u8 a, u8 b, u8 c, u8 d) {
  address[0] = a;
  address[1] = b;
  address[2] = c;
  address[3] = d;
}

i32 as_number(const u8 *address) {
  return (address[0] & 0xF) << 12 | (address[1] & 0xF) << 8 | (address[2] & 0xF) << 4 | (address[3] & 0xF);
}

void note_address(decisions_t *decisions, const u8 *address, compose_reason reason, u8 port, const u8 *sink) {
  if (decisions == nullptr) return;
  const bool has_sink = reason != COMPOSE_REASON_ADDRESS_OF_ROOT && reason != COMPOSE_REASON_ADDRESS_WITHOUT_SINK;
  const bool placed = reason == COMPOSE_REASON_ADDRESS_OF_ROOT || reason == COMPOSE_REASON_ADDRESS_BELOW_SINK;
  decisions->note(COMPOSE_SUBJECT_PHYSICAL_ADDRESS, static_cast<u32>(as_number(address)),
                  placed ? COMPOSE_VERDICT_OFFERED : COMPOSE_VERDICT_LEFT_OUT, reason,
                  reason_values(port, has_sink ? as_number(sink) : 0));
}

}  // namespace

void set_physical_address(const site_t &site, bool is_tv, const edid_t &downstream, u8 port, edid_t *new_edid,
                          decisions_t *decisions) {
  const u8 *const sink = downstream.physical_address;
  u8 *const address = new_edid->physical_address;
  set(address, no_address, no_address, no_address, no_address);
  compose_reason reason = COMPOSE_REASON_ADDRESS_BELOW_SINK;
  if (is_tv) {
    reason = COMPOSE_REASON_ADDRESS_OF_ROOT;
    set(address, port, 0, 0, 0);
    LOG_TRACE_AS(site, "\tIs a TV. Using root node. Address:%d.%d.%d.%d", address[0], address[1], address[2],
                 address[3]);
  } else if (downstream.hdmi_present != 1) {
    reason = COMPOSE_REASON_ADDRESS_WITHOUT_SINK;
    LOG_TRACE_AS(site, "\tNo hdmi specific downstream EDID available. Setting SPA to f.f.f.f");
  } else if (sink[0] == 0) {
    reason = COMPOSE_REASON_ADDRESS_OF_SINK_INVALID;
    LOG_TRACE_AS(site, "\tInvalid downstream EDID SPA starts with 0. Recieved:%d.%d.%d.%d", sink[0], sink[1], sink[2],
                 sink[3]);
  } else if (sink[1] == 0) {
    set(address, sink[0], port, 0, 0);
    LOG_TRACE_AS(site, "\tSetting address.b with port:%d Address:%d.%d.%d.%d", port, address[0], address[1], address[2],
                 address[3]);
  } else if (sink[2] == 0) {
    set(address, sink[0], sink[1], port, 0);
    LOG_TRACE_AS(site, "\tSetting address.c with port:%d Address:%d.%d.%d.%d", port, address[0], address[1], address[2],
                 address[3]);
  } else if (sink[3] == 0) {
    set(address, sink[0], sink[1], sink[2], port);
    LOG_TRACE_AS(site, "\tSetting address.d with port:%d Address:%d.%d.%d.%d", port, address[0], address[1], address[2],
                 address[3]);
  } else {
    reason = COMPOSE_REASON_ADDRESS_WITHOUT_PLACE;
    LOG_TRACE_AS(site, "\tInvalid downstream EDID SPA starts with no room. Recieved: %d.%d.%d.%d", sink[0], sink[1],
                 sink[2], sink[3]);
  }
  note_address(decisions, address, reason, port, sink);
}

}  // namespace edid_composer
