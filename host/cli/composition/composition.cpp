#include "composition/composition.h"

#include <algorithm>
#include <cstring>
#include <string_view>

#include "composition/library_line.h"

namespace edid_cli {
namespace {

/// Passes lines on, and keeps the error that tells why the library has refused.
class refusal_listener_t {
 public:
  explicit refusal_listener_t(const line_listener_t &listener) : listener_(listener) {}

  void hear(const compose_log_line_t &line) {
    listener_(line);
    if (line.kind != COMPOSE_LOG_ERROR && line.kind != COMPOSE_LOG_BUG) {
      return;
    }
    // The composition itself only says which of its steps failed, after the step has said why.
    if (std::string_view(line.function) != "compose_edid_internal" || refusal_.empty()) {
      refusal_ = message_of(line);
    }
  }

  std::string refusal() const { return refusal_; }

 private:
  const line_listener_t &listener_;
  std::string refusal_;
};

void pass_on(const compose_log_line_t *line, void *listener) noexcept {
  static_cast<refusal_listener_t *>(listener)->hear(*line);
}

/// A library of another version may fill fewer members, or more than this program knows.
void keep(const compose_decision_t *decision, void *decisions) noexcept {
  compose_decision_t known{};
  std::memcpy(&known, decision, std::min<std::size_t>(decision->size, sizeof known));
  static_cast<std::vector<compose_decision_t> *>(decisions)->push_back(known);
}

void keep_reading(const configuration_reading_t *reading, void *readings) noexcept {
  static_cast<std::vector<kept_reading_t> *>(readings)->push_back({reading->key, reading->reason, reading->entry,
                                                                   reading->place, reading->node, reading->text,
                                                                   reading->found, reading->used});
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
  refusal_listener_t taker(listener);

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
    request.configuration_observer = keep_reading;
    request.configuration_observer_context = &composition.readings;
  }
  debug_enable(options.debug);
  composition.is_composed = compose_edid_request(&request, &composition.result);
  if (!composition.is_composed) {
    composition.refusal = taker.refusal();
  }
  return composition;
}

}  // namespace edid_cli
