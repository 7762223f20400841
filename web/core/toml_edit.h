// Changes in the text of a platform, which leave its comments and its layout as they are.
#pragma once

#include <string>

#include "explain/step.h"

namespace edid_web {

/// The text with the steps done in it, for sources of the same platform; options among them are passed over. Loads what
/// it makes. Throws bad_input_t where the result does not read as the steps say, as of a layout that is not foreseen.
std::string with_steps(std::string text, const std::string &name, const edid_cli::steps_t &steps);

}  // namespace edid_web
