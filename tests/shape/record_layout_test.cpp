// The records' layout as C++ sees it, checked while this compiles; record_layout.c checks it as C.
#include "shape/record_layout.h"

#include <type_traits>

static_assert(std::is_same_v<u8, unsigned char>);
static_assert(sizeof(u16) == 2 && std::is_unsigned_v<u16>);
static_assert(sizeof(u32) == 4 && std::is_unsigned_v<u32>);
static_assert(sizeof(i32) == 4 && std::is_signed_v<i32>);
static_assert(std::is_trivial_v<edid_t> && std::is_standard_layout_v<edid_t>);
static_assert(std::is_trivial_v<platform_values_t> && std::is_standard_layout_v<platform_values_t>);
static_assert(std::is_trivial_v<compose_cfg_t> && std::is_standard_layout_v<compose_cfg_t>);
static_assert(std::is_trivial_v<hdmi2_t> && std::is_standard_layout_v<hdmi2_t>);
static_assert(std::is_trivial_v<hdmi2_values_t> && std::is_standard_layout_v<hdmi2_values_t>);
static_assert(std::is_trivial_v<compose_decision_t> && std::is_standard_layout_v<compose_decision_t>);
static_assert(std::is_same_v<decltype(compose_decision_t::code), u32>);
static_assert(std::is_same_v<decltype(compose_decision_t::position), i32>);
static_assert(std::is_same_v<decltype(compose_decision_t::value), i32[4]>);
static_assert(STEREO_FRAME_PACKING == 0x01 && STEREO_SIDE_BY_SIDE_HALF == 0x02 && STEREO_TOP_AND_BOTTOM == 0x04 &&
              STEREO_FIELD_ALTERNATIVE == 0x08 && STEREO_LINE_ALTERNATIVE == 0x10 && STEREO_SIDE_BY_SIDE_FULL == 0x20 &&
              STEREO_L_DEPTH == 0x40 && STEREO_L_DEPTH_GRAPHICS == 0x80);
