// Options of the command line whose texts are parsed by functions that throw bad_input_t.
#pragma once

#include <CLI/CLI.hpp>
#include <string>

#include "bad_input.h"

namespace edid_cli {

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

}  // namespace edid_cli
