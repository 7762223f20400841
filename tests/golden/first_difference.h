// Two texts that ought to be equal, and the first line in which they are not.
#pragma once

#include <string>

namespace golden {

/// Empty when the texts are equal; otherwise the number of the first line that differs, and that line in both.
/// Characters that cannot be seen are written as escapes, and an end that comes too early is told.
std::string first_difference(const std::string &expected, const std::string &actual);

}  // namespace golden
