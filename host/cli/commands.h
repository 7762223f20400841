// The commands and what each is given. Each returns the exit status, and throws bad_input_t.
#pragma once

#include <optional>
#include <string>

#include "edid_composer.h"

namespace edid_cli {

/// File names may be standard_stream ("-").
struct compose_options_t {
  std::optional<std::string> platform_file;  ///< None: the default platform.
  std::optional<std::string> sink_file;      ///< None: no sink.
  std::string output_file;
  compose_cfg_t settings{};
  bool debug = false;
};

struct print_options_t {
  std::string file;
  bool brief = false;
};

struct audio_mask_options_t {
  u32 mask = 0;
};

struct platform_options_t {};

int run(const compose_options_t &options);
int run(const print_options_t &options);
int run(const audio_mask_options_t &options);
int run(const platform_options_t &options);

}  // namespace edid_cli
