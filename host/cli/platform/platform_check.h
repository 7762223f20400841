// What a composition reads of the platform configuration that is loaded, what is wrong with it, and what comes of it.
#pragma once

#include <span>
#include <string>
#include <vector>

#include "platform/consequences.h"
#include "platform/finding.h"

namespace edid_cli {

/// One key, as a composition reads it.
struct key_reading_t {
  std::string key;
  std::string value;
  std::string default_value;
  std::string limits;
  position_t position;  ///< Of the key; without a line where the default is taken.
};

struct platform_check_t {
  std::vector<key_reading_t> readings;  ///< In the order of the file; what is not in it comes last.
  findings_t findings;                  ///< In the order of the file; what stands nowhere in it comes first.
};

/// Composes with these settings for no sink, for one that takes everything, and for the given ones. Prints what the
/// library has to say of formats and sinks.
platform_check_t check_platform(const compose_cfg_t &settings, std::span<const named_sink_t> sinks);

/// Puts findings into the order of the file.
void sort_findings(findings_t &findings);

}  // namespace edid_cli
