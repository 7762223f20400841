#include "edid_composer/hdmi2/codec/luminance.h"

namespace edid_composer {
namespace {

using u64 = unsigned long long;

constexpr u64 base_luminance = 50;
constexpr u32 steps_per_octave = 32;

/// 2^(step / 32) with 30 bits after the point.
constexpr u32 fraction_bits = 30;
constexpr u32 powers[steps_per_octave] = {
    0x40000000, 0x4166C34C, 0x42D561B4, 0x444C0740, 0x45CAE0F2, 0x47521CC6, 0x48E1E9BA, 0x4A7A77D4,
    0x4C1BF829, 0x4DC69CDD, 0x4F7A9930, 0x51382182, 0x52FF6B55, 0x54D0AD5A, 0x56AC1F75, 0x5891FAC1,
    0x5A82799A, 0x5C7DD7A4, 0x5E8451D0, 0x60962665, 0x62B39509, 0x64DCDEC3, 0x6712460B, 0x69540EC9,
    0x6BA27E65, 0x6DFDDBCC, 0x70666F76, 0x72DC8374, 0x75606374, 0x77F25CCE, 0x7A92BE8B, 0x7D41D96E,
};

/// cd/m2, with 30 bits after the point; less than 2^44.
constexpr u64 luminance(u8 code) {
  return base_luminance * powers[code % steps_per_octave] << code / steps_per_octave;
}

}  // namespace

u32 maximum_luminance(u8 code) {
  constexpr u64 half = u64{1} << (fraction_bits - 1);
  return static_cast<u32>((luminance(code) * maximum_luminance_units + half) >> fraction_bits);
}

u32 minimum_luminance(u8 maximum_code, u8 code) {
  // 10000 / (255^2 x 100) in lowest terms, so that the product stays below 2^64.
  constexpr u64 numerator = 4;
  constexpr u64 denominator = 2601;
  static_assert(numerator * 255 * 255 * 100 == denominator * minimum_luminance_units);
  constexpr u64 divisor = denominator << fraction_bits;
  return static_cast<u32>((luminance(maximum_code) * code * code * numerator + divisor / 2) / divisor);
}

}  // namespace edid_composer
