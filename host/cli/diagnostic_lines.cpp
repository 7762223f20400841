#include "diagnostic_lines.h"

#include <algorithm>
#include <iterator>

namespace edid_cli {
namespace {

constexpr std::string_view modules[] = {"edid_composer:", "edid_decode_encode:", "utility:", "linked_list:"};
constexpr std::string_view kinds[] = {"ERROR", "WARNING", "BUG"};

}  // namespace

std::optional<diagnostic_t> parse_diagnostic(std::string_view line) {
  const auto *const module = std::find_if(std::begin(modules), std::end(modules),
                                          [line](std::string_view prefix) { return line.starts_with(prefix); });
  if (module == std::end(modules)) {
    return std::nullopt;
  }
  std::string_view rest = line.substr(module->size());
  rest.remove_prefix(std::min(rest.find_first_not_of("0123456789"), rest.size()));
  const std::size_t name_end = rest.find("() ");
  if (!rest.starts_with(':') || name_end == std::string_view::npos) {
    return std::nullopt;
  }
  diagnostic_t diagnostic;
  diagnostic.function = rest.substr(1, name_end - 1);
  rest.remove_prefix(name_end + 3);
  for (const std::string_view kind : kinds) {
    if (rest.starts_with(kind) && rest.substr(kind.size()).starts_with(": ")) {
      diagnostic.kind = kind;
      diagnostic.message = rest.substr(kind.size() + 2);
      return diagnostic;
    }
  }
  return std::nullopt;
}

}  // namespace edid_cli
