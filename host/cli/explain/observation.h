// A composition that is observed, and what an explanation of it rests on.
#pragma once

#include <memory>
#include <string>
#include <vector>

#include "explain/explained.h"

namespace edid_cli {

/// The EDID of a sink and what it is called. No bytes: no sink.
struct given_sink_t {
  std::string name;
  std::vector<u8> bytes;
};

class observation_t {
 public:
  /// Composes for the first port of @p options with the platform that is loaded, called @p platform_name.
  observation_t(const composition_options_t &options, given_sink_t sink, std::string platform_name,
                const line_listener_t &listener);

  bool is_composed() const { return composition_.is_composed; }
  const composition_t &composition() const { return composition_; }

  /// Refers to this observation.
  explained_t explained() const;

 private:
  const composition_options_t &options_;
  given_sink_t sink_;
  platform_places_t places_;
  composition_t composition_;
  std::optional<decoded_edid_t> decoded_sink_;  ///< As far as the composition has read it.
  sink_reading_t reading_;
};

}  // namespace edid_cli
