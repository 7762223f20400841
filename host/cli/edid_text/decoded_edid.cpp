#include "edid_text/decoded_edid.h"

#include "edid_input/edid_file.h"

namespace edid_cli {

decoded_edid_t::decoded_edid_t(const std::vector<u8> &bytes) : is_prepared_(edid_prepare(&record_) != 0) {
  if (!is_prepared_) {
    return;
  }
  is_complete_ = decode_edid_block_0(bytes.data(), &record_) != 0;
  if (is_complete_ && bytes.size() > edid_block_size) {
    const auto size = static_cast<u32>(bytes.size()) - edid_block_size;
    is_complete_ = decode_edid_extensions(bytes.data() + edid_block_size, size, &record_) != 0;
  }
}

decoded_edid_t::~decoded_edid_t() {
  if (is_prepared_) {
    edid_destroy(&record_);
  }
}

}  // namespace edid_cli
