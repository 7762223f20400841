// What one case gives: the composed bytes, and everything that is written about them.
#pragma once

#include <filesystem>
#include <map>
#include <string>
#include <vector>

#include "edid_composer.h"
#include "golden_cases.h"

namespace golden {

/// Where the sample sinks and platforms are.
std::filesystem::path sinks_directory();
std::filesystem::path platforms_directory();
/// Where the goldens are kept.
std::filesystem::path golden_directory();

struct composition_t {
  std::vector<u8> edid;
  std::string log;        ///< What composing printed, numbers of lines and pointers masked.
  u8 address_offset = 0;  ///< Where the physical address stands, as the library tells it.
};

/// Composes the case. Throws std::runtime_error when a file cannot be read or the library refuses.
composition_t composed(const golden_case_t &golden_case, bool tracing);

/// The same, with somebody who hears of the decisions; @p decisions receives their number.
composition_t observed(const golden_case_t &golden_case, bool tracing, int *decisions);

/// The texts that are kept of a case, by the names of their files.
std::map<std::string, std::string> golden_texts(const golden_case_t &golden_case);

/// The whole content of a file. Throws std::runtime_error when it cannot be read.
std::string content_of(const std::filesystem::path &file);

}  // namespace golden
