// A walk through everything that the library can be made to say from outside: each row provokes one line.
#pragma once

#include <gtest/gtest.h>

#include <functional>
#include <string>
#include <vector>

#include "edid_composer.h"

namespace diagnostics_walk {

struct row_t {
  std::string line;  ///< Whole and masked. One that ends in "*" may go on behind it.
  bool traced = false;
  std::function<void()> provoke;
};

row_t error(const std::string &module, const std::string &function, const std::string &message,
            std::function<void()> provoke);
row_t warning(const std::string &module, const std::string &function, const std::string &message,
              std::function<void()> provoke);
row_t bug(const std::string &module, const std::string &function, const std::string &message,
          std::function<void()> provoke);
/// Also tells that the line is not written while tracing is off.
row_t trace(const std::string &function, const std::string &message, std::function<void()> provoke);

/// The test that each table is an instance of.
class DiagnosticsWalk : public testing::TestWithParam<row_t> {};

/// "003_ll_size": position in the table and function.
std::string name_of(const testing::TestParamInfo<row_t> &row);

}  // namespace diagnostics_walk

#define WALK(table, rows) \
  INSTANTIATE_TEST_SUITE_P(table, DiagnosticsWalk, testing::ValuesIn(rows), diagnostics_walk::name_of)
