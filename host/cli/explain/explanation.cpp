#include "explain/explanation.h"

#include <algorithm>
#include <cstring>

namespace edid_cli {
namespace {

/// A library of another version may fill fewer members, or more than this program knows.
void take(const compose_decision_t *decision, void *context) noexcept {
  compose_decision_t known{};
  std::memcpy(&known, decision, std::min<std::size_t>(decision->size, sizeof known));
  static_cast<std::vector<compose_decision_t> *>(context)->push_back(known);
}

}  // namespace

std::optional<explanation_t> explain_composition(const composition_options_t &options, const std::vector<u8> &sink) {
  compose_cfg_t settings = options.settings;
  settings.port = options.ports.first;
  explanation_t explanation;
  debug_enable(options.debug);
  compose_request_t request{};
  request.size = sizeof request;
  request.sink = sink.empty() ? nullptr : sink.data();
  request.sink_bytes = static_cast<u32>(sink.size());
  request.new_edid = explanation.new_edid.data();
  request.new_edid_bytes = static_cast<u32>(explanation.new_edid.size());
  request.settings = &settings;
  request.observer = take;
  request.observer_context = &explanation.decisions;
  compose_result_t result{};
  result.size = sizeof result;
  if (!compose_edid_request(&request, &result)) {
    return std::nullopt;
  }
  return explanation;
}

}  // namespace edid_cli
