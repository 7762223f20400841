// The operations whose cost is measured, each on one sink, and what sinks are composed for.
#pragma once

#include <span>
#include <string_view>

#include "edid_composer.h"

namespace bench {

/// The default platform, as the configuration store holds it and as values that were read beforehand.
class platform_t {
 public:
  /// Throws std::runtime_error when the store refuses the default platform.
  platform_t();
  ~platform_t();
  platform_t(const platform_t &) = delete;
  platform_t &operator=(const platform_t &) = delete;

  platform_values_t values;
  compose_cfg_t settings{};
};

/// Limits the height of modes and offers the formats of both sides: each costs time by itself for every entry.
void make_heaviest(platform_t *platform);

using sink_bytes_t = std::span<const u8>;

/// Decodes a sink that has an extension and destroys the record. False when one of its blocks is refused.
bool decode(sink_bytes_t sink);

struct operation_t {
  const char *name;
  void (*run)(sink_bytes_t sink, const platform_t &platform);
};

extern const std::span<const operation_t> operations;

/// The one of that name. Throws std::out_of_range when there is none.
const operation_t &operation_named(std::string_view name);

}  // namespace bench
