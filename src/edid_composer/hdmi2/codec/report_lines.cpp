#include "edid_composer/hdmi2/codec/report_lines.h"

#include "output.h"

namespace edid_composer {

bool print_heading(const char *heading, bool present) {
  print("\n%s:%s\n", heading, present ? "" : " none");
  return present;
}

void print_label(const char *label) {
  print("\t%-23s = ", label);
}

void print_word(const char *label, const char *word) {
  print_label(label);
  print("%s\n", word);
}

void print_number(const char *label, u32 number, const char *unit) {
  print_label(label);
  print("%u%s\n", number, unit);
}

void print_support(const char *label, bool supported) {
  print_word(label, supported ? "supported" : "unsupported");
}

void print_bits(const char *label, u32 bits, const char *const (&names)[bits_of_a_byte]) {
  print_label(label);
  if (bits == 0) print("none");
  const char *separator = "";
  for (u32 bit = 0; bit < bits_of_a_byte; ++bit) {
    if ((bits >> bit & 1) == 0) continue;
    if (names[bit] != nullptr) {
      print("%s%s", separator, names[bit]);
    } else {
      print("%sbit %u", separator, bit);
    }
    separator = ", ";
  }
  print("\n");
}

}  // namespace edid_composer
