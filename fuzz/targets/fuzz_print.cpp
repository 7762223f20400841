// Whole EDIDs to the printer: byte 0 says what is mended, the rest is the EDID.
#include "fuzz_input.h"
#include "fuzz_target.h"
#include "sink_bytes.h"

int LLVMFuzzerTestOneInput(const u8 *data, std::size_t size) {
  fuzz::fuzz_input_t input(data, size);
  const u8 options = input.byte();
  auto edid = input.rest(fuzz::longest_sink);
  // The base block must be there whatever the size says.
  if (edid.size < fuzz::block_size) edid = input.block(fuzz::block_size);
  if ((options & 1) != 0) fuzz::mend_base_block(edid.bytes.get());
  if ((options & 2) != 0 && edid.size >= 2 * fuzz::block_size) {
    fuzz::mend_extension(edid.bytes.get() + fuzz::block_size);
  }
  debug_enable((options & 4) != 0);
  // Mostly sizes that the printer takes.
  const u32 whole_blocks = edid.size - edid.size % fuzz::block_size;
  print_edid(edid.bytes.get(), (options & 8) != 0 ? edid.size : whole_blocks, options & 16, "fuzz");
  print_edid_audio_mask(input.number());
  return 0;
}
