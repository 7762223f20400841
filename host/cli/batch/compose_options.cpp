#include "batch/compose_options.h"

#include "composition/edid_problems.h"

namespace edid_cli {

decisions_t decisions_of(const compose_options_t &options) {
  return options.strict ? decisions_t::kept : decisions_t::dropped;
}

std::string failure_of(const composition_t &composition, const compose_options_t &options) {
  if (!composition.is_composed) {
    return "the library refused to compose an EDID: " + composition.refusal;
  }
  std::string failure;
  for (const std::string &reason : options.strict ? reasons_against(composition) : std::vector<std::string>{}) {
    failure += (failure.empty() ? "--strict: " : "; ") + reason;
  }
  return failure;
}

}  // namespace edid_cli
