#include "commands/platform_command.h"

#include <cstdio>
#include <memory>

#include "commands/exit_status.h"
#include "config_store.h"
#include "platform/platform_keys.h"
#include "text/text_table.h"

namespace edid_cli {
namespace {

std::string key_table() {
  text_table_t table;
  table.add({"KEY", "TYPE", "LIMITS", "DEFAULT", "MEANING"});
  for (const configuration_key_t *key : platform_keys()) {
    table.add({name_text(*key), type_text(*key), limits_text(*key), default_text(*key), key->meaning});
  }
  return table.text();
}

}  // namespace

command_t platform_command() {
  const auto lists_keys = std::make_shared<bool>(false);
  return {"platform",
          "Print the default platform configuration",
          {flag("--keys", *lists_keys, "List the keys of a configuration instead: type, limits, default and meaning")},
          [lists_keys] {
            std::fputs(*lists_keys ? key_table().c_str() : config_store_default_text(), stdout);
            return done_status;
          }};
}

}  // namespace edid_cli
