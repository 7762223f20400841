// Places in a TOML document that is known to be valid: where a key's value stands, and where it ends.
#pragma once

#include <cstddef>
#include <string>

#include "platform/configuration_node.h"

namespace edid_web {

/// The offset of a line and column as the configuration store counts them.
std::size_t offset_of(const std::string &text, const edid_cli::position_t &position);

/// The offset after the value that begins at @p begin: a string, a list, an inline table, or a word.
std::size_t end_of_value(const std::string &text, std::size_t begin);

/// Where the value of the key that begins at @p key begins; npos where none follows, as of a table's header.
std::size_t value_of_key(const std::string &text, std::size_t key);

std::size_t begin_of_line(const std::string &text, std::size_t offset);
/// The offset of the line's newline, or of the text's end.
std::size_t end_of_line(const std::string &text, std::size_t offset);
std::size_t after_blanks(const std::string &text, std::size_t offset);
/// Whether nothing but blanks stands before @p offset in its line.
bool begins_line(const std::string &text, std::size_t offset);
/// Whether nothing but blanks and a comment follow in the line.
bool ends_line(const std::string &text, std::size_t offset);

}  // namespace edid_web
