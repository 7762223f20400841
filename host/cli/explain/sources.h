// Where decisions come from.
#pragma once

#include <string>
#include <vector>

#include "explain/explained.h"

namespace edid_cli {

enum class source_kind_t { sink, platform, setting, library };

/// Where a decision comes from.
struct source_t {
  source_kind_t kind;
  std::string text;   ///< "box.toml:40 60_hz_priority_list[2]".
  std::string key{};  ///< Of the platform: the key or the entry. Of the settings: the option.
  unsigned line = 0;  ///< Of the platform; 0: the key is not there.
};

/// "platform", for programs.
const char *source_kind_id(source_kind_t kind);

std::vector<source_t> sources_of(const compose_decision_t &decision, const explained_t &explained);

}  // namespace edid_cli
