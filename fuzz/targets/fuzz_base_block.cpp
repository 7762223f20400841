// Base blocks: byte 0 says what is mended, then follow the 128 bytes of the block.
#include "fuzz_input.h"
#include "fuzz_target.h"
#include "sink_bytes.h"

int LLVMFuzzerTestOneInput(const u8 *data, std::size_t size) {
  fuzz::fuzz_input_t input(data, size);
  const u8 options = input.byte();
  auto block = input.block(fuzz::block_size);
  if ((options & 1) != 0) fuzz::mend_base_block(block.bytes.get());
  debug_enable((options & 2) != 0);

  edid_t edid;
  FUZZ_REQUIRE(edid_prepare(&edid) == 1);
  const u8 decoded = decode_edid_block_0(block.bytes.get(), &edid);
  FUZZ_REQUIRE(decoded == 0 || edid.valid == 1);
  FUZZ_REQUIRE(ll_size(&edid.std_timings) <= 8 && ll_size(&edid.dtd_list) <= 4);
  FUZZ_REQUIRE(ll_size(&edid.video_list) == 0 && ll_size(&edid.audio_list) == 0);
  print_edid_struct(&edid, options & 4, "fuzz");
  FUZZ_REQUIRE(edid_destroy(&edid) == 1);
  return 0;
}
