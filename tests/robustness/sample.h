// A sink and a platform with entries in every list, and the same with something missing.
#pragma once

#include <array>
#include <string>
#include <vector>

#include "support/composition.h"
#include "support/platform_configuration.h"

namespace robustness {

/// A television. Where decoding it stops early, its parts tell what it then is.
struct sample_sink_t {
  std::vector<std::array<u8, 2>> std_timings;
  std::vector<u32> base_timings;       ///< VICs of the base block's detailed timings, two at most.
  std::vector<u32> extension_timings;  ///< VICs of the extension's detailed timings; 0 is one that is left out.
  std::vector<u8> video;               ///< Short video descriptors.
  test_support::bytes_t audio;         ///< Short audio descriptors.
  /// The HDMI vendor-specific data block, from the physical address on.
  test_support::bytes_t hdmi{0x10, 0x00, 0xB8, 45, 0x80, 11, 6};

  /// Where decoding stops with a failure of the block; what comes after is not decoded.
  enum class end_t { none, behind_std_timings, behind_base_timings, behind_video, behind_audio };
  end_t end = end_t::none;

  test_support::bytes_t build() const;
};

/// A 60 Hz sink whose decoding prints nothing but traces.
sample_sink_t rich_sink();

/// A configuration for it that prints nothing but traces, and offers at least four modes without a sink as well.
test_support::platform_configuration_t rich_configuration();

/// Settings that go with both: the current mode is one of the sink's.
compose_cfg_t rich_settings();

/// What a composition comes to, in words: refused, or its bytes. Also tells when something around them was touched.
std::string words_of(const test_support::composition_t &composition);

}  // namespace robustness
