// What the tests of the command-line program share.
#pragma once

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "edid_composer.h"
#include "support/process.h"
#include "support/temporary_directory.h"

namespace host_test {

/// The program under test: that which EDID_COMPOSER in the environment names, else the one built with the tests.
std::string cli_program();

/// Runs the program.
process_result_t run_cli(const std::vector<std::string> &arguments, const std::string &input = "");

/// The path of a sample sink, and what its hex text says.
std::string sample_sink(const std::string &name);
std::string sample_bytes(const std::string &name);

/// The names of all sample sinks.
inline constexpr const char *sample_names[] = {"tv_1080p_3d", "tv_4k", "tv_720p_50hz", "av_receiver",
                                               "monitor_base_block"};

/// Bytes as hexadecimal text: two digits each, @p separator between them.
std::string hex_of(const std::string &bytes, const std::string &separator = " ");

/// Tells whether the library's output holds an error, a warning or a bug line.
bool holds_diagnostics(const std::string &output);

/// A test with a directory of its own.
class cli_fixture_t : public testing::Test {
 protected:
  /// Runs "compose" with further arguments into a file of the directory; fails the test unless it succeeds without a
  /// word on standard error. Returns the composed bytes.
  std::string composed(const std::vector<std::string> &arguments, const std::string &input = "");

  /// What was on standard output of the last composed().
  std::string output_;
  temporary_directory_t directory_;
};

/// Checks one line on standard error, status 2 and nothing on standard output.
void expect_bad_input(const process_result_t &result, const std::string &error_line);

}  // namespace host_test
