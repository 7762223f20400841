// The luminance codes, against floating point.
#include "edid_composer/hdmi2/codec/luminance.h"

#include <gtest/gtest.h>

#include <cmath>

namespace hdmi2_test {
namespace {

long double exact_maximum(u32 code) {
  return 50 * std::exp2(static_cast<long double>(code) / 32);
}

/// To the nearest unit, or one beside it where floating point can't tell which is nearer.
void expect_nearest(u32 actual, long double exact) {
  EXPECT_LE(std::abs(static_cast<long double>(actual) - exact), 0.5L + 1e-6L);
}

}  // namespace

TEST(Luminance, OfTheMaximumIsToTheNearestHundredth) {
  for (u32 code = 0; code < 256; ++code) {
    SCOPED_TRACE(code);
    expect_nearest(edid_composer::maximum_luminance(static_cast<u8>(code)), 100 * exact_maximum(code));
  }
  EXPECT_EQ(edid_composer::maximum_luminance(0), 5000u);
  EXPECT_EQ(edid_composer::maximum_luminance(96), 40000u);
  EXPECT_EQ(edid_composer::maximum_luminance(115), 60367u);
  EXPECT_EQ(edid_composer::maximum_luminance(255), 1252572u);
}

TEST(Luminance, OfTheMinimumIsToTheNearestTenThousandth) {
  for (u32 maximum = 0; maximum < 256; ++maximum) {
    for (u32 code = 0; code < 256; ++code) {
      const long double part = static_cast<long double>(code) / 255;
      SCOPED_TRACE(std::to_string(maximum) + ", " + std::to_string(code));
      expect_nearest(edid_composer::minimum_luminance(static_cast<u8>(maximum), static_cast<u8>(code)),
                     10000 * exact_maximum(maximum) * part * part / 100);
    }
  }
  EXPECT_EQ(edid_composer::minimum_luminance(115, 18), 301u);
}

}  // namespace hdmi2_test
