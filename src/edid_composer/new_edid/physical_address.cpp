#include "edid_composer/new_edid/physical_address.h"

#include "edid_composer/new_edid/population.h"

namespace edid_composer {
namespace {

REPORTS_AS(_populate_new_edid);

physical_address_t no_address(compose_reason reason, u8 port) {
  constexpr u8 none = 0x0F;
  return {{none, none, none, none}, reason, port};
}

/// @p place names the part that the port is put into.
physical_address_t below_sink(const u8 (&sink)[4], u32 place, u8 port) {
  physical_address_t address{{sink[0], sink[1], sink[2], sink[3]}, COMPOSE_REASON_ADDRESS_BELOW_SINK, port};
  const u8(&parts)[4] = address.parts;
  address.parts[place] = port;
  for (u32 after = place + 1; after < 4; ++after)
    address.parts[after] = 0;
  LOG_TRACE("\tSetting address.%c with port:%d Address:%d.%d.%d.%d", 'a' + static_cast<char>(place), port, parts[0],
            parts[1], parts[2], parts[3]);
  return address;
}

}  // namespace

physical_address_t place_input(const inputs_t &inputs) {
  const u8(&sink)[4] = inputs.sink.physical_address;
  const auto port = static_cast<u8>((inputs.settings.port + 1) & 0xFF);
  if (inputs.platform.is_tv != 0) {
    LOG_TRACE("\tIs a TV. Using root node. Address:%d.%d.%d.%d", port, 0, 0, 0);
    return {{port, 0, 0, 0}, COMPOSE_REASON_ADDRESS_OF_ROOT, port};
  }
  if (inputs.sink.hdmi_present != 1) {
    LOG_TRACE("\tNo hdmi specific downstream EDID available. Setting SPA to f.f.f.f");
    return no_address(COMPOSE_REASON_ADDRESS_WITHOUT_SINK, port);
  }
  if (sink[0] == 0) {
    LOG_TRACE("\tInvalid downstream EDID SPA starts with 0. Recieved:%d.%d.%d.%d", sink[0], sink[1], sink[2], sink[3]);
    return no_address(COMPOSE_REASON_ADDRESS_OF_SINK_INVALID, port);
  }
  for (u32 place = 1; place < 4; ++place) {
    if (sink[place] == 0) return below_sink(sink, place, port);
  }
  LOG_TRACE("\tInvalid downstream EDID SPA starts with no room. Recieved: %d.%d.%d.%d", sink[0], sink[1], sink[2],
            sink[3]);
  return no_address(COMPOSE_REASON_ADDRESS_WITHOUT_PLACE, port);
}

}  // namespace edid_composer
