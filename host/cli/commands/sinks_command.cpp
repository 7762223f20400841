#include "commands/sinks_command.h"

#include <cstdio>
#include <memory>
#include <string>
#include <vector>

#include "commands/exit_status.h"
#include "commands/shared_options.h"
#include "edid_input/drm_connectors.h"
#include "edid_input/edid_file.h"
#include "edid_text/decoded_edid.h"
#include "edid_text/physical_address_text.h"
#include "io/bad_input.h"
#include "io/input.h"
#include "io/standard_output.h"
#include "text/text_table.h"

namespace edid_cli {
namespace {

std::string monitor_of(const edid_t &edid) {
  return edid.monitor_name[0] != '\0' ? edid.monitor_name : "(no name)";
}

text_table_t::row_t describe(const connector_t &connector) {
  try {
    if (read_input(connector.edid_file).empty()) {
      return {connector.name, "(not connected)", "-"};
    }
    const std::vector<u8> bytes = read_edid_file(connector.edid_file);
    const discarded_output_t unseen;
    const decoded_edid_t edid(bytes);
    if (!edid.is_complete()) {
      return {connector.name, "(EDID does not decode)", "-"};
    }
    return {connector.name, monitor_of(edid.record()), physical_address_text(edid.record())};
  } catch (const bad_input_t &) {
    return {connector.name, "(EDID cannot be read)", "-"};
  }
}

int run(const std::string &drm_directory) {
  const std::vector<connector_t> connectors = list_connectors(drm_directory);
  if (connectors.empty()) {
    throw bad_input_t(drm_directory + ": holds no connectors");
  }
  text_table_t table;
  table.add({"CONNECTOR", "MONITOR", "ADDRESS"});
  for (const connector_t &connector : connectors) {
    table.add(describe(connector));
  }
  std::fputs(table.text().c_str(), stdout);
  return done_status;
}

}  // namespace

command_t sinks_command() {
  const auto directory = std::make_shared<std::string>();
  return {"sinks",
          "List the connectors of this machine and their displays",
          {drm_directory_option(*directory)},
          [directory] { return run(*directory); }};
}

}  // namespace edid_cli
