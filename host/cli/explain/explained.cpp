#include "explain/explained.h"

#include <algorithm>

namespace edid_cli {

u32 family_of(const composition_t &composition) {
  const compose_decision_t *const rate = find_decision(composition, COMPOSE_SUBJECT_NATIVE_RATE);
  return rate != nullptr && rate->code == 50 ? 50 : 60;
}

std::string priority_list_of(u32 subject, u32 family) {
  return subject == COMPOSE_SUBJECT_EXTENDED_MODE ? platform_list::priority_extended
         : subject == COMPOSE_SUBJECT_4K_MODE     ? platform_list::priority_4k
                                                  : platform_list::priority(family);
}

std::string addition_list_of(u32 subject, u32 family) {
  return subject == COMPOSE_SUBJECT_EXTENDED_MODE ? platform_list::addition_extended
         : subject == COMPOSE_SUBJECT_4K_MODE     ? platform_list::addition_4k
                                                  : platform_list::addition(family);
}

bool has_hdmi2(const composition_t &composition) {
  return find_decision(composition, COMPOSE_SUBJECT_LINK_RATE) != nullptr;
}

bool announces_extension(const composition_t &composition) {
  const compose_decision_t *const room = find_decision(composition, COMPOSE_SUBJECT_EXTENSION_ROOM);
  return room == nullptr || room->reason != COMPOSE_REASON_NOT_ANNOUNCED;
}

u32 explained_t::family() const {
  return family_of(composition);
}

bool explained_t::is_extension_announced() const {
  return announces_extension(composition);
}

const compose_decision_t *find_decision(const composition_t &composition, compose_subject subject) {
  const auto found = std::find_if(composition.decisions.begin(), composition.decisions.end(),
                                  [subject](const auto &decision) { return decision.subject == subject; });
  return found != composition.decisions.end() ? &*found : nullptr;
}

}  // namespace edid_cli
