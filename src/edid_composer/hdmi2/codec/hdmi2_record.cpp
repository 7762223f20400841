#include "edid_composer/hdmi2/codec/hdmi2_record.h"

namespace edid_composer {

bool is_record(const site_t &site, const hdmi2_t *hdmi2) {
  constexpr u32 first_size = sizeof(hdmi2_t);
  if (hdmi2 == nullptr) {
    LOG_ERROR("Function called with hdmi2 set to NULL.");
    return false;
  }
  if (hdmi2->size >= first_size) return true;
  LOG_ERROR("The size of the record is too small. Expected at least:%u Received:%u", first_size, hdmi2->size);
  return false;
}

}  // namespace edid_composer
