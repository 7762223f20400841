// The lines that the report of HDMI 2 consists of: headings, and a label with its value.
#pragma once

#include "edid_composer.h"

namespace edid_composer {

inline constexpr u32 bits_of_a_byte = 8;

/// A heading. False, with the word for it, when there is nothing below it.
bool print_heading(const char *heading, bool present);

/// A label; the line goes on after it.
void print_label(const char *label);
void print_word(const char *label, const char *word);
void print_number(const char *label, u32 number, const char *unit);
void print_support(const char *label, bool supported);

/// The names of the bits that are set, bit 0 first; the number of a bit whose name is null.
void print_bits(const char *label, u32 bits, const char *const (&names)[bits_of_a_byte]);

}  // namespace edid_composer
