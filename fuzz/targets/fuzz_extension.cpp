// Extensions of any length from 0 to that of the longest sink: byte 0 says what is mended, the rest is the extension.
#include "fuzz_input.h"
#include "fuzz_target.h"
#include "sink_bytes.h"

int LLVMFuzzerTestOneInput(const u8 *data, std::size_t size) {
  fuzz::fuzz_input_t input(data, size);
  const u8 options = input.byte();
  auto extension = input.rest(fuzz::longest_sink - fuzz::block_size);
  if ((options & 1) != 0 && extension.size >= fuzz::block_size) fuzz::mend_extension(extension.bytes.get());
  debug_enable((options & 2) != 0);

  edid_t edid;
  FUZZ_REQUIRE(edid_prepare(&edid) == 1);
  edid.valid = 1;
  decode_edid_extensions(extension.bytes.get(), extension.size, &edid);
  FUZZ_REQUIRE(edid.hdmi_vic_len <= 7);
  print_edid_struct(&edid, options & 4, "fuzz");
  FUZZ_REQUIRE(edid_destroy(&edid) == 1);
  return 0;
}
