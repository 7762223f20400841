// What the tests of several compositions at once share.
#pragma once

#include <filesystem>
#include <map>

#include "cli/cli_fixture.h"

namespace host_test {

class several_fixture_t : public cli_fixture_t {
 protected:
  several_fixture_t() { std::filesystem::create_directory(sinks_); }

  std::string add_sink(const std::string &name, const std::string &content) {
    return directory_.write("sinks/" + name, content);
  }

  /// Runs "compose" with -o and the folder that the EDIDs go to.
  process_result_t compose(std::vector<std::string> arguments) {
    arguments.insert(arguments.begin(), {"compose", "-o", edids_});
    return run_cli(arguments);
  }

  /// Everything in the folder that the EDIDs go to.
  std::map<std::string, std::string> edids() const {
    std::map<std::string, std::string> contents;
    for (const auto &entry : std::filesystem::directory_iterator(edids_)) {
      contents[entry.path().filename()] = content_of(entry.path());
    }
    return contents;
  }

  const std::string sinks_ = directory_.path("sinks");
  const std::string edids_ = directory_.path("edids");
};

}  // namespace host_test
