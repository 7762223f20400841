#include "text/lower_case.h"

#include <algorithm>
#include <cctype>

namespace edid_cli {

std::string lower_case(std::string_view text) {
  std::string result(text);
  std::transform(result.begin(), result.end(), result.begin(),
                 [](unsigned char character) { return static_cast<char>(std::tolower(character)); });
  return result;
}

}  // namespace edid_cli
