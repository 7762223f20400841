// What --help shows of the commands at work.
#pragma once

#include <string>
#include <string_view>

namespace edid_cli {

/// The section of examples of a command's help; of the whole program's for the empty name.
std::string examples_of(std::string_view command);

}  // namespace edid_cli
