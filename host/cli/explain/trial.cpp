#include "explain/trial.h"

#include <algorithm>

#include "config_store.h"
#include "explain/offer.h"

namespace edid_cli {
namespace {

bool load(const platform_draft_t &platform) {
  const std::string text = platform.toml();
  return config_store_load_text(text.data(), text.size(), "changed platform");
}

}  // namespace

const compose_decision_t *trial_t::find(u32 subject, u32 code) const {
  const auto found =
      std::find_if(composition.decisions.begin(), composition.decisions.end(),
                   [=](const auto &decision) { return decision.subject == subject && decision.code == code; });
  return found != composition.decisions.end() ? &*found : nullptr;
}

u32 trial_t::family() const {
  return family_of(composition);
}

bool trial_t::is_extension_announced() const {
  return announces_extension(composition);
}

bool trial_t::has_room() const {
  const compose_decision_t *const room = find_decision(composition, COMPOSE_SUBJECT_EXTENSION_ROOM);
  return room != nullptr && room->reason == COMPOSE_REASON_ROOM_ENOUGH;
}

trials_t::~trials_t() {
  load(original_);
}

trial_t trials_t::run(const wanted_t &wanted, const steps_t &steps) const {
  trial_t trial{original_, explained_.options, {}, false};
  apply(steps, trial.platform, trial.options);
  trial.options.debug = false;
  if (load(trial.platform)) {
    const line_listener_t unheard = [](const compose_log_line_t &) {};
    trial.composition =
        compose(trial.options, trial.options.ports.first, explained_.sink_bytes, unheard, decisions_t::kept);
  }
  trial.is_reached =
      trial.composition.is_composed && trial.has_room() && is_offered(wanted, trial.composition.new_edid);
  return trial;
}

}  // namespace edid_cli
