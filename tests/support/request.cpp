#include "support/request.h"

namespace test_support {
namespace {

std::string report(const compose_log_line_t &line, const char *level) {
  return std::string(line.module) + ":" + std::to_string(line.line) + ":" + line.function + "() " + level + ": " +
         line.text;
}

std::string without_newline(const compose_log_line_t &line) {
  switch (line.kind) {
    case COMPOSE_LOG_ERROR:
      return report(line, "ERROR");
    case COMPOSE_LOG_WARNING:
      return report(line, "WARNING");
    case COMPOSE_LOG_BUG:
      return report(line, "BUG");
    case COMPOSE_LOG_TRACE:
      return std::string(line.text) + " \t\t\t" + line.function + "():" + std::to_string(line.line);
    case COMPOSE_LOG_TEXT:
      return line.text;
    default:
      return "unknown kind of line";
  }
}

}  // namespace

request_t::request_t(const bytes_t &sink_bytes, const compose_cfg_t &cfg, const platform_values_t *values)
    : sink(sink_bytes), settings(cfg) {
  settings.spa_offset = &spa_offset;
  request.size = sizeof request;
  request.sink = sink.empty() ? nullptr : sink.data();
  request.sink_bytes = static_cast<u32>(sink.size());
  request.new_edid = new_edid.data();
  request.new_edid_bytes = static_cast<u32>(new_edid.size());
  request.settings = &settings;
  request.platform_values = values;
  result.size = sizeof result;
}

bool request_t::compose_logged(const std::function<void(const compose_log_line_t &)> &also) {
  struct context_t {
    std::string lines;
    const std::function<void(const compose_log_line_t &)> &also;
  } context{"", also};
  request.log_context = &context;
  request.log = [](const compose_log_line_t *line, void *to) {
    static_cast<context_t *>(to)->lines += rendered(*line);
    if (static_cast<context_t *>(to)->also) static_cast<context_t *>(to)->also(*line);
  };
  const bool composed = compose();
  request.log = nullptr;
  lines = context.lines;
  return composed;
}

std::string rendered(const compose_log_line_t &line) {
  return without_newline(line) + "\n";
}

}  // namespace test_support
