#include "platforms.h"

#include <cstring>
#include <stdexcept>
#include <string>

#include "config_store.h"

namespace bench {
namespace {

void append_mode(ll_list_t *list, u32 vic, u32 stereo) {
  ll_entry_t *entry = nullptr;
  void *payload = nullptr;
  if (!ll_create_entry(sizeof(short_video_desc_t), &entry, &payload, "short_video_desc_t") ||
      !ll_add_entry_to_back(list, entry)) {
    throw std::runtime_error("cannot make a list of modes");
  }
  auto *const mode = static_cast<short_video_desc_t *>(payload);
  mode->vic = vic;
  mode->stereo = stereo;
}

void load(const std::string &document) {
  if (!config_store_load_text(document.data(), document.size(), "benchmark")) {
    throw std::runtime_error(config_store_error());
  }
}

}  // namespace

values_t::values_t() {
  if (!platform_values_init(&values_)) throw std::runtime_error("cannot initialise platform values");
}

values_t::~values_t() {
  platform_values_destroy(&values_);
}

void load_default_platform() {
  load(config_store_default_text());
}

void load_default_platform_behind(u32 bytes) {
  std::string document = "[another.driver]\n";
  for (u32 i = 0; document.size() < bytes; ++i)
    document += "key_" + std::to_string(i) + " = " + std::to_string(i) + "\n";
  load(document + config_store_default_text());
}

void fill_sample(values_t *values) {
  constexpr short_video_desc_t priority[] = {{0, 16, 0}, {0, 31, 0}, {0, 32, 5}, {0, 34, 0}, {0, 33, 0}, {0, 4, 5},
                                             {0, 19, 5}, {0, 5, 2},  {0, 20, 2}, {0, 3, 0},  {0, 2, 0},  {0, 18, 0},
                                             {0, 17, 0}, {0, 7, 0},  {0, 6, 0},  {0, 22, 0}, {0, 21, 0}, {0, 1, 0}};
  constexpr u32 additional[] = {16, 4, 5, 3, 2, 1};
  for (const auto &mode : priority) {
    append_mode(&(*values)->video_50_priority, mode.vic, mode.stereo);
    append_mode(&(*values)->video_60_priority, mode.vic, mode.stereo);
  }
  for (const u32 vic : additional) {
    append_mode(&(*values)->video_50_additional, vic, 0);
    append_mode(&(*values)->video_60_additional, vic, 0);
  }
  (*values)->native_refresh_rate = 60;
  (*values)->audio_pass_through = 2;
  (*values)->speaker_entry = 1;
  (*values)->native_bit = 1;
  (*values)->week = 1;
  (*values)->year = 2024;
  std::memcpy((*values)->manufacturer_id, "YYY", 4);
  std::memcpy((*values)->monitor_name, "Media Box", 10);
}

void prioritize_first_vics(values_t *values, u32 count) {
  for (ll_list_t *list : {&(*values)->video_50_priority, &(*values)->video_60_priority}) {
    ll_delete_list(list);
    if (!ll_init(list, "short_video_desc_t")) throw std::runtime_error("cannot initialise a list");
    for (u32 vic = 1; vic <= count; ++vic)
      append_mode(list, vic, 0);
  }
}

compose_cfg_t sample_settings() {
  compose_cfg_t cfg{};
  cfg.audio_mask = 0xFFFFFFFF;
  cfg.hdmi_3d_mode = 1;
  return cfg;
}

}  // namespace bench
