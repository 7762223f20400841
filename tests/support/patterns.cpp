#include "support/patterns.h"

#include <regex.h>

#include <array>
#include <map>
#include <stdexcept>

namespace test_support {
namespace {

constexpr std::size_t most_groups = 16;
using places_t = std::array<regmatch_t, most_groups>;

class expression_t {
 public:
  explicit expression_t(pattern_t pattern) {
    if (regcomp(&compiled_, pattern, REG_EXTENDED | REG_NEWLINE) != 0) throw std::invalid_argument(pattern);
  }
  expression_t(const expression_t &) = delete;
  expression_t &operator=(const expression_t &) = delete;
  ~expression_t() { regfree(&compiled_); }

  const regex_t *get() const { return &compiled_; }

 private:
  regex_t compiled_{};
};

/// Each pattern is compiled once in a process.
const regex_t *compiled(pattern_t pattern) {
  static std::map<std::string, expression_t> expressions;
  return expressions.try_emplace(pattern, pattern).first->second.get();
}

/// The first match from @p start on.
bool find(const std::string &text, std::size_t start, pattern_t pattern, places_t *places) {
  places->front() = {static_cast<regoff_t>(start), static_cast<regoff_t>(text.size())};
  return regexec(compiled(pattern), text.c_str(), places->size(), places->data(), REG_STARTEND) == 0;
}

std::string part(const std::string &text, const regmatch_t &place) {
  if (place.rm_so < 0) return "";
  return text.substr(static_cast<std::size_t>(place.rm_so), static_cast<std::size_t>(place.rm_eo - place.rm_so));
}

std::vector<std::string> groups(const std::string &text, const places_t &places, pattern_t pattern) {
  std::vector<std::string> result;
  for (std::size_t group = 0; group <= compiled(pattern)->re_nsub; ++group)
    result.push_back(part(text, places.at(group)));
  return result;
}

/// Hands each match to @p take; an empty one ends the search.
template <typename take_t>
void for_each_match(const std::string &text, pattern_t pattern, const take_t &take) {
  places_t places;
  for (std::size_t start = 0; find(text, start, pattern, &places) && places[0].rm_eo > places[0].rm_so;
       start = static_cast<std::size_t>(places[0].rm_eo)) {
    take(places);
  }
}

}  // namespace

bool matches(const std::string &text, pattern_t pattern) {
  // The match found is the leftmost and of those the longest: all of the text if that is one.
  places_t places;
  return find(text, 0, pattern, &places) && part(text, places[0]) == text;
}

std::vector<std::string> first_match(const std::string &text, pattern_t pattern) {
  places_t places;
  if (!find(text, 0, pattern, &places)) return {};
  return groups(text, places, pattern);
}

std::vector<std::vector<std::string>> all_matches(const std::string &text, pattern_t pattern) {
  std::vector<std::vector<std::string>> result;
  for_each_match(text, pattern, [&](const places_t &places) { result.push_back(groups(text, places, pattern)); });
  return result;
}

std::string replaced(const std::string &text, pattern_t pattern, const std::string &replacement) {
  std::string result;
  std::size_t copied = 0;
  for_each_match(text, pattern, [&](const places_t &places) {
    result.append(text, copied, static_cast<std::size_t>(places[0].rm_so) - copied);
    for (std::size_t i = 0; i < replacement.size(); ++i) {
      if (replacement[i] == '$') {
        result += part(text, places.at(static_cast<std::size_t>(replacement.at(++i) - '0')));
      } else {
        result += replacement[i];
      }
    }
    copied = static_cast<std::size_t>(places[0].rm_eo);
  });
  return result.append(text, copied, std::string::npos);
}

}  // namespace test_support
