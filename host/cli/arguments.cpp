#include "arguments.h"

#include <CLI/CLI.hpp>
#include <algorithm>

#include "bad_input.h"
#include "input.h"
#include "option_values.h"
#include "video_mode_text.h"

namespace edid_cli {
namespace {

/// An option whose text @p parse turns into @p target, or refuses by throwing bad_input_t.
template <typename value_t, typename parser_t>
CLI::Option *add_parsed_option(CLI::App &command, const std::string &name, value_t &target, parser_t parse,
                               const std::string &description) {
  const std::string long_name = name.substr(name.rfind(',') + 1);
  const auto take = [long_name, &target, parse](const std::string &text) {
    try {
      target = parse(text);
    } catch (const bad_input_t &problem) {
      throw bad_input_t(long_name + ": " + problem.what());
    }
  };
  return command.add_option_function<std::string>(name, take, description);
}

std::string parse_file_name(const std::string &text) {
  if (text.empty()) {
    throw bad_input_t("the file name is empty");
  }
  return text;
}

/// The options of "compose", and what they are gathered in until all have been seen.
class compose_arguments_t {
 public:
  explicit compose_arguments_t(CLI::App &app) : command_(*app.add_subcommand("compose", "Compose an EDID")) {
    options_.settings.audio_mask = 0xFFFFFFFF;
    options_.settings.hdmi_3d_mode = follow_sink_3d_mode;
    add_files();
    add_settings();
  }

  bool given() const { return command_.parsed(); }

  compose_options_t options() const {
    if (options_.platform_file == standard_stream && options_.sink_file == standard_stream) {
      throw bad_input_t("--platform and --sink cannot both be read from standard input");
    }
    compose_options_t result = options_;
    result.settings.audio_sink_filter = audio_sink_filter_ ? 1 : 0;
    std::copy(latency_.begin(), latency_.end(), result.settings.edid_latency);
    return result;
  }

 private:
  void add_files() {
    add_parsed_option(command_, "--platform", options_.platform_file, parse_file_name,
                      "Platform configuration (TOML); the default one otherwise")
        ->type_name("FILE");
    add_parsed_option(command_, "--sink", options_.sink_file, parse_file_name,
                      "EDID of the downstream sink, raw or hex text; no sink otherwise")
        ->type_name("FILE");
    add_parsed_option(command_, "-o,--output", options_.output_file, parse_file_name,
                      "Where the 256 bytes go; - for standard output")
        ->type_name("FILE")
        ->required();
  }

  void add_settings() {
    compose_cfg_t &settings = options_.settings;
    add_parsed_option(command_, "--port", settings.port, parse_port,
                      "Input of the platform, counted from 0 (default 0)")
        ->type_name("N");
    add_parsed_option(command_, "--current-mode", settings.hdmi_current_mode, parse_video_mode,
                      "The mode that the platform puts out now, such as 1920x1080p60")
        ->type_name("MODE");
    add_parsed_option(command_, "--audio-mask", settings.audio_mask, parse_mask,
                      "Audio formats that may be offered, decimal or 0x hexadecimal (default 0xFFFFFFFF)")
        ->type_name("MASK");
    command_.add_flag("--audio-sink-filter", audio_sink_filter_, "Offer only audio formats that the sink supports too");
    add_parsed_option(command_, "--3d", settings.hdmi_3d_mode, parse_3d_mode,
                      "Offer 3D never, as the sink does, or always (default sink)")
        ->type_name("off|sink|on");
    add_parsed_option(command_, "--latency", latency_, parse_latency,
                      "Video, audio, interlaced video and interlaced audio latency in ms (default 0)")
        ->type_name("V,A,IV,IA");
    command_.add_flag("--debug", options_.debug, "Trace every decision");
  }

  CLI::App &command_;
  compose_options_t options_;
  latency_t latency_{};
  bool audio_sink_filter_ = false;
};

const CLI::App &add_print(CLI::App &app, print_options_t &options) {
  CLI::App &command = *app.add_subcommand("print", "Print an EDID as a readable report");
  command.add_flag("--brief", options.brief, "Identity, video, audio and address only");
  add_parsed_option(command, "FILE", options.file, parse_file_name, "The EDID, raw or hex text")
      ->type_name("")
      ->required();
  return command;
}

const CLI::App &add_audio_mask(CLI::App &app, audio_mask_options_t &options) {
  CLI::App &command = *app.add_subcommand("audio-mask", "Print an audio mask in words");
  add_parsed_option(command, "MASK", options.mask, parse_mask, "Decimal or 0x hexadecimal")->type_name("")->required();
  return command;
}

/// Tells whether the user asked for help instead.
bool asks_for_help(CLI::App &app, int argument_count, char **arguments) {
  try {
    app.parse(argument_count, arguments);
    return false;
  } catch (const CLI::CallForHelp &) {
    return true;
  } catch (const CLI::ParseError &error) {
    throw bad_input_t(std::string(error.what()) + " (try --help)");
  }
}

}  // namespace

arguments_t parse_arguments(int argument_count, char **arguments) {
  CLI::App app("Composes the EDID that a video platform shows on its HDMI input. FILE may be - for standard input.",
               program_name);
  app.require_subcommand(0, 1);

  print_options_t print_options;
  audio_mask_options_t audio_mask_options;
  const compose_arguments_t compose(app);
  const CLI::App &print = add_print(app, print_options);
  const CLI::App &audio_mask = add_audio_mask(app, audio_mask_options);
  const CLI::App &platform = *app.add_subcommand("platform", "Print the default platform configuration");

  if (asks_for_help(app, argument_count, arguments)) {
    return help_t{app.help()};
  }
  if (compose.given()) {
    return compose.options();
  }
  if (print.parsed()) {
    return print_options;
  }
  if (audio_mask.parsed()) {
    return audio_mask_options;
  }
  if (platform.parsed()) {
    return platform_options_t{};
  }
  throw bad_input_t("no command given: compose, print, audio-mask or platform (try --help)");
}

}  // namespace edid_cli
