#include "edid_input/hex_dump.h"

#include <algorithm>
#include <optional>

#include "edid_input/edid_file.h"
#include "edid_input/hex_words.h"
#include "text/whole_number.h"

namespace edid_cli {
namespace {

/// What is not a dump's line: nothing, or a comment.
bool is_passed_over(const text_line_t &line) {
  const std::string_view text = trimmed(line.text);
  return text.empty() || text.front() == '#';
}

struct dump_line_t {
  std::string_view offset;  ///< Without its colon.
  std::string_view data;    ///< Without the text column.
  bool has_colon = false;
};

dump_line_t split(const text_line_t &line) {
  dump_line_t parts;
  const std::string_view text = trimmed(line.text);
  parts.offset = text.substr(0, text.find_first_of(": \t"));
  parts.data = text.substr(parts.offset.size());
  parts.has_colon = parts.data.starts_with(':');
  if (parts.has_colon) {
    // The text column has no frame, but two blanks before it.
    parts.data = trimmed(parts.data.substr(1));
    parts.data = parts.data.substr(0, parts.data.find("  "));
  } else {
    parts.data = parts.data.substr(0, parts.data.find_first_of("|>"));
  }
  return parts;
}

/// Reads line by line.
class dump_reader_t {
 public:
  explicit dump_reader_t(const std::string &name) : name_(name) {}

  void read(const text_line_t &line) {
    if (trimmed(line.text) == "*") {
      repeats_since_ = line;
      return;
    }
    const dump_line_t parts = split(line);
    if (!is_hexadecimal(parts.offset)) {
      refuse_at(name_, line, parts.offset, "is not the offset that a line of this dump begins with");
    }
    settle_radix(line, parts.offset);
    const std::size_t row_begin = bytes_.size();
    for (const std::string_view word : words_of(parts.data)) {
      if (!parts.has_colon && word.size() != 2) {
        refuse_at(name_, line, word, "is not one byte; dump with xxd or hexdump -C");
      }
      append_bytes(bytes_, word, line, name_);
    }
    last_row_size_ = bytes_.size() - row_begin;
  }

  std::vector<u8> finish() && {
    if (repeats_since_) {
      refuse_at(name_, *repeats_since_, trimmed(repeats_since_->text), "is followed by no offset that ends it");
    }
    return std::move(bytes_);
  }

 private:
  /// Offsets are hexadecimal, decimal or octal, whichever fits all of them.
  void settle_radix(const text_line_t &line, std::string_view offset) {
    std::optional<std::size_t> target;
    std::erase_if(radices_, [&](int radix) {
      const auto value = parse_whole_number(offset, radix);
      const bool fits = value && (repeats_since_ ? is_repetition_to(*value) : *value == bytes_.size());
      if (fits && !target) {
        target = *value;
      }
      return !fits;
    });
    if (!target) {
      refuse_at(name_, line, offset,
                "is not the offset of what follows: " + std::to_string(bytes_.size()) + " bytes come before it");
    }
    while (bytes_.size() < *target) {
      bytes_.push_back(bytes_[bytes_.size() - last_row_size_]);
    }
    repeats_since_.reset();
  }

  bool is_repetition_to(std::size_t offset) const {
    return last_row_size_ != 0 && offset > bytes_.size() && offset <= max_edid_size &&
           (offset - bytes_.size()) % last_row_size_ == 0;
  }

  const std::string &name_;
  std::vector<u8> bytes_;
  std::vector<int> radices_{16, 10, 8};
  std::size_t last_row_size_ = 0;
  std::optional<text_line_t> repeats_since_;
};

}  // namespace

bool is_hex_dump(std::span<const text_line_t> lines) {
  const auto first = std::find_if_not(lines.begin(), lines.end(), is_passed_over);
  if (first == lines.end()) {
    return false;
  }
  // An EDID begins with 00 FF: six zeros are an offset.
  const dump_line_t parts = split(*first);
  return is_hexadecimal(parts.offset) &&
         (parts.has_colon ||
          (parts.offset.size() >= 6 && parts.offset.find_first_not_of('0') == std::string_view::npos));
}

std::vector<u8> read_hex_dump(std::span<const text_line_t> lines, const std::string &name) {
  dump_reader_t reader(name);
  for (const text_line_t &line : lines) {
    if (!is_passed_over(line)) {
      reader.read(line);
    }
  }
  return std::move(reader).finish();
}

}  // namespace edid_cli
