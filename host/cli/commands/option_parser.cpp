#include "commands/option_parser.h"

#include <CLI/App.hpp>
#include <CLI/Config.hpp>
#include <CLI/Formatter.hpp>
#include <algorithm>
#include <optional>

#include "commands/examples.h"
#include "io/bad_input.h"

namespace edid_cli {
namespace {

/// Whether a text is the name of one of a command's options, as "-o" or "--output".
bool is_option_name(const command_t &command, const std::string &text) {
  return std::any_of(command.options.begin(), command.options.end(), [&text](const option_t &option) {
    return text.starts_with('-') && ("," + option.names + ",").find("," + text + ",") != std::string::npos;
  });
}

bad_input_t missing_before(const std::string &next, const std::string &name, const option_t &option) {
  return bad_input_t(name + ": " + option.value_name + " is missing before " + next);
}

void add_option(CLI::App &app, const command_t &command, const option_t &option) {
  if (!option.take) {
    app.add_flag_callback(option.names, option.set, option.description);
    return;
  }
  const std::string long_name = option.names.substr(option.names.rfind(',') + 1);
  const CLI::callback_t take = [&command, long_name, &option](const CLI::results_t &texts) {
    for (const std::string &text : texts) {
      if (is_option_name(command, text)) {
        throw missing_before(text, long_name, option);
      }
      try {
        option.take(text);
      } catch (const bad_input_t &problem) {
        throw bad_input_t(long_name + ": " + problem.what());
      }
    }
    return true;
  };
  CLI::Option *const added = app.add_option(option.names, take, option.description);
  added->type_name(option.value_name)->required(option.is_required)->envname(option.environment);
  if (option.may_be_repeated) {
    added->expected(1)->multi_option_policy(CLI::MultiOptionPolicy::TakeAll);
  }
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

[[noreturn]] void refuse_no_command(const std::vector<command_t> &commands) {
  std::string names;
  for (const command_t &command : commands) {
    names += names.empty() ? "" : &command == &commands.back() ? " or " : ", ";
    names += command.name;
  }
  throw bad_input_t("no command given: " + names + " (try --help)");
}

}  // namespace

std::variant<help_t, const command_t *> parse_command_line(const program_t &program, int argument_count,
                                                           char **arguments) {
  CLI::App app(program.description, program.name);
  app.require_subcommand(0, 1);
  app.footer(examples_of(""));
  app.set_version_flag("--version", program.version, "Print the version of the program and of the library");
  for (const command_t &command : program.commands) {
    CLI::App &added = *app.add_subcommand(command.name, command.description);
    added.footer(examples_of(command.name));
    for (const option_t &option : command.options) {
      add_option(added, command, option);
    }
  }
  if (auto help = parse(app, argument_count, arguments)) {
    return *std::move(help);
  }
  for (const command_t &command : program.commands) {
    if (app.got_subcommand(command.name)) {
      return &command;
    }
  }
  refuse_no_command(program.commands);
}

}  // namespace edid_cli
