// Whole compositions with HDMI 2: a caller's values and a sink from one input.
#include <array>
#include <cstring>

#include "fuzz_input.h"
#include "fuzz_target.h"
#include "sink_bytes.h"
#include "support/configuration_tree.h"
#include "support/observation.h"

namespace {

constexpr u32 edid_size = 256;

/// Mostly within the limits; members from "tmds_limit" on in their order.
hdmi2_values_t values_of(fuzz::fuzz_input_t *input) {
  hdmi2_values_t values{};
  values.size = sizeof values;
  hdmi2_values_init(&values);
  values.enable = 1;
  const auto fill = [input](i32(&list)[HDMI2_MOST_LISTED_VICS]) {
    for (u32 i = 0, count = input->byte() % (HDMI2_MOST_LISTED_VICS + 1); i < count; ++i)
      list[i] = input->byte();
  };
  fill(values.vic_priority_list);
  fill(values.vic_addition_list);
  values.tmds_limit = input->flag() ? 600 : 165 + 2 * input->byte();
  for (i32 *member = &values.preferred_extended; member <= &values.pass_freesync; ++member)
    *member = input->byte();
  for (i32 *member :
       {&values.y420, &values.dc_30bit_420, &values.dc_36bit_420, &values.allm, &values.vrr, &values.hdr_gamma,
        &values.hdr_pq, &values.hdr_hlg, &values.bt2020_rgb, &values.bt2020_ycc, &values.bt2020_cycc})
    *member %= 4;
  return values;
}

void require_named(const compose_decision_t *decision, void *) {
  FUZZ_REQUIRE(std::strcmp(compose_subject_string(decision->subject), "unknown") != 0);
  FUZZ_REQUIRE(std::strcmp(compose_reason_string(decision->reason), "unknown") != 0);
  FUZZ_REQUIRE(std::strcmp(compose_verdict_string(decision->verdict), "unknown") != 0);
}

void require_sound(const u8 *edid) {
  for (u32 block = 0; block < 2; ++block) {
    u32 sum = 0;
    for (u32 i = 0; i < fuzz::block_size; ++i)
      sum += edid[block * fuzz::block_size + i];
    FUZZ_REQUIRE(sum % 256 == 0);
  }
  FUZZ_REQUIRE(edid[126] == 1);
  FUZZ_REQUIRE(edid[130] <= 109);
  hdmi2_t hdmi2;
  hdmi2.size = sizeof hdmi2;
  FUZZ_REQUIRE(decode_hdmi2(edid, edid_size, &hdmi2));
  FUZZ_REQUIRE(hdmi2.video_capability_present == 1);
}

}  // namespace

int LLVMFuzzerTestOneInput(const u8 *data, std::size_t size) {
  fuzz::fuzz_input_t input(data, size);
  const u8 options = input.byte();
  debug_enable((options & 1) != 0);
  compose_cfg_t settings{};
  settings.audio_mask = 0xFFFFFFFF;
  settings.hdmi_3d_mode = options >> 1 & 3;
  test_support::configuration_tree_t tree;
  if ((options & 8) != 0) tree.fill_completely();
  const hdmi2_values_t values = values_of(&input);
  auto sink = input.rest(fuzz::longest_sink);
  if ((options & 16) != 0 && sink.size >= fuzz::block_size) fuzz::mend_base_block(sink.bytes.get());
  for (u32 at = fuzz::block_size; (options & 32) != 0 && at + fuzz::block_size <= sink.size; at += fuzz::block_size)
    fuzz::mend_extension(sink.bytes.get() + at);

  const auto composed = input.block(edid_size);
  if (!test_support::compose_observed({sink.bytes.get(), sink.size}, {composed.bytes.get(), edid_size}, &settings,
                                      nullptr, nullptr, nullptr, &values)) {
    return 0;
  }
  require_sound(composed.bytes.get());
  const auto again = input.block(edid_size);
  FUZZ_REQUIRE(test_support::compose_observed({sink.bytes.get(), sink.size}, {again.bytes.get(), edid_size}, &settings,
                                              nullptr, require_named, nullptr, &values));
  FUZZ_REQUIRE(std::memcmp(composed.bytes.get(), again.bytes.get(), edid_size) == 0);
  return 0;
}
