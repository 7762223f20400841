// What a composition starts from, at random: a sink of which it is known what it can do, a platform, settings.
#pragma once

#include "random_sink.h"
#include "support/platform_configuration.h"

namespace properties {

/// Everything that a composition is given.
struct situation_t {
  random_sink_t sink;
  test_support::platform_configuration_t platform;
  compose_cfg_t settings;
};

/// One in ten sinks is none at all.
situation_t random_situation(random_source_t &random);

}  // namespace properties
