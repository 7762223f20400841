// Explanations of a composition for any sink: the JSON document is one, the page ends, each mode has an answer.
#include <nlohmann/json.hpp>
#include <string>
#include <vector>

#include "config_store.h"
#include "explain/answer.h"
#include "explain/explanation_json.h"
#include "explain/explanation_page.h"
#include "explain/explanation_text.h"
#include "fuzz_input.h"
#include "fuzz_target.h"
#include "sink_bytes.h"

int LLVMFuzzerTestOneInput(const u8 *data, std::size_t size) {
  if (!config_store_load_default()) return 0;
  const edid_cli::platform_places_t places("default platform");
  fuzz::fuzz_input_t input(data, size);
  const u8 mended = input.byte();
  edid_cli::composition_options_t options;
  options.settings.audio_mask = input.flag() ? edid_cli::all_audio_formats : input.number();
  options.settings.audio_sink_filter = input.below(2);
  options.settings.hdmi_3d_mode = static_cast<i32>(input.below(3));
  auto bytes = input.rest(fuzz::longest_sink);
  if ((mended & 1) != 0 && bytes.size >= fuzz::block_size) fuzz::mend_base_block(bytes.bytes.get());
  if ((mended & 2) != 0 && bytes.size >= 2 * fuzz::block_size) {
    fuzz::mend_extension(bytes.bytes.get() + fuzz::block_size);
  }
  const std::vector<u8> sink(bytes.bytes.get(), bytes.bytes.get() + bytes.size / fuzz::block_size * fuzz::block_size);

  const auto unheard = [](const compose_log_line_t &) {};
  const edid_cli::composition_t composition = edid_cli::compose(options, 0, sink, unheard, edid_cli::decisions_t::kept);
  if (!composition.is_composed) return 0;
  const edid_cli::decoded_edid_t decoded(sink.empty() ? std::vector<u8>(fuzz::block_size) : sink);
  const edid_cli::sink_reading_t reading = edid_cli::sink_reading(sink, composition);
  const edid_cli::explained_t explained{composition, sink, decoded.record(), "fuzz.bin", reading, places, options};
  const edid_cli::explanation_t explanation = edid_cli::explanation_of(explained);
  FUZZ_REQUIRE(nlohmann::json::accept(edid_cli::explanation_json(explanation)));
  FUZZ_REQUIRE(edid_cli::explanation_page(explanation).ends_with("</html>\n"));
  FUZZ_REQUIRE(!edid_cli::explanation_text(explanation, edid_cli::table_width_t::narrow).empty());
  const u32 vic = 1 + (mended >> 2);
  const edid_cli::answers_t answers = edid_cli::answers_to({{COMPOSE_SUBJECT_VIDEO_MODE, vic}}, explained);
  const edid_cli::answer_t &answer = answers.answers.front();
  FUZZ_REQUIRE(!answer.reasons.empty());
  FUZZ_REQUIRE(answer.is_offered == (answer.ways.empty() && answer.no_way.empty()));
  return 0;
}
