#include "edid_composer/modes_4k_x_2k.h"

#include <algorithm>
#include <iterator>

#include "diagnostics.h"
#include "edid_composer/decisions.h"
#include "linked_list/walk.h"

namespace edid_composer {
namespace {

constexpr u32 most_modes = static_cast<u32>(std::size(edid_t{}.hdmi_vic));

/// HDMI_VICs of one origin.
struct modes_t {
  u32 vics[2 * most_modes];
  u32 count;

  constexpr void add(u32 vic) { vics[count++] = vic; }
  constexpr const u32 *begin() const { return vics; }
  constexpr const u32 *end() const { return vics + count; }
  bool has(u32 vic) const { return std::find(begin(), end(), vic) != end(); }
};

modes_t modes_of(const edid_t &edid) {
  modes_t modes{};
  for (u32 i = 0; i < std::min<u32>(edid.hdmi_vic_len, most_modes); ++i)
    modes.add(edid.hdmi_vic[i]);
  return modes;
}

/// The entries of a platform list up to its first 0.
modes_t platform_modes(const i32 (&list)[most_modes]) {
  modes_t modes{};
  for (const i32 vic : list) {
    if (vic == 0) break;
    modes.add(static_cast<u32>(vic));
  }
  return modes;
}

void trace_modes(const site_t &site, const char *heading, const modes_t &modes) {
  LOG_TRACE_AS(site, "%s", heading);
  for (const u32 vic : modes)
    LOG_TRACE_AS(site, "\t%d\t%s", vic, hdmi_vic_string(vic));
}

void nominate(decisions_t *decisions, const modes_t &modes, compose_origin origin) {
  i32 index = 0;
  for (const u32 vic : modes)
    decisions->nominate(COMPOSE_SUBJECT_4K_MODE, vic, origin, index++);
}

/// Decides on all that sink, addition list and priority list name; @p chosen is what came of them.
void judge(decisions_t *decisions, const modes_t &sink, const modes_t &addition, const modes_t &priority,
           const modes_t &chosen) {
  nominate(decisions, sink, COMPOSE_ORIGIN_SINK_4K);
  nominate(decisions, priority, COMPOSE_ORIGIN_PRIORITY_LIST);
  nominate(decisions, addition, COMPOSE_ORIGIN_ADDITION_LIST);
  for (auto &decision : walk<compose_decision_t>(LIST_AS(decisions->site(), decisions->list()))) {
    if (decision.subject != COMPOSE_SUBJECT_4K_MODE) continue;
    if (chosen.has(decision.code)) {
      decide(&decision, COMPOSE_VERDICT_OFFERED,
             sink.has(decision.code) ? COMPOSE_REASON_SINK_HAS_IT : COMPOSE_REASON_PLATFORM_ADDS_IT);
    } else {
      decide(&decision, COMPOSE_VERDICT_LEFT_OUT,
             priority.has(decision.code) ? COMPOSE_REASON_NOT_AVAILABLE : COMPOSE_REASON_NOT_IN_PRIORITY_LIST);
    }
  }
}

}  // namespace

u8 _filter_4k_modes(const edid_t *downstream, edid_t *new_edid, const platform_values_t *values,
                    decisions_t *decisions) {
  const modes_t sink = modes_of(*downstream);
  const modes_t addition = platform_modes(values->modes_4k_x_2k_addition);
  const modes_t priority = platform_modes(values->modes_4k_x_2k_priority);
  std::fill(std::begin(new_edid->hdmi_vic), std::end(new_edid->hdmi_vic), 0U);
  new_edid->hdmi_vic_len = 0;

  modes_t available = sink;
  for (const u32 vic : addition)
    available.add(vic);
  trace_modes(HERE, "Downstream 4k x 2k:", sink);
  trace_modes(HERE, "Additional 4k x 2k:", addition);
  trace_modes(HERE, "Priority 4k x 2k:", priority);

  for (const u32 vic : priority) {
    if (!available.has(vic)) continue;
    new_edid->hdmi_vic[new_edid->hdmi_vic_len++] = vic;
    LOG_TRACE("\tAdding 4k x 2k mode:%d:%s", vic, hdmi_vic_string(vic));
  }
  if (decisions != nullptr) judge(decisions, sink, addition, priority, modes_of(*new_edid));
  return 1;
}

}  // namespace edid_composer
