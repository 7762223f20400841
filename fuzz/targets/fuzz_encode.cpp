// Arbitrary records to the encoder.
#include "fuzz_input.h"
#include "fuzz_target.h"

namespace {

template <typename record_t>
record_t *add(ll_list_t *list, const char *type) {
  ll_entry_t *entry = nullptr;
  void *payload = nullptr;
  FUZZ_REQUIRE(ll_create_entry(static_cast<i32>(sizeof(record_t)), &entry, &payload, type));
  FUZZ_REQUIRE(ll_add_entry_to_back(list, entry));
  return static_cast<record_t *>(payload);
}

/// Fills everything before, between and after the four lists.
void fill_scalars(fuzz::fuzz_input_t *input, edid_t *edid) {
  auto *const begin = reinterpret_cast<u8 *>(edid);
  const auto fill = [&](const void *from, const void *to) {
    for (auto *byte = begin + (static_cast<const u8 *>(from) - begin); byte != to; ++byte)
      *byte = input->byte();
  };
  fill(edid, &edid->std_timings);
  fill(&edid->dtd_list + 1, &edid->video_list);
  fill(&edid->audio_list + 1, edid + 1);
}

void fill_lists(fuzz::fuzz_input_t *input, edid_t *edid) {
  for (u32 count = input->below(12); count > 0; --count) {
    *add<std_timing_t>(&edid->std_timings, "std_timing_t") = {input->number(), input->number(), input->number()};
  }
  for (u32 count = input->below(5); count > 0; --count) {
    auto *const timing = add<detailed_timing_t>(&edid->dtd_list, "detailed_timing_t");
    if (input->flag()) {
      convert_vic_to_dtd(1 + input->below(64), timing);
    } else {
      for (u32 i = 0; i < sizeof *timing; ++i)
        reinterpret_cast<u8 *>(timing)[i] = input->byte();
    }
  }
  for (u32 count = input->below(48); count > 0; --count) {
    *add<short_video_desc_t>(&edid->video_list, "short_video_desc_t") = {input->byte(), input->number(),
                                                                         input->number()};
  }
  for (u32 count = input->below(14); count > 0; --count) {
    auto *const audio = add<short_audio_desc_t>(&edid->audio_list, "short_audio_desc_t");
    audio->type = input->flag() ? 1 + input->below(18) : input->number();
    audio->channels = input->number();
    audio->frequencies = input->number();
    audio->pcm_bits = input->number();
    audio->max_bitrate = input->number();
    audio->value = input->number();
    audio->wma_profile = input->number();
  }
}

}  // namespace

int LLVMFuzzerTestOneInput(const u8 *data, std::size_t size) {
  constexpr u32 edid_size = 256;
  fuzz::fuzz_input_t input(data, size);
  const u8 options = input.byte();
  debug_enable((options & 1) != 0);
  platform_values_t values{};
  values.native_bit = options & 2;
  edid_t edid;
  FUZZ_REQUIRE(edid_prepare(&edid) == 1);
  fill_lists(&input, &edid);
  fill_scalars(&input, &edid);

  const auto encoded = input.block(edid_size);
  u8 spa_offset = 0;
  if (encode_edid(encoded.bytes.get(), edid_size, &edid, &spa_offset, &values) == 1) {
    u32 sum = 0;
    for (u32 i = edid_size / 2; i < edid_size; ++i)
      sum += encoded.bytes[i];
    FUZZ_REQUIRE(sum % 256 == 0);
    print_edid(encoded.bytes.get(), edid_size, 0, "encoded");
  }
  print_edid_struct(&edid, options & 4, "record");
  FUZZ_REQUIRE(edid_destroy(&edid) == 1);
  return 0;
}
