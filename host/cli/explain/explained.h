// What a composition was about: everything that the texts of an explanation are made from.
#pragma once

#include <string>
#include <vector>

#include "composition/composition.h"
#include "edid_text/decoded_edid.h"
#include "explain/sink_reading.h"
#include "platform/platform_places.h"

namespace edid_cli {

struct explained_t {
  const composition_t &composition;
  const std::vector<u8> &sink_bytes;  ///< Empty: no sink.
  const edid_t &sink;                 ///< What could be decoded of it.
  std::string sink_name;              ///< Empty: no sink.
  const sink_reading_t &reading;      ///< What of the sink's bytes the library has read.
  const platform_places_t &places;
  const composition_options_t &options;

  /// The refresh family whose lists are used.
  u32 family() const;
  /// Whether sources look at the extension at all.
  bool is_extension_announced() const;
};

/// The refresh family whose lists a composition has used.
u32 family_of(const composition_t &composition);
/// The lists of the platform that a mode's subject hangs on.
std::string priority_list_of(u32 subject, u32 family);
std::string addition_list_of(u32 subject, u32 family);
/// Whether a composition offers what HDMI 2 added.
bool has_hdmi2(const composition_t &composition);
/// Whether sources look at the extension at all.
bool announces_extension(const composition_t &composition);

/// The first decision about a subject; nullptr when there is none.
const compose_decision_t *find_decision(const composition_t &composition, compose_subject subject);

}  // namespace edid_cli
