#include "commands/option_values.h"

#include <string>

#include "io/bad_input.h"
#include "text/whole_number.h"

namespace edid_cli {
namespace {

constexpr u32 max_port = 14;
constexpr u32 max_latency_ms = 65535;
constexpr u32 max_jobs = 256;

[[noreturn]] void refuse(std::string_view text, const std::string &expected) {
  throw bad_input_t("\"" + std::string(text) + "\" is not " + expected);
}

u32 parse_port(std::string_view text) {
  const auto port = parse_whole_number(text);
  if (!port || *port > max_port) {
    refuse(text, "a port from 0 to 14");
  }
  return *port;
}

}  // namespace

u32 parse_mask(std::string_view text) {
  const bool hexadecimal = text.starts_with("0x") || text.starts_with("0X");
  const auto mask = hexadecimal ? parse_whole_number(text.substr(2), 16) : parse_whole_number(text);
  if (!mask) {
    refuse(text, "a number of 32 bits, decimal or 0x hexadecimal");
  }
  return *mask;
}

port_range_t parse_ports(std::string_view text) {
  constexpr std::string_view dots = "..";
  const std::size_t middle = text.find(dots);
  if (middle == std::string_view::npos) {
    const u32 port = parse_port(text);
    return {port, port, false};
  }
  const port_range_t range{parse_port(text.substr(0, middle)), parse_port(text.substr(middle + dots.size())), true};
  if (range.last < range.first) {
    refuse(text, "a range of ports such as 0..3");
  }
  return range;
}

std::string parse_file_name(const std::string &text) {
  if (text.empty()) {
    throw bad_input_t("the file name is empty");
  }
  return text;
}

edid_format_t parse_edid_format(std::string_view text) {
  if (text == "raw") {
    return edid_format_t::raw;
  }
  if (text == "hex") {
    return edid_format_t::hex;
  }
  refuse(text, "raw or hex");
}

u32 parse_jobs(std::string_view text) {
  const auto jobs = parse_whole_number(text);
  if (!jobs || *jobs < 1 || *jobs > max_jobs) {
    refuse(text, "a number of jobs from 1 to 256");
  }
  return *jobs;
}

video_mode_t parse_video_mode(std::string_view text) {
  const std::size_t cross = text.find('x');
  const std::size_t scan = text.find_first_of("pi");
  if (cross != std::string_view::npos && scan != std::string_view::npos && cross < scan) {
    const auto width = parse_whole_number(text.substr(0, cross));
    const auto height = parse_whole_number(text.substr(cross + 1, scan - cross - 1));
    const auto refresh = parse_whole_number(text.substr(scan + 1));
    if (width && height && refresh) {
      const u32 interlaced = text[scan] == 'i' ? 1 : 0;
      return {*width, *height, interlaced, *refresh};
    }
  }
  refuse(text, "a mode such as 1920x1080p60 or 1920x1080i50");
}

i32 parse_3d_mode(std::string_view text) {
  if (text == "off") {
    return no_3d_mode;
  }
  if (text == "sink") {
    return follow_sink_3d_mode;
  }
  if (text == "on") {
    return always_3d_mode;
  }
  refuse(text, "off, sink or on");
}

latency_t parse_latency(std::string_view text) {
  latency_t latency{};
  std::string_view rest = text;
  for (std::size_t field = 0; field < latency.size(); ++field) {
    const bool is_last = field + 1 == latency.size();
    const std::size_t end = is_last ? rest.size() : rest.find(',');
    const auto milliseconds = parse_whole_number(rest.substr(0, end));
    if (!milliseconds || *milliseconds > max_latency_ms || end == std::string_view::npos) {
      refuse(text, "four latencies from 0 to 65535 ms, separated by commas");
    }
    latency[field] = *milliseconds;
    rest.remove_prefix(is_last ? end : end + 1);
  }
  return latency;
}

}  // namespace edid_cli
