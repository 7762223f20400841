// What the page can ask for. Each operation takes a request and returns a JSON document.
#pragma once

#include <string>
#include <string_view>

#include "inputs.h"

namespace edid_web {

/// Does what the member "operation" says. @p content: a file's bytes, for the operation that reads one. Throws
/// bad_input_t.
std::string run_operation(const json_t &request, std::string_view content);

}  // namespace edid_web
