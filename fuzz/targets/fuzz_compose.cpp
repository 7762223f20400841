// Whole compositions: settings, a configuration tree and a sink from one input.
#include <array>
#include <string>

#include "fuzz_input.h"
#include "fuzz_target.h"
#include "sink_bytes.h"
#include "support/configuration_keys.h"
#include "support/configuration_tree.h"
#include "support/observation.h"

namespace {

bool is_scalar(const configuration_key_t &key) {
  return key.kind == CONFIGURATION_INTEGER || key.kind == CONFIGURATION_UNSIGNED || key.kind == CONFIGURATION_TEXT;
}

bool is_list(const configuration_key_t &key) {
  return !is_scalar(key) && key.kind != CONFIGURATION_AUDIO_FORMATS;
}

/// The many entries that a valid configuration has, before the fuzzer's own.
void add_modes(fuzz::fuzz_input_t *input, test_support::configuration_tree_t *tree) {
  constexpr std::array<const char *, 5> flags = {"", " FP", " FP TBH", " SBSH", " FP TBH SBSH"};
  for (u32 count = input->below(48); count > 0; --count) {
    const std::string mode = std::to_string(1 + input->below(64)) + flags[input->below(flags.size())];
    tree->add(input->flag() ? "60_hz_priority_list" : "50_hz_priority_list", mode);
    tree->add(input->flag() ? "60_hz_addition_list" : "50_hz_addition_list", mode);
  }
  for (u32 count = input->below(27); count > 0; --count) {
    tree->set(std::string("audio.entry_") + static_cast<char>('a' + count - 1), input->number() & 0xFFFFFF);
  }
}

void add_anything(fuzz::fuzz_input_t *input, test_support::configuration_tree_t *tree) {
  static const auto lists = test_support::configuration_keys(is_list);
  static const auto scalars = test_support::configuration_keys(is_scalar);
  for (u32 count = input->below(40); count > 0; --count) {
    const bool in_list = input->flag();
    const bool is_text = input->flag();
    const auto &keys = in_list ? lists : scalars;
    const std::string key = keys[input->below(static_cast<u32>(keys.size()))]->name;
    if (in_list && is_text) {
      tree->add(key, input->text(40));
    } else if (in_list) {
      tree->add(key, static_cast<i32>(input->flag() ? input->below(9) : input->number()));
    } else if (is_text) {
      tree->set(key, input->text(40));
    } else {
      tree->set(key, static_cast<i32>(input->flag() ? input->below(3) : input->number()));
    }
  }
}

compose_cfg_t settings(fuzz::fuzz_input_t *input, u8 *spa_offset) {
  constexpr std::array<video_mode_t, 4> modes = {
      video_mode_t{1920, 1080, 0, 60}, {1920, 1080, 1, 50}, {720, 480, 1, 60}, {1366, 768, 0, 60}};
  compose_cfg_t cfg{};
  cfg.hdmi_current_mode = modes[input->below(modes.size())];
  cfg.audio_mask = input->flag() ? 0xFFFFFFFF : input->number();
  cfg.audio_sink_filter = input->below(3);
  cfg.hdmi_3d_mode = static_cast<i32>(input->below(4)) - 1;
  for (u32 &latency : cfg.edid_latency)
    latency = input->flag() ? input->below(600) : input->number();
  cfg.spa_offset = spa_offset;
  cfg.port = input->flag() ? input->below(15) : input->number();
  return cfg;
}

}  // namespace

int LLVMFuzzerTestOneInput(const u8 *data, std::size_t size) {
  constexpr u32 edid_size = 256;
  fuzz::fuzz_input_t input(data, size);
  const u8 options = input.byte();
  debug_enable((options & 1) != 0);
  u8 spa_offset = 0;
  const compose_cfg_t cfg = settings(&input, (options & 2) != 0 ? &spa_offset : nullptr);
  test_support::configuration_tree_t tree;
  if ((options & 4) != 0) tree.fill_completely();
  if ((options & 8) != 0) add_modes(&input, &tree);
  add_anything(&input, &tree);
  auto sink = input.rest(fuzz::longest_sink);
  if ((options & 16) != 0 && sink.size >= fuzz::block_size) fuzz::mend_base_block(sink.bytes.get());
  if ((options & 32) != 0 && sink.size >= 2 * fuzz::block_size) {
    fuzz::mend_extension(sink.bytes.get() + fuzz::block_size);
  }

  const auto composed = input.block(edid_size);
  if (!compose_edid(sink.bytes.get(), sink.size, composed.bytes.get(), edid_size, &cfg)) return 0;
  u32 sum = 0;
  for (u32 i = fuzz::block_size; i < edid_size; ++i)
    sum += composed.bytes[i];
  FUZZ_REQUIRE(sum % 256 == 0);
  if (cfg.spa_offset != nullptr) FUZZ_REQUIRE(spa_offset > fuzz::block_size && spa_offset < edid_size - 2);

  // An observer changes nothing, and is told things that it can name.
  const compose_observer_t observer = [](const compose_decision_t *decision, void *) {
    FUZZ_REQUIRE(std::strcmp(compose_reason_string(decision->reason), "unknown") != 0);
    FUZZ_REQUIRE(std::strcmp(compose_verdict_string(decision->verdict), "unknown") != 0);
  };
  const auto again = input.block(edid_size);
  FUZZ_REQUIRE(test_support::compose_observed({sink.bytes.get(), sink.size}, {again.bytes.get(), edid_size}, &cfg,
                                              nullptr, observer, nullptr));
  FUZZ_REQUIRE(std::memcmp(composed.bytes.get(), again.bytes.get(), edid_size) == 0);
  return 0;
}
