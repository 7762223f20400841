// A composition with an observer.
#pragma once

#include <span>

#include "edid_composer.h"

namespace test_support {

/// What compose_edid_internal() does with the same arguments, with HDMI 2 where @p hdmi2 asks for it, while @p observer
/// hears of each decision. An empty @p sink is none. Its lines go to standard output.
inline bool compose_observed(std::span<const u8> sink, std::span<u8> new_edid, const compose_cfg_t *settings,
                             const platform_values_t *values, compose_observer_t observer, void *context,
                             const hdmi2_values_t *hdmi2 = nullptr) {
  compose_request_t request{};
  request.size = sizeof request;
  request.sink = sink.empty() ? nullptr : sink.data();
  request.sink_bytes = static_cast<u32>(sink.size());
  request.new_edid = new_edid.data();
  request.new_edid_bytes = static_cast<u32>(new_edid.size());
  request.settings = settings;
  request.platform_values = values;
  request.hdmi2 = hdmi2;
  request.observer = observer;
  request.observer_context = context;
  compose_result_t result{};
  result.size = sizeof result;
  return compose_edid_request(&request, &result);
}

}  // namespace test_support
