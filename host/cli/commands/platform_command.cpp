#include "commands/platform_command.h"

#include <cstdio>
#include <memory>

#include "commands/exit_status.h"
#include "config_store.h"
#include "io/bad_input.h"
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
  struct platform_options_t {
    bool hdmi2 = false;
    bool keys = false;
  };
  const auto target = std::make_shared<platform_options_t>();
  return {"platform",
          "Print the default platform configuration",
          {flag("--hdmi2", target->hdmi2, "With the table of HDMI 2: everything as the sink, up to 600 MHz"),
           flag("--keys", target->keys, "List the keys of a configuration instead: type, limits, default and meaning")},
          [target] {
            if (target->hdmi2 && target->keys) {
              throw bad_input_t("--hdmi2 and --keys don't go together: --keys lists all keys");
            }
            const char *const text = target->hdmi2 ? config_store_hdmi2_text() : config_store_default_text();
            std::fputs(target->keys ? key_table().c_str() : text, stdout);
            return done_status;
          }};
}

}  // namespace edid_cli
