// What somebody may have meant to write.
#pragma once

#include <optional>
#include <span>
#include <string>
#include <string_view>

namespace edid_cli {

/// The name that takes the fewest changed, missing, added or exchanged letters to come from @p written, if these are
/// few for its length. Letter case does not count.
std::optional<std::string> nearest_name(std::string_view written, std::span<const std::string> names);

}  // namespace edid_cli
