// A composition as one request, and its lines as the callback receives them.
#pragma once

#include <functional>
#include <string>

#include "support/edid_builder.h"

namespace test_support {

/// A request and a result of this version's sizes, and what they point to. Not to be copied.
struct request_t {
  request_t(const bytes_t &sink_bytes, const compose_cfg_t &cfg, const platform_values_t *values);
  request_t(const request_t &) = delete;
  request_t &operator=(const request_t &) = delete;

  bool compose() { return compose_edid_request(&request, &result); }
  /// Composes with a callback, which keeps each line in @ref lines and then calls @p also.
  bool compose_logged(const std::function<void(const compose_log_line_t &)> &also = nullptr);

  bytes_t sink;
  compose_cfg_t settings;
  u8 spa_offset = 0xA5;
  bytes_t new_edid = bytes_t(256, 0xA5);
  std::string lines;  ///< Rendered as standard output has them.
  compose_request_t request{};
  compose_result_t result{};
};

/// A line as it would stand on standard output, newline included.
std::string rendered(const compose_log_line_t &line);

}  // namespace test_support
