#include "composition.h"

#include <gtest/gtest.h>

#include "support/composition.h"
#include "support/edid_builder.h"
#include "support/output_capture.h"

namespace end_to_end {

composition_t compose(const std::vector<u8> &sink, const compose_cfg_t &cfg, const platform_values_t *values,
                      bool traced) {
  test_support::composition_t composition;
  const auto action = [&] { composition = test_support::compose(sink, cfg, values); };
  const std::string output = traced ? test_support::traced_output_of(action) : test_support::output_of(action);
  EXPECT_TRUE(composition.rest_untouched);
  return {composition.result, composition.bytes, composition.spa_offset, output};
}

void expect_valid_edid(const std::vector<u8> &edid) {
  ASSERT_EQ(edid.size(), 256U);
  EXPECT_EQ(test_support::block_sum(edid.data()), 0);
  EXPECT_EQ(test_support::block_sum(edid.data() + 128), 0);
  EXPECT_EQ(std::vector<u8>(edid.begin(), edid.begin() + 8),
            (std::vector<u8>{0x00, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 0x00}));
  EXPECT_EQ(edid[128], 0x02);
  EXPECT_EQ(edid[129], 0x03);
}

}  // namespace end_to_end
