// Regular expressions, with the C library's matcher: <regex> costs each file that includes it two seconds to compile.
#pragma once

#include <string>
#include <vector>

namespace test_support {

/// A POSIX extended regular expression, with \w, \W and \b besides. "." stands for anything within a line.
using pattern_t = const char *;

/// Whether all of @p text is what the pattern describes.
bool matches(const std::string &text, pattern_t pattern);

/// The first match and its groups, from 1 on; empty texts for groups that took no part, nothing without a match.
std::vector<std::string> first_match(const std::string &text, pattern_t pattern);

/// Every match, from left to right, each with its groups.
std::vector<std::vector<std::string>> all_matches(const std::string &text, pattern_t pattern);

/// With every match replaced by @p replacement, in which "$1" to "$9" stand for the groups.
std::string replaced(const std::string &text, pattern_t pattern, const std::string &replacement);

}  // namespace test_support
