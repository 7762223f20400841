#include "golden_cases.h"

#include <algorithm>
#include <stdexcept>

#include "composition.h"
#include "support/patterns.h"
#include "text_format.h"

namespace golden {
namespace {

constexpr const char *names_of_3d_modes[] = {"never", "as the sink", "always"};

constexpr const char *heading_pattern =
    "^# What the platform \"([a-z0-9_]+)\" shows for the sink \"([a-z0-9_]+)\"\\.\n"
    "# port ([0-9]+), latency ([0-9]+)/([0-9]+)/([0-9]+)/([0-9]+) ms, 3D (never|as the sink|always), "
    "audio mask 0x([0-9A-F]+), sink filter (on|off), current mode (none|([0-9]+)x([0-9]+)([pi])([0-9]+))\n";

std::string name_of(const video_mode_t &mode) {
  if (mode.width == 0) return "none";
  return format("%ux%u%c%u", mode.width, mode.height, mode.interlaced == 1 ? 'i' : 'p', mode.refresh);
}

u32 number(const std::string &text, int base = 10) {
  return text.empty() ? 0 : static_cast<u32>(std::stoul(text, nullptr, base));
}

}  // namespace

std::string golden_case_t::heading() const {
  return format("# What the platform \"%s\" shows for the sink \"%s\".\n", platform.c_str(), sink.c_str()) +
         format("# port %u, latency %u/%u/%u/%u ms, 3D %s, audio mask 0x%X, sink filter %s, current mode %s\n", port,
                latency_ms[0], latency_ms[1], latency_ms[2], latency_ms[3], names_of_3d_modes[hdmi_3d_mode], audio_mask,
                audio_sink_filter ? "on" : "off", name_of(current_mode).c_str());
}

golden_case_t case_of(const std::string &text) {
  const std::vector<std::string> part = test_support::first_match(text, heading_pattern);
  if (part.empty() || !text.starts_with(part[0])) {
    throw std::runtime_error("a golden case begins with two lines like those of the other cases, not with\n" +
                             text.substr(0, 300));
  }
  golden_case_t golden_case;
  golden_case.platform = part[1];
  golden_case.sink = part[2];
  golden_case.port = number(part[3]);
  for (std::size_t i = 0; i < golden_case.latency_ms.size(); ++i)
    golden_case.latency_ms[i] = number(part[4 + i]);
  golden_case.hdmi_3d_mode = static_cast<i32>(
      std::find(std::begin(names_of_3d_modes), std::end(names_of_3d_modes), part[8]) - std::begin(names_of_3d_modes));
  golden_case.audio_mask = number(part[9], 16);
  golden_case.audio_sink_filter = part[10] == "on";
  golden_case.current_mode = {number(part[12]), number(part[13]), part[14] == "i" ? 1U : 0U, number(part[15])};
  return golden_case;
}

const std::vector<golden_case_t> &golden_cases() {
  static const std::vector<golden_case_t> cases = [] {
    std::vector<golden_case_t> found;
    for (const auto &file : std::filesystem::directory_iterator(golden_directory())) {
      if (file.path().extension() != ".hex") continue;
      found.push_back(case_of(content_of(file.path())));
      if (found.back().name() != file.path().stem()) throw std::runtime_error(file.path().string() + ": another case");
    }
    std::sort(found.begin(), found.end(), [](const auto &a, const auto &b) { return a.name() < b.name(); });
    return found;
  }();
  return cases;
}

}  // namespace golden
