// The bytes of the new EDID on the page, as HTML.
#pragma once

#include <span>
#include <string>
#include <vector>

#include "explain/byte_names.h"

namespace edid_cli {

std::string legend_html(const std::vector<byte_field_t> &fields);
/// One block's bytes, each leading to its field's row.
std::string bytes_html(std::span<const u8> edid, const std::vector<byte_field_t> &fields, std::size_t begin);
std::string fields_html(std::span<const u8> edid, const std::vector<byte_field_t> &fields);

}  // namespace edid_cli
