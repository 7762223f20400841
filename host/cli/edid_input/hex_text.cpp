#include "edid_input/hex_text.h"

#include <span>

#include "edid_input/c_array.h"
#include "edid_input/hex_block.h"
#include "edid_input/hex_dump.h"
#include "edid_input/hex_words.h"
#include "edid_input/registry_value.h"
#include "text/text_lines.h"

namespace edid_cli {
namespace {

bool is_any_text(std::span<const text_line_t>) {
  return true;
}

std::vector<u8> read_plain(std::span<const text_line_t> lines, const std::string &name) {
  std::vector<u8> bytes;
  for (const text_line_t &line : lines) {
    for (const std::string_view word : words_of(line.text.substr(0, line.text.find('#')))) {
      append_bytes(bytes, word, line, name);
    }
  }
  return bytes;
}

struct layout_t {
  bool (*recognises)(std::span<const text_line_t> lines);
  std::vector<u8> (*read)(std::span<const text_line_t> lines, const std::string &name);
};

/// The first that recognises a text reads it.
constexpr layout_t layouts[] = {
    {has_registry_value, read_registry_value},
    {has_c_array, read_c_array},
    {has_hex_block, read_hex_block},
    {is_hex_dump, read_hex_dump},
    {is_any_text, read_plain},
};

}  // namespace

std::vector<u8> parse_hex_text(std::string_view text, const std::string &name) {
  constexpr std::string_view byte_order_mark = "\xEF\xBB\xBF";
  if (text.starts_with(byte_order_mark)) {
    text.remove_prefix(byte_order_mark.size());
  }
  const std::vector<text_line_t> lines = lines_of(text);
  for (const layout_t &layout : layouts) {
    if (layout.recognises(lines)) {
      return layout.read(lines, name);
    }
  }
  return {};
}

}  // namespace edid_cli
