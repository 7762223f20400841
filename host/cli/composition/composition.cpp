#include "composition/composition.h"

#include <algorithm>
#include <cstring>

#include "composition/library_line.h"

namespace edid_cli {
namespace {

void pass_on(const compose_log_line_t *line, void *listener) noexcept {
  (*static_cast<const line_listener_t *>(listener))(*line);
}

/// A library of another version may fill fewer members, or more than this program knows.
void keep(const compose_decision_t *decision, void *decisions) noexcept {
  compose_decision_t known{};
  std::memcpy(&known, decision, std::min<std::size_t>(decision->size, sizeof known));
  static_cast<std::vector<compose_decision_t> *>(decisions)->push_back(known);
}

}  // namespace

line_listener_t written_to(std::FILE *stream) {
  return [stream](const compose_log_line_t &line) { std::fputs(printed(line).c_str(), stream); };
}

composition_t compose(const composition_options_t &options, u32 port, const std::vector<u8> &sink,
                      const line_listener_t &listener, decisions_t decisions) {
  composition_t composition;
  composition.result.size = sizeof composition.result;
  compose_cfg_t settings = options.settings;
  settings.port = port;
  line_listener_t taker = listener;

  compose_request_t request{};
  request.size = sizeof request;
  request.sink = sink.empty() ? nullptr : sink.data();
  request.sink_bytes = static_cast<u32>(sink.size());
  request.new_edid = composition.new_edid.data();
  request.new_edid_bytes = static_cast<u32>(composition.new_edid.size());
  request.settings = &settings;
  request.log = pass_on;
  request.log_context = &taker;
  if (decisions == decisions_t::kept) {
    request.observer = keep;
    request.observer_context = &composition.decisions;
  }
  debug_enable(options.debug);
  composition.is_composed = compose_edid_request(&request, &composition.result);
  return composition;
}

}  // namespace edid_cli
