// The lines and words of a text, and telling where in it something is wrong.
#pragma once

#include <string>
#include <string_view>
#include <vector>

namespace edid_cli {

struct text_line_t {
  std::string_view text;   ///< Without its end.
  std::size_t number = 0;  ///< From 1.
};

std::vector<text_line_t> lines_of(std::string_view text);

/// What stands between white space and commas.
std::vector<std::string_view> words_of(std::string_view text);

/// Without white space at both ends.
std::string_view trimmed(std::string_view text);

/// Throws bad_input_t: file, line and column of @p part, which is a piece of the line's text; the part; the problem.
[[noreturn]] void refuse_at(const std::string &name, const text_line_t &line, std::string_view part,
                            const std::string &problem);

}  // namespace edid_cli
