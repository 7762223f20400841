// The commands and what each is given. Each returns the exit status, and throws bad_input_t.
#pragma once

#include <optional>
#include <string>

#include "composition.h"
#include "edid_composer.h"
#include "edid_output.h"

namespace edid_cli {

/// File names may be standard_stream ("-").
struct compose_options_t {
  composition_options_t composition;
  std::string output;  ///< A file; a folder or a pattern where several are composed.
  edid_format_t format = edid_format_t::raw;
  u32 jobs = 0;  ///< 0: as many as the machine has processors.
  bool log = false;
};

struct print_options_t {
  std::string source;
  std::string drm_directory;
  bool brief = false;
};

struct audio_mask_options_t {
  u32 mask = 0;
};

struct platform_options_t {};

struct sinks_options_t {
  std::string drm_directory;
};

struct diff_options_t {
  std::string left;
  std::string right;
  std::string drm_directory;
  bool only_changes = false;
};

struct check_platform_options_t {
  std::string file;
};

struct explain_options_t {
  composition_options_t composition;
  std::optional<std::string> want;  ///< One mode or format that is asked about; none: all decisions.
  bool json = false;
  std::string html_file;  ///< Empty: no page.
};

int run(const compose_options_t &options);
int run(const explain_options_t &options);
int run(const print_options_t &options);
int run(const audio_mask_options_t &options);
int run(const platform_options_t &options);
int run(const sinks_options_t &options);
int run(const diff_options_t &options);
int run(const check_platform_options_t &options);

}  // namespace edid_cli
