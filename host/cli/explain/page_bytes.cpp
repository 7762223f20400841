#include "explain/page_bytes.h"

#include "explain/byte_fields.h"
#include "text/hexadecimal.h"
#include "text/utf8_text.h"

namespace edid_cli {
namespace {

constexpr std::size_t block_size = 128;
/// A line has 16 bytes, or 8 on a narrow screen: its second half has an offset of its own, shown there only.
constexpr std::size_t bytes_in_half_line = 8;

std::string row_id(const byte_field_t &field) {
  return field_text("f%zu", field.offset);
}

std::string byte_html(u8 byte, const byte_field_t &field, std::size_t offset) {
  const std::string part = field.size > 1 ? field_text(" (%zu of %zu)", offset - field.offset + 1, field.size) : "";
  return "<a href=\"#" + row_id(field) + "\" class=\"" + byte_block_id(field.block) + "\" title=\"" +
         hex_number(offset, 2) + " " + html_text(field.name + part + ": " + field.meaning) + "\">" +
         hex_digits(byte, 2) + "</a>";
}

}  // namespace

std::string legend_html(const std::vector<byte_field_t> &fields) {
  bool is_there[byte_block_count] = {};
  for (const byte_field_t &field : fields) {
    is_there[static_cast<std::size_t>(field.block)] = true;
  }
  std::string html;
  for (std::size_t index = 0; index < byte_block_count; ++index) {
    const auto block = static_cast<byte_block_t>(index);
    html += is_there[index]
                ? std::string("<li><i class=\"") + byte_block_id(block) + "\"></i>" + byte_block_title(block) + "</li>"
                : "";
  }
  return html;
}

std::string bytes_html(std::span<const u8> edid, const std::vector<byte_field_t> &fields, std::size_t begin) {
  std::string html;
  for (const byte_field_t &field : fields) {
    for (std::size_t offset = field.offset; offset < field.offset + field.size; ++offset) {
      if (offset < begin || offset >= begin + block_size) {
        continue;
      }
      if (offset % bytes_in_half_line == 0) {
        html += std::string("\n<span") + (offset % (2 * bytes_in_half_line) != 0 ? " class=\"half\"" : "") + ">" +
                hex_digits(offset, 2) + "</span>";
      }
      html += byte_html(edid[offset], field, offset);
    }
  }
  return html;
}

std::string fields_html(std::span<const u8> edid, const std::vector<byte_field_t> &fields) {
  std::string html;
  for (const byte_field_t &field : fields) {
    html += "<tr id=\"" + row_id(field) + "\"><td class=\"mono\">" + hex_number(field.offset, 2) +
            "</td><td class=\"mono\">" + hex_bytes(edid.subspan(field.offset, field.size), " ", letters_t::capital) +
            "</td><td class=\"part\">" + byte_block_title(field.block) + "</td><th scope=\"row\" class=\"field\">" +
            html_text(field.name) + "</th><td class=\"meaning\">" + html_text(field.meaning) + "</td></tr>\n";
  }
  return html;
}

}  // namespace edid_cli
