// What a command takes, as data: the parser makes the options of it, and the help.
#pragma once

#include <functional>
#include <string>

namespace edid_cli {

struct option_t {
  std::string names;        ///< "-o,--output"; "FILE" of an operand.
  std::string value_name;   ///< What stands for the value in the help; empty of flags and operands.
  std::string description;  ///< For the help.
  /// Takes the value's text, or throws bad_input_t. None: a flag.
  std::function<void(const std::string &text)> take{};
  /// Takes a flag.
  std::function<void()> set{};
  bool is_required = false;
  bool may_be_repeated = false;
  std::string environment{};  ///< The variable that holds the value where the option is not given.
};

/// An option whose text @p parse turns into @p target.
template <typename target_t, typename parser_t>
option_t option(std::string names, std::string value_name, target_t &target, parser_t parse, std::string description) {
  return {std::move(names), std::move(value_name), std::move(description),
          [&target, parse](const std::string &text) { target = parse(text); }};
}

template <typename target_t>
option_t flag(std::string name, target_t &target, std::string description) {
  return {std::move(name), "", std::move(description), {}, [&target] { target = true; }};
}

inline option_t repeated(option_t option) {
  option.may_be_repeated = true;
  return option;
}

inline option_t required(option_t option) {
  option.is_required = true;
  return option;
}

}  // namespace edid_cli
