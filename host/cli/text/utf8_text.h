// Texts from outside, of any bytes, on their way into documents.
#pragma once

#include <string>
#include <string_view>

namespace edid_cli {

/// The text with the replacement character for each byte that is not part of a UTF-8 character.
std::string valid_utf8(std::string_view text);

/// The text as it stands in an HTML element or in a quoted attribute.
std::string html_text(std::string_view text);

}  // namespace edid_cli
