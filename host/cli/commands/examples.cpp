#include "commands/examples.h"

namespace edid_cli {
namespace {

struct example_t {
  std::string_view command;  ///< Empty: of the program as a whole.
  std::string_view purpose;
  std::string_view line;
};

constexpr example_t examples[] = {
    {"", "What does the display at this machine take?", "edid-composer print card0-HDMI-A-1"},
    {"", "What would a box with the default platform show for it?",
     "edid-composer compose --sink card0-HDMI-A-1 -o new.bin"},
    {"", "What differs between the two?", "edid-composer diff card0-HDMI-A-1 new.bin"},
    {"", "A platform of your own, checked for mistakes:",
     "edid-composer platform > box.toml\n  edid-composer check-platform box.toml"},
    {"compose", "From a dump, for the second input, as a hexadecimal dump:",
     "edid-composer compose --sink tv.bin --port 1 --format hex -o -"},
    {"compose", "From another program's text:", "xrandr --prop | edid-composer compose --sink - -o new.bin"},
    {"compose", "For the first four inputs: edids/port0.bin to edids/port3.bin",
     "edid-composer compose --sink tv.bin --port 0..3 -o edids"},
    {"compose", "For every sink of a folder, with a log beside each EDID:",
     "edid-composer compose --platform box.toml --sink sinks --log -o edids"},
    {"compose", "With file names of your own:",
     "edid-composer compose --sink sinks --port 0..1 -o 'edids/{sink}-input{port}.bin'"},
    {"explain",
     "The verdict on every mode and format, and why:", "edid-composer explain --platform box.toml --sink tv.bin"},
    {"explain", "Why one of them is not offered, and what to change:",
     "edid-composer explain --platform box.toml --sink tv.bin --want 1920x1080p60"},
    {"explain", "The same for a 4Kx2K mode, and for an audio format:",
     "edid-composer explain --sink tv.bin --want 4k:1\n  edid-composer explain --sink tv.bin --want ac3"},
    {"explain", "A page to mail:", "edid-composer explain --platform box.toml --sink tv.bin --html tv.html"},
    {"print", "All fields:", "edid-composer print tv.bin"},
    {"print", "A short report on the display at this machine:", "edid-composer print --brief card0-HDMI-A-1"},
    {"diff", "What the box changes:", "edid-composer diff tv.bin new.bin"},
    {"diff", "Only what differs:", "edid-composer diff --only-changes before.bin after.bin"},
    {"sinks", "The displays of this machine:", "edid-composer sinks"},
    {"check-platform", "A platform before it ships:", "edid-composer check-platform box.toml"},
    {"audio-mask", "PCM and AC-3:", "edid-composer audio-mask 0x3"},
    {"platform", "A platform to start from:", "edid-composer platform > box.toml"},
    {"platform", "One for 4K60 and HDR:", "edid-composer platform --hdmi2 > box.toml"},
};

}  // namespace

std::string examples_of(std::string_view command) {
  std::string text = "Examples:";
  for (const example_t &example : examples) {
    if (example.command == command) {
      text.append("\n  # ").append(example.purpose).append("\n  ").append(example.line);
    }
  }
  return text;
}

}  // namespace edid_cli
