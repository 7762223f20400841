#include "edid_composer/physical_address.h"

namespace edid_composer {
namespace {

constexpr u8 no_address = 0x0F;

void set(u8 *address, u8 a, u8 b, u8 c, u8 d) {
  address[0] = a;
  address[1] = b;
  address[2] = c;
  address[3] = d;
}

}  // namespace

void set_physical_address(const site_t &site, bool is_tv, const edid_t &downstream, u8 port, edid_t *new_edid) {
  const u8 *const sink = downstream.physical_address;
  u8 *const address = new_edid->physical_address;
  set(address, no_address, no_address, no_address, no_address);
  if (is_tv) {
    set(address, port, 0, 0, 0);
    LOG_TRACE_AS(site, "\tIs a TV. Using root node. Address:%d.%d.%d.%d", address[0], address[1], address[2],
                 address[3]);
  } else if (downstream.hdmi_present != 1) {
    LOG_TRACE_AS(site, "\tNo hdmi specific downstream EDID available. Setting SPA to f.f.f.f");
  } else if (sink[0] == 0) {
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
    LOG_TRACE_AS(site, "\tInvalid downstream EDID SPA starts with no room. Recieved: %d.%d.%d.%d", sink[0], sink[1],
                 sink[2], sink[3]);
  }
}

}  // namespace edid_composer
