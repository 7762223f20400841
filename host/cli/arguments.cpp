#include "arguments.h"

#include <CLI/CLI.hpp>
#include <optional>

#include "bad_input.h"
#include "composition_arguments.h"
#include "examples.h"
#include "option_values.h"
#include "parsed_option.h"

namespace edid_cli {
namespace {

CLI::App &add_command(CLI::App &app, const std::string &name, const std::string &description) {
  CLI::App &command = *app.add_subcommand(name, description);
  command.footer(examples_of(name));
  return command;
}

/// The options of "compose".
class compose_arguments_t {
 public:
  explicit compose_arguments_t(CLI::App &app)
      : command_(add_command(app, "compose", "Compose an EDID, or one for each of several sinks or ports")),
        composition_(command_) {
    add_parsed_option(command_, "-o,--output", options_.output, parse_file_name,
                      "Where the EDID goes; - for standard output. Of several: a folder, or a file name with {sink} "
                      "and {port} in it")
        ->type_name("FILE")
        ->required();
    add_parsed_option(command_, "--format", options_.format, parse_edid_format,
                      "Write bytes, or hexadecimal text (default raw)")
        ->type_name("raw|hex");
    add_parsed_option(command_, "--jobs", options_.jobs, parse_jobs,
                      "Compose so many of several at once (default: as many as there are processors)")
        ->type_name("N");
    command_.add_flag("--log", options_.log, "Of several: write what the library says into a .log file beside each");
  }

  bool given() const { return command_.parsed(); }

  compose_options_t options() const {
    compose_options_t result = options_;
    result.composition = composition_.options();
    return result;
  }

 private:
  CLI::App &command_;
  compose_options_t options_;
  composition_arguments_t composition_;
};

/// The options of "explain".
class explain_arguments_t {
 public:
  explicit explain_arguments_t(CLI::App &app)
      : command_(add_command(app, "explain", "Tell why a composed EDID offers what it offers")),
        composition_(command_) {
    add_parsed_option(
        command_, "--want", options_.want, [](const std::string &text) { return text; },
        "Tell what stands in the way of one mode or format: 16, 1920x1080p60, 4k:1, ac3, audio:2")
        ->type_name("MODE");
    command_.add_flag("--json", options_.json, "Print a JSON document");
    add_parsed_option(command_, "--html", options_.html_file, parse_file_name,
                      "Write a page to read in a browser; - for standard output")
        ->type_name("FILE");
  }

  bool given() const { return command_.parsed(); }

  explain_options_t options() const {
    explain_options_t result = options_;
    result.composition = composition_.options();
    return result;
  }

 private:
  CLI::App &command_;
  explain_options_t options_;
  composition_arguments_t composition_;
};

CLI::Option *add_edid(CLI::App &command, const std::string &name, std::string &target) {
  return add_parsed_option(command, name, target, parse_file_name, "The EDID: a file, raw or as text, or a connector")
      ->type_name("")
      ->required();
}

const CLI::App &add_print(CLI::App &app, print_options_t &options) {
  CLI::App &command = add_command(app, "print", "Print an EDID as a readable report");
  command.add_flag("--brief", options.brief, "Identity, video, audio and address only");
  add_drm_directory(command, options.drm_directory);
  add_edid(command, "FILE", options.source);
  return command;
}

const CLI::App &add_diff(CLI::App &app, diff_options_t &options) {
  CLI::App &command = add_command(app, "diff", "Print two EDIDs side by side, field by field");
  command.add_flag("--only-changes", options.only_changes, "Leave out the fields that are the same");
  add_drm_directory(command, options.drm_directory);
  add_edid(command, "A", options.left);
  add_edid(command, "B", options.right);
  return command;
}

const CLI::App &add_sinks(CLI::App &app, sinks_options_t &options) {
  CLI::App &command = add_command(app, "sinks", "List the connectors of this machine and their displays");
  add_drm_directory(command, options.drm_directory);
  return command;
}

const CLI::App &add_check_platform(CLI::App &app, check_platform_options_t &options) {
  CLI::App &command =
      add_command(app, "check-platform", "Tell what a composition reads of a platform configuration, and its mistakes");
  add_parsed_option(command, "FILE", options.file, parse_file_name, "The platform configuration (TOML)")
      ->type_name("")
      ->required();
  return command;
}

const CLI::App &add_audio_mask(CLI::App &app, audio_mask_options_t &options) {
  CLI::App &command = add_command(app, "audio-mask", "Print an audio mask in words");
  add_parsed_option(command, "MASK", options.mask, parse_mask, "Decimal or 0x hexadecimal")->type_name("")->required();
  return command;
}

/// The help or the version, when the user asks for one instead.
std::optional<help_t> parse(CLI::App &app, int argument_count, char **arguments) {
  try {
    app.parse(argument_count, arguments);
    return std::nullopt;
  } catch (const CLI::CallForHelp &) {
    return help_t{app.help()};
  } catch (const CLI::CallForVersion &version) {
    return help_t{std::string(version.what()) + "\n"};
  } catch (const CLI::ParseError &error) {
    throw bad_input_t(std::string(error.what()) + " (try --help)");
  }
}

[[noreturn]] void refuse_no_command(const CLI::App &app) {
  const auto commands = app.get_subcommands(nullptr);
  std::string names;
  for (const CLI::App *command : commands) {
    names += names.empty() ? "" : command == commands.back() ? " or " : ", ";
    names += command->get_name();
  }
  throw bad_input_t("no command given: " + names + " (try --help)");
}

}  // namespace

arguments_t parse_arguments(int argument_count, char **arguments) {
  CLI::App app(
      "Composes the EDID that a video platform shows on its HDMI input, and looks at EDIDs and platforms. FILE may be "
      "- for standard input.",
      program_name);
  app.require_subcommand(0, 1);
  app.footer(examples_of(""));
  app.set_version_flag("--version", std::string(program_name) + " " EDID_COMPOSER_VERSION "\n" + gVersion,
                       "Print the version of the program and of the library");

  print_options_t print_options;
  diff_options_t diff_options;
  sinks_options_t sinks_options;
  check_platform_options_t check_platform_options;
  audio_mask_options_t audio_mask_options;
  const compose_arguments_t compose(app);
  const explain_arguments_t explain(app);
  const CLI::App &print = add_print(app, print_options);
  const CLI::App &diff = add_diff(app, diff_options);
  const CLI::App &sinks = add_sinks(app, sinks_options);
  const CLI::App &check_platform = add_check_platform(app, check_platform_options);
  const CLI::App &audio_mask = add_audio_mask(app, audio_mask_options);
  const CLI::App &platform = add_command(app, "platform", "Print the default platform configuration");

  if (auto help = parse(app, argument_count, arguments)) {
    return *std::move(help);
  }
  if (compose.given()) {
    return compose.options();
  }
  if (explain.given()) {
    return explain.options();
  }
  if (print.parsed()) {
    return print_options;
  }
  if (diff.parsed()) {
    return diff_options;
  }
  if (sinks.parsed()) {
    return sinks_options;
  }
  if (check_platform.parsed()) {
    return check_platform_options;
  }
  if (audio_mask.parsed()) {
    return audio_mask_options;
  }
  if (platform.parsed()) {
    return platform_options_t{};
  }
  refuse_no_command(app);
}

}  // namespace edid_cli
