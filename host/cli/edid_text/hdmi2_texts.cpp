#include "edid_text/hdmi2_texts.h"

#include <cmath>
#include <cstdio>
#include <iterator>

namespace edid_cli {
namespace {

constexpr std::size_t bits_of_byte = 8;
using bit_names_t = const char *const[bits_of_byte];

constexpr bit_names_t color_spaces = {"xvYCC601", "xvYCC709",   "sYCC601",   "opYCC601",
                                      "opRGB",    "BT2020cYCC", "BT2020YCC", "BT2020RGB"};
constexpr bit_names_t gamuts = {"metadata profile 0",
                                "metadata profile 1",
                                "metadata profile 2",
                                "metadata profile 3",
                                "default RGB",
                                "sRGB",
                                "ICtCp",
                                "ST2113RGB"};
constexpr bit_names_t eotfs = {"SDR", "HDR with traditional gamma", "PQ (SMPTE ST 2084)", "HLG"};
constexpr bit_names_t metadata_types = {"type 1"};
constexpr const char *fixed_rate_links[] = {"none",
                                            "3 Gbit/s on 3 lanes",
                                            "6 Gbit/s on 3 lanes",
                                            "6 Gbit/s on 4 lanes",
                                            "8 Gbit/s on 4 lanes",
                                            "10 Gbit/s on 4 lanes",
                                            "12 Gbit/s on 4 lanes"};

/// One text for each bit that is set, from the lowest on.
texts_t bit_texts(u32 bits, const bit_names_t &names) {
  texts_t texts;
  for (std::size_t bit = 0; bit < bits_of_byte; ++bit) {
    if ((bits >> bit & 1U) != 0) {
      texts.push_back(names[bit] != nullptr ? names[bit] : "reserved bit " + std::to_string(bit));
    }
  }
  return texts;
}

double luminance(u32 code) {
  return 50 * std::exp2(code / 32.0);
}

std::string candela_text(double value, int decimals) {
  char text[32];
  std::snprintf(text, sizeof text, "%.*f cd/m2", decimals, value);
  return text;
}

}  // namespace

texts_t color_space_texts(u32 bits) {
  return bit_texts(bits, color_spaces);
}

texts_t gamut_texts(u32 bits) {
  return bit_texts(bits, gamuts);
}

texts_t eotf_texts(u32 bits) {
  return bit_texts(bits, eotfs);
}

texts_t metadata_type_texts(u32 bits) {
  return bit_texts(bits, metadata_types);
}

std::string luminance_text(u32 code) {
  return candela_text(luminance(code), 2);
}

std::string minimum_luminance_text(u32 maximum_code, u32 code) {
  const double part = code / 255.0;
  return candela_text(luminance(maximum_code) * part * part / 100, 4);
}

std::string tmds_rate_text(u32 megahertz) {
  return megahertz == 0 ? "340 MHz or less" : std::to_string(megahertz) + " MHz";
}

std::string fixed_rate_link_text(u32 code) {
  return code < std::size(fixed_rate_links) ? fixed_rate_links[code] : "unknown code " + std::to_string(code);
}

std::string lowest_variable_rate_text(u32 hertz) {
  return hertz == 0 ? "none: no variable refresh rate" : std::to_string(hertz) + " Hz";
}

std::string highest_variable_rate_text(u32 hertz) {
  return hertz == 0 ? "no limit declared" : std::to_string(hertz) + " Hz";
}

std::string scan_text(u32 code, const char *first) {
  const char *const words[] = {first, "always overscanned", "always underscanned", "overscanned or underscanned"};
  return words[code % std::size(words)];
}

std::string joined(const texts_t &texts, const char *none) {
  std::string text;
  for (const std::string &one : texts) {
    text += (text.empty() ? "" : ", ") + one;
  }
  return text.empty() ? none : text;
}

}  // namespace edid_cli
