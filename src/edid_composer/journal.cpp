#include "edid_composer/journal.h"

namespace edid_composer {

REPORTS_AS(compose_edid_internal);

void journal_t::note(const journal_entry_t &entry) {
  if (kept_ && entries_.add(entry, site) == nullptr) complete_ = false;
}

}  // namespace edid_composer
