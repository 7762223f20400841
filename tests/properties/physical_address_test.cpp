// The physical address in the composed bytes, for every address that a sink can have.
#include <array>

#include "composing_fixture.h"

namespace properties {
namespace {

using address_t = std::array<u8, 4>;

constexpr address_t no_address{15, 15, 15, 15};
constexpr std::size_t address_in_sink = 128 + 4 + 4;  // Behind the extension's header and the block's OUI.

address_t address_of(u32 packed) {
  return {static_cast<u8>(packed >> 12 & 15), static_cast<u8>(packed >> 8 & 15), static_cast<u8>(packed >> 4 & 15),
          static_cast<u8>(packed & 15)};
}

/// The input's number takes the place of the first 0 of an address that begins with something else; nothing follows it.
/// Of a number that has more than four bits the low ones are left.
address_t address_of_input(const address_t &sink, u32 port) {
  const auto nibble = static_cast<u8>((port + 1) & 15);
  const auto [a, b, c, d] = sink;
  if (a == 0) return no_address;
  if (b == 0) return {a, nibble, 0, 0};
  if (c == 0) return {a, b, nibble, 0};
  if (d == 0) return {a, b, c, nibble};
  return no_address;
}

class PhysicalAddressOfInput : public testing::TestWithParam<u32> {};

TEST_P(PhysicalAddressOfInput, FollowsFromEachOfTheSinks65536) {
  test_support::platform_configuration_t platform;
  platform.video_60_priority = platform.video_60_additional = {{16, 0}, {4, 0}, {5, 0}, {2, 0}};
  values_of_t values(platform);
  const u32 port = GetParam();
  compose_cfg_t settings = test_support::plain_settings();
  settings.port = port;
  u8 spa_offset = 0;
  settings.spa_offset = &spa_offset;
  test_support::bytes_t sink =
      test_support::join(test_support::base_block_builder_t().extensions(1).build(),
                         test_support::extension_builder_t().block(test_support::hdmi_block({0, 0})).build());
  test_support::bytes_t bytes(256);
  std::vector<u32> wrong;
  const std::string output = test_support::raw_output_of([&] {
    for (u32 packed = 0; packed <= 0xFFFF && wrong.size() < 10; ++packed) {
      sink[address_in_sink] = static_cast<u8>(packed >> 8);
      sink[address_in_sink + 1] = static_cast<u8>(packed & 0xFF);
      test_support::mend_checksum(sink, 128);
      const bool composed = compose_edid_internal(sink.data(), 256, bytes.data(), 256, &settings, values.get());
      const address_t address = address_of(bytes[spa_offset] * 256u + bytes[spa_offset + 1u]);
      if (!composed || address != address_of_input(address_of(packed), port)) wrong.push_back(packed);
    }
  });
  EXPECT_EQ(wrong, std::vector<u32>{});
  EXPECT_EQ(output, "");
}

INSTANTIATE_TEST_SUITE_P(Ports, PhysicalAddressOfInput, testing::Values(0u, 3u, 14u, 300u));

}  // namespace
}  // namespace properties
