#include "platform/key_findings.h"

#include <algorithm>
#include <cstdlib>

#include "platform/platform_keys.h"
#include "text/hexadecimal.h"

namespace edid_cli {
namespace {

constexpr u32 widest_audio_entry = 0xFFFFFF;

std::string quoted(const std::string &text) {
  return "\"" + text + "\"";
}

std::string within(const configuration_key_t &key) {
  if (key.kind == CONFIGURATION_EXTENDED_VICS) {
    return "not within 65 to 127 or 193 to 219";
  }
  return "not within " + std::to_string(key.minimum) + " to " + std::to_string(key.maximum);
}

/// Unsigned numbers are compared as such.
std::string number_text(const kept_reading_t &reading, i32 number) {
  return reading.key->kind == CONFIGURATION_UNSIGNED ? std::to_string(static_cast<u32>(number))
                                                     : std::to_string(number);
}

/// What an entry's number is called.
const char *number_name(const configuration_key_t &key) {
  switch (key.kind) {
    case CONFIGURATION_VIDEO_MODES:
    case CONFIGURATION_EXTENDED_VICS:
      return "VIC ";
    case CONFIGURATION_HDMI_VICS:
      return "4Kx2K mode ";
    case CONFIGURATION_TIMING_BITS:
      return "bit ";
    default:
      return "refresh rate ";
  }
}

bool is_printable_ascii(const std::string &text) {
  return std::all_of(text.begin(), text.end(), [](char character) { return character >= 0x20 && character < 0x7F; });
}

bool is_letter(char character) {
  return (character >= 'A' && character <= 'Z') || (character >= 'a' && character <= 'z');
}

/// The heights that a standard timing can have at a width.
std::string heights_at(long width) {
  std::string heights;
  for (const auto &[over, under] : {std::pair(1, 1), std::pair(3, 4), std::pair(4, 5), std::pair(9, 16)}) {
    heights += (heights.empty() ? "" : ", ") + std::to_string(width * over / under);
  }
  return heights;
}

class finder_t {
 public:
  explicit finder_t(const kept_reading_t &reading) : reading_(reading), key_(*reading.key), node_(node_of(reading)) {}

  findings_t run() && {
    if (reading_.entry >= 0) {
      key_.kind == CONFIGURATION_AUDIO_FORMATS ? look_at_audio_format() : look_at_entry();
    } else if (is_number(key_)) {
      look_at_number();
    } else if (is_list(key_)) {
      look_at_list();
    } else if (key_.kind == CONFIGURATION_TEXT) {
      look_at_text();
    } else {
      look_for_audio_texts();
    }
    return std::move(findings_);
  }

 private:
  void find(severity_t severity, std::string text) {
    findings_.push_back({severity, node_ ? node_->position() : position_t{}, name_of(reading_), std::move(text)});
  }

  void find_wrong_kind(const char *wanted, const std::string &effect) {
    find(severity_t::warning, std::string("holds ") + node_->kind() + ", but " + wanted + " is read: " + effect);
  }

  void look_at_number() {
    const std::string found = number_text(reading_, reading_.found);
    const std::string used = number_text(reading_, reading_.used);
    if (reading_.reason == CONFIGURATION_TOO_SMALL || reading_.reason == CONFIGURATION_TOO_LARGE) {
      find(severity_t::warning, found + " is " + within(key_) + ": " + used + " is taken");
    } else if (reading_.reason == CONFIGURATION_WITHOUT_MEANING) {
      find(severity_t::warning, found + " has no meaning: " + used + " is taken");
    } else if (reading_.reason == CONFIGURATION_ABSENT && node_) {
      find_wrong_kind("an integer", "the default " + used + " is taken");
    }
  }

  void look_at_text() {
    if (reading_.reason == CONFIGURATION_ABSENT) {
      if (node_) {
        find_wrong_kind("a text", "the default " + quoted(reading_.text) + " is taken");
      }
      return;
    }
    const std::string written = node_ ? node_->text().value_or("") : "";
    if (written.size() > key_.maximum) {
      find(severity_t::warning,
           "longer than " + std::to_string(key_.maximum) + " characters: " + quoted(reading_.text) + " is taken");
    }
    if (key_.minimum == key_.maximum) {
      look_at_manufacturer();
    } else if (!is_printable_ascii(reading_.text)) {
      find(severity_t::warning,
           quoted(reading_.text) + " holds more than printable ASCII: sources show something else, or nothing");
    }
    const bool is_sent = reading_.text.size() >= key_.minimum && !reading_.text.starts_with(' ');
    if (key_.minimum != key_.maximum && !written.empty() && !is_sent) {
      find(severity_t::warning, quoted(reading_.text) + " is not sent: it needs " + std::to_string(key_.minimum) +
                                    " characters or more, the first of them no blank");
    }
  }

  void look_at_manufacturer() {
    const std::string &letters = reading_.text;
    if (letters.size() != key_.minimum || !std::all_of(letters.begin(), letters.end(), is_letter)) {
      find(severity_t::error, quoted(letters) + " is not three letters A to Z: sources read another maker");
    }
  }

  void look_at_list() {
    // Without a word of the library where these are missing or empty.
    if (key_.kind == CONFIGURATION_EXTENDED_VICS && (!node_ || node_->is_branch())) {
      return;
    }
    constexpr const char *each_logs = "each composition logs an error";
    if (node_ && !node_->is_branch()) {
      find_wrong_kind("a list", "it counts as empty");
    } else if (reading_.reason == CONFIGURATION_ABSENT) {
      find(severity_t::warning, std::string("is missing: it counts as empty, and ") + each_logs);
    } else if (reading_.reason == CONFIGURATION_EMPTY) {
      find(severity_t::warning, std::string("no entry of it counts, and ") + each_logs);
    }
  }

  void look_at_entry() {
    const std::string passed_over = passed_over_text();
    if (!passed_over.empty()) {
      find(severity_t::warning, "passed over: " + passed_over);
      return;
    }
    const bool is_cut =
        key_.entry_characters != 0 && node_ && node_->text().value_or("").size() > key_.entry_characters;
    if (is_cut) {
      find(severity_t::warning,
           "longer than " + std::to_string(key_.entry_characters) + " characters: the rest is not read");
    }
    if (reading_.reason == CONFIGURATION_RATE_ROUNDED_UP) {
      const bool has_fraction = reading_.text.find('.') != std::string::npos;
      find(has_fraction ? severity_t::note : severity_t::warning,
           "refresh rate " + std::to_string(reading_.found) + " counts as " + std::to_string(reading_.used) +
               (has_fraction
                    ? ": a fraction is rounded up"
                    : ": the end of a longer entry before it is taken for a fraction; write .0 after the rate"));
    } else if (reading_.reason == CONFIGURATION_WIDTH_NOT_ENCODABLE) {
      find(severity_t::warning, "width " + std::to_string(reading_.found) +
                                    " is not within 256 to 2288: sources read " + std::to_string(reading_.used));
    } else if (key_.kind == CONFIGURATION_STANDARD_TIMINGS && reading_.place >= static_cast<i32>(key_.most_entries)) {
      find(severity_t::warning, effect_ends());
    }
  }

  /// Why an entry does not count; empty for one that does.
  std::string passed_over_text() const {
    switch (reading_.reason) {
      case CONFIGURATION_WRONG_KIND:
        return std::string("holds ") + (node_ ? node_->kind() : "something else") + ", but " +
               (key_.entry_characters != 0 ? "a text" : "an integer") + " is read";
      case CONFIGURATION_OUT_OF_RANGE:
        return number_name(key_) + std::to_string(reading_.found) + " is " + within(key_);
      case CONFIGURATION_NOT_A_NUMBER:
        return quoted(reading_.text) + " does not begin with a VIC";
      case CONFIGURATION_3D_UNKNOWN:
        return quoted(reading_.text) + " names a 3D structure that is not FP, SBSH or TBH";
      case CONFIGURATION_NO_ROOM:
        return effect_ends();
      case CONFIGURATION_WIDTH_NOT_IN_EIGHTS:
        return "width " + std::to_string(reading_.found) + " is no multiple of 8";
      case CONFIGURATION_HEIGHT_UNKNOWN:
        return "height " + std::to_string(reading_.found) +
               " is none of those for its width: " + heights_at(std::strtol(reading_.text.c_str(), nullptr, 10));
      case CONFIGURATION_OUT_OF_MEMORY:
        return "there is no memory for it";
      default:
        return "";
    }
  }

  std::string effect_ends() const {
    return "only the first " + std::to_string(key_.most_entries) + " entries have an effect";
  }

  void look_at_audio_format() {
    const auto value = static_cast<u32>(reading_.found);
    const std::string number = hex_number(value, 6);
    short_audio_desc_t format{};
    const bool decodes = decode_edid_short_audio(static_cast<u8>(value), static_cast<u8>(value >> 8),
                                                 static_cast<u8>(value >> 16), &format) != 0;
    if (value > widest_audio_entry) {
      find(severity_t::warning, number + " has more than 24 bits: those above are not read");
    }
    if (!decodes) {
      find(severity_t::warning, number + " is no audio format: passed over");
    } else if (format.type == 0) {
      find(severity_t::error,
           number + " is an extended format without a meaning: the library composes nothing that offers it");
    }
  }

  /// Formats that hold no integer are absent for the library.
  void look_for_audio_texts() {
    for (const std::string &key : audio_entry_keys()) {
      const auto node = configuration_node_t::find(platform_path(key));
      if (node && !node->integer()) {
        findings_.push_back({severity_t::warning, node->position(), key,
                             std::string("holds ") + node->kind() + ", but an integer is read: passed over"});
      }
    }
  }

  const kept_reading_t &reading_;
  const configuration_key_t &key_;
  std::optional<configuration_node_t> node_;
  findings_t findings_;
};

}  // namespace

findings_t find_in_readings(const std::vector<kept_reading_t> &readings) {
  findings_t findings;
  for (const kept_reading_t &reading : readings) {
    const findings_t found = finder_t(reading).run();
    findings.insert(findings.end(), found.begin(), found.end());
  }
  return findings;
}

}  // namespace edid_cli
