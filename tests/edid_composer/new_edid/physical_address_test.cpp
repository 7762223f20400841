// The physical address that a new EDID carries: the sink's, extended by the input's port.
#include "edid_composer/new_edid/physical_address.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <array>
#include <string>

#include "edid_composer/composer_lines.h"
#include "support/output_capture.h"
#include "support/records.h"

namespace {

using composer_lines::trace;

using address_t = std::array<u8, 4>;

constexpr address_t no_address{15, 15, 15, 15};

class PhysicalAddress : public testing::Test {
 protected:
  PhysicalAddress() { sink_->hdmi_present = 1; }
  void sink_at(const address_t &address) { std::copy(address.begin(), address.end(), sink_->physical_address); }
  void port(u32 counted_from_1) { cfg_.port = counted_from_1 - 1; }
  address_t address() {
    const auto placed = edid_composer::place_input({*sink_.get(), *values_.get(), cfg_, nullptr});
    return std::to_array(placed.parts);
  }
  /// The address, and the one line that explains it.
  address_t explained(const std::string &message) {
    address_t placed{};
    EXPECT_EQ(test_support::traced_output_of([&] { placed = address(); }), trace("_populate_new_edid", message));
    return placed;
  }

  test_support::scoped_edid_t sink_;
  test_support::scoped_values_t values_;
  compose_cfg_t cfg_ = test_support::plain_settings();
};

// CEC: each level of the tree appends its input at the first zero.
address_t expected_address(const address_t &sink, u8 port) {
  if (sink[0] == 0) return no_address;
  address_t result = sink;
  for (u8 &component : result) {
    if (component != 0) continue;
    component = port;
    // What stands after the first zero is replaced by zeros.
    for (u8 *rest = &component + 1; rest != result.data() + 4; ++rest)
      *rest = 0;
    return result;
  }
  return no_address;
}

class PhysicalAddressOfPort : public PhysicalAddress, public testing::WithParamInterface<u8> {};

TEST_P(PhysicalAddressOfPort, FollowsFromEachOfTheSinks65536) {
  port(GetParam());
  u32 wrong = 0;
  for (u32 packed = 0; packed <= 0xFFFF && wrong < 10; ++packed) {
    const address_t sink{static_cast<u8>(packed >> 12), static_cast<u8>(packed >> 8 & 15),
                         static_cast<u8>(packed >> 4 & 15), static_cast<u8>(packed & 15)};
    sink_at(sink);
    const address_t placed = address();
    if (placed == expected_address(sink, GetParam())) continue;
    ++wrong;
    ADD_FAILURE() << std::hex << "sink 0x" << packed << ": " << int{placed[0]} << '.' << int{placed[1]} << '.'
                  << int{placed[2]} << '.' << int{placed[3]};
  }
}

INSTANTIATE_TEST_SUITE_P(Ports, PhysicalAddressOfPort, testing::Values(u8{1}, u8{3}, u8{15}));

TEST_F(PhysicalAddress, KeepsAPortOfAnySize) {
  // Which the encoder cuts to a nibble.
  sink_at({1, 0, 0, 0});
  for (const u8 kept : {u8{0}, u8{16}, u8{255}}) {
    port(kept + 256U);
    EXPECT_EQ(address(), (address_t{1, kept, 0, 0}));
  }
}

TEST_F(PhysicalAddress, OfATelevisionIsItsPortWhateverTheSinkSays) {
  values_->is_tv = 1;
  port(2);
  sink_at({1, 2, 3, 4});
  EXPECT_EQ(explained("\tIs a TV. Using root node. Address:2.0.0.0"), (address_t{2, 0, 0, 0}));
  sink_->hdmi_present = 0;
  values_->is_tv = -1;
  EXPECT_EQ(explained("\tIs a TV. Using root node. Address:2.0.0.0"), (address_t{2, 0, 0, 0}));
}

TEST_F(PhysicalAddress, IsNoneWithoutAnHdmiSink) {
  sink_at({1, 0, 0, 0});
  sink_->hdmi_present = 0;
  EXPECT_EQ(explained("\tNo hdmi specific downstream EDID available. Setting SPA to f.f.f.f"), no_address);
}

TEST_F(PhysicalAddress, IsNoneBelowASinkWithoutOne) {
  sink_at({0, 1, 2, 3});
  EXPECT_EQ(explained("\tInvalid downstream EDID SPA starts with 0. Recieved:0.1.2.3"), no_address);
}

TEST_F(PhysicalAddress, IsNoneWhereThereIsNoRoom) {
  sink_at({1, 2, 3, 4});
  EXPECT_EQ(explained("\tInvalid downstream EDID SPA starts with no room. Recieved: 1.2.3.4"), no_address);
  sink_at({15, 15, 15, 15});
  EXPECT_EQ(explained("\tInvalid downstream EDID SPA starts with no room. Recieved: 15.15.15.15"), no_address);
}

TEST_F(PhysicalAddress, AppendsThePortAtTheFirstZero) {
  port(3);
  sink_at({1, 0, 0, 0});
  EXPECT_EQ(explained("\tSetting address.b with port:3 Address:1.3.0.0"), (address_t{1, 3, 0, 0}));
  sink_at({1, 2, 0, 0});
  EXPECT_EQ(explained("\tSetting address.c with port:3 Address:1.2.3.0"), (address_t{1, 2, 3, 0}));
  sink_at({1, 2, 9, 0});
  EXPECT_EQ(explained("\tSetting address.d with port:3 Address:1.2.9.3"), (address_t{1, 2, 9, 3}));
}

TEST_F(PhysicalAddress, DropsWhatStandsBehindAZero) {
  sink_at({1, 0, 5, 6});
  EXPECT_EQ(explained("\tSetting address.b with port:1 Address:1.1.0.0"), (address_t{1, 1, 0, 0}));
  sink_at({1, 2, 0, 6});
  EXPECT_EQ(explained("\tSetting address.c with port:1 Address:1.2.1.0"), (address_t{1, 2, 1, 0}));
}

}  // namespace
