#include "support/composition.h"

#include <algorithm>

#include "support/memory_image.h"

namespace test_support {
namespace {

constexpr std::ptrdiff_t edid_size = 256;
constexpr std::ptrdiff_t margin = 64;
constexpr u8 canary = 0xA5;

bool all_canaries(bytes_t::const_iterator begin, bytes_t::const_iterator end) {
  return std::all_of(begin, end, [](u8 byte) { return byte == canary; });
}

std::string image_of_values(const platform_values_t *values) {
  return values == nullptr ? "" : image_of_all(*values);
}

}  // namespace

composition_t compose(const bytes_t &sink, compose_cfg_t cfg, const platform_values_t *values) {
  bytes_t memory(margin + edid_size + margin, canary);
  bytes_t offset{canary, canary, canary};
  cfg.spa_offset = offset.data() + 1;
  // As long as it claims, so that a sanitizer sees any read after it.
  const bytes_t sink_before(sink);
  const bytes_t exact_sink(sink);
  const std::string cfg_before = image_of(cfg);
  const std::string values_before = image_of_values(values);

  composition_t composition;
  composition.result =
      compose_edid_internal(exact_sink.empty() ? nullptr : exact_sink.data(), static_cast<u32>(exact_sink.size()),
                            memory.data() + margin, edid_size, &cfg, values);
  const auto begin = memory.cbegin() + margin;
  composition.bytes.assign(begin, begin + edid_size);
  composition.spa_offset = offset[1];
  composition.rest_untouched = all_canaries(memory.cbegin(), begin) && all_canaries(begin + edid_size, memory.cend()) &&
                               offset[0] == canary && offset[2] == canary && exact_sink == sink_before &&
                               image_of(cfg) == cfg_before && image_of_values(values) == values_before;
  return composition;
}

}  // namespace test_support
