#include "edid_input/hex_block.h"

#include <algorithm>
#include <iterator>

#include "edid_input/edid_file.h"
#include "edid_input/hex_words.h"
#include "io/bad_input.h"
#include "text/lower_case.h"

namespace edid_cli {
namespace {

/// "edid-decode (hex):", "EDID:", and "EDID_DATA:" of old.
bool is_heading(const text_line_t &line) {
  const std::string text = lower_case(trimmed(line.text));
  return text == "edid:" || text == "edid_data:" || (text.starts_with("edid") && text.ends_with("hex):"));
}

std::string where(const std::string &name, const text_line_t &line) {
  return name + ":" + std::to_string(line.number);
}

}  // namespace

bool has_hex_block(std::span<const text_line_t> lines) {
  return std::any_of(lines.begin(), lines.end(), is_heading);
}

std::vector<u8> read_hex_block(std::span<const text_line_t> lines, const std::string &name) {
  const auto heading = std::find_if(lines.begin(), lines.end(), is_heading);
  const auto another = std::find_if(std::next(heading), lines.end(), is_heading);
  if (another != lines.end()) {
    throw bad_input_t(where(name, *another) + ": a second EDID; the first is at line " +
                      std::to_string(heading->number) + ". Leave one of them");
  }
  std::vector<u8> bytes;
  for (auto line = std::next(heading); line != lines.end(); ++line) {
    const auto words = words_of(line->text);
    if (words.empty()) {
      continue;
    }
    if (!is_hexadecimal(words.front())) {
      // The next thing that the tool writes, unless the EDID is not whole yet.
      if (bytes.size() % edid_block_size != 0) {
        refuse_at(name, *line, words.front(), "is not hexadecimal");
      }
      break;
    }
    for (const std::string_view word : words) {
      append_bytes(bytes, word, *line, name);
    }
  }
  if (bytes.empty()) {
    throw bad_input_t(where(name, *heading) + ": no hexadecimal digits follow");
  }
  return bytes;
}

}  // namespace edid_cli
