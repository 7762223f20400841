// Texts of platform values that fill their fields to the last byte, so that no NUL ends them.
#include <gtest/gtest.h>

#include <cstring>
#include <string>

#include "support/composition.h"
#include "support/output_capture.h"
#include "support/records.h"

namespace robustness {
namespace {

class FullTextFields : public testing::Test {
 protected:
  FullTextFields() {
    // Behind each of the three stands another text, so that a copy or a print that goes on finds no end soon.
    std::memcpy(values_->manufacturer_id, "ABCD", 4);
    std::memcpy(values_->monitor_name, "Name of 14 byt", 14);
    std::memcpy(values_->monitor_serial, "Serial numbers", 14);
    values_->established_timings_1 = 0xFF;
    values_->established_timings_2 = 0xFF;
    values_->product_id = 0x1234;
    values_->serial = 0x01020304;
    test_support::append_modes(values_->video_60_priority, {{16, 0}, {4, 0}, {5, 0}, {2, 0}});
    test_support::append_modes(values_->video_60_additional, {{16, 0}, {4, 0}, {5, 0}, {2, 0}});
  }

  test_support::scoped_values_t values_;
};

TEST_F(FullTextFields, AreTracedToTheirEnd) {
  const std::string output =
      test_support::traced_output_of([&] { test_support::compose({}, test_support::plain_settings(), values_.get()); });
  const std::string expected = test_support::trace_line("_populate_new_edid", "\tManufacturer ID = ABCD") +
                               test_support::trace_line("_populate_new_edid", "\tMonitor Name    = Name of 14 byt");
  EXPECT_EQ(test_support::count_of(output, expected), 1) << output;
}

TEST_F(FullTextFields, AreEncodedAsThreeLettersAndThirteenCharacters) {
  test_support::composition_t composition;
  EXPECT_EQ(test_support::raw_output_of(
                [&] { composition = test_support::compose({}, test_support::plain_settings(), values_.get()); }),
            "");
  ASSERT_TRUE(composition.result);
  EXPECT_TRUE(composition.rest_untouched);
  const auto part = [&](std::ptrdiff_t offset, std::ptrdiff_t size) {
    const auto begin = composition.bytes.begin() + offset;
    return test_support::bytes_t(begin, begin + size);
  };
  // A, B and C in five bits each, and the product code.
  EXPECT_EQ(part(8, 4), (test_support::bytes_t{0x04, 0x43, 0x34, 0x12}));
  EXPECT_EQ(part(90, 18), test_support::text_descriptor(0xFC, "Name of 14 by"));
  const std::ptrdiff_t timing = 128 + composition.bytes[130];
  EXPECT_EQ(part(timing + 18, 18), test_support::text_descriptor(0xFF, "Serial number"));
}

}  // namespace
}  // namespace robustness
