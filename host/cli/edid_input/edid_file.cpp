#include "edid_input/edid_file.h"

#include <algorithm>
#include <filesystem>
#include <string_view>

#include "edid_input/drm_connectors.h"
#include "edid_input/hex_text.h"
#include "io/bad_input.h"
#include "io/input.h"

namespace edid_cli {
namespace {

constexpr std::string_view edid_header("\0\xFF\xFF\xFF\xFF\xFF\xFF\0", 8);

bool is_text_character(char character) {
  const auto byte = static_cast<unsigned char>(character);
  return byte >= 0x20 ? byte != 0x7F : (byte >= '\t' && byte <= '\r');
}

/// No text holds the zero bytes of an EDID's header, and hardly an EDID without them holds text only.
bool is_text(std::string_view content) {
  return std::all_of(content.begin(), content.end(), is_text_character);
}

/// The registry's editor writes UTF-16, low byte first. Empty when it is none, or none that could hold digits.
std::string text_of_utf16(std::string_view content) {
  constexpr std::string_view byte_order_mark = "\xFF\xFE";
  std::string text;
  if (content.starts_with(byte_order_mark) && content.size() % 2 == 0) {
    for (std::size_t place = byte_order_mark.size(); place < content.size(); place += 2) {
      text += content[place + 1] == 0 ? content[place] : '?';
    }
  }
  return is_text(text) ? text : "";
}

/// Tools and editors put a newline after what they write.
std::vector<u8> raw_bytes(std::string_view content) {
  for (const std::string_view newline : {"\r\n", "\n"}) {
    if (content.ends_with(newline) && content.size() % edid_block_size == newline.size()) {
      content.remove_suffix(newline.size());
    }
  }
  return {content.begin(), content.end()};
}

std::vector<u8> bytes_of(const std::string &content, const std::string &name) {
  const std::string utf16 = text_of_utf16(content);
  return !utf16.empty()     ? parse_hex_text(utf16, name)
         : is_text(content) ? parse_hex_text(content, name)
                            : raw_bytes(content);
}

bool exists(const std::string &file) {
  std::error_code error;
  return std::filesystem::symlink_status(file, error).type() != std::filesystem::file_type::not_found;
}

std::vector<u8> parse_edid(const std::string &content, const std::string &name) {
  std::vector<u8> bytes = bytes_of(content, name);
  if (bytes.empty() || bytes.size() % edid_block_size != 0 || bytes.size() > max_edid_size) {
    throw bad_input_t(name + ": " + std::to_string(bytes.size()) +
                      " bytes are not an EDID, which has 1 to 256 blocks of 128 bytes");
  }
  return bytes;
}

}  // namespace

std::vector<u8> edid_of(const std::string &content, const std::string &name) {
  try {
    if (content.empty()) {
      throw bad_input_t(name + ": is empty");
    }
    return parse_edid(content, name);
  } catch (const bad_input_t &problem) {
    // What begins as one is a damaged EDID.
    if (content.starts_with(edid_header)) {
      throw;
    }
    throw not_an_edid_t(problem.what());
  }
}

std::vector<u8> read_edid_file(const std::string &file) {
  return edid_of(read_input(file), input_name(file));
}

std::vector<u8> read_edid(const std::string &source, const std::string &drm_directory) {
  if (source != standard_stream && !exists(source)) {
    if (const auto connector = find_connector(drm_directory, source)) {
      const std::string content = read_input(connector->edid_file);
      if (content.empty()) {
        throw bad_input_t(connector->name + ": no display is connected");
      }
      return parse_edid(content, connector->edid_file);
    }
  }
  return read_edid_file(source);
}

std::vector<u8> read_sink(const std::optional<std::string> &source, const std::string &drm_directory) {
  return source ? read_edid(*source, drm_directory) : std::vector<u8>{};
}

}  // namespace edid_cli
