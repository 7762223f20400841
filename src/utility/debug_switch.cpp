#include <atomic>

#include "edid_composer.h"

namespace {

// Atomic so that a host may switch tracing while another thread composes. No order is needed with anything else.
constinit std::atomic<u8> g_debug_enabled{0};

}  // namespace

void debug_enable(bool enable) {
  g_debug_enabled.store(enable ? 1 : 0, std::memory_order_relaxed);
}

bool debug_enabled(void) {
  return g_debug_enabled.load(std::memory_order_relaxed) != 0;
}
