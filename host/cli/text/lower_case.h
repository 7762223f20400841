// Texts whose letter case does not count.
#pragma once

#include <string>
#include <string_view>

namespace edid_cli {

/// With small letters for the capitals of ASCII.
std::string lower_case(std::string_view text);

}  // namespace edid_cli
