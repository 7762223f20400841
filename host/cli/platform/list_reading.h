// What the library says of each entry of the configuration's lists.
#pragma once

#include <map>
#include <string>
#include <vector>

namespace edid_cli {

/// What was said of an entry, one text for each diagnostic.
using entry_messages_t = std::vector<std::string>;

struct list_reading_t {
  /// Each list that was read, by its key, with its entries in order.
  std::map<std::string, std::vector<entry_messages_t>> lists;
  bool was_composed = false;
  std::string refusal;  ///< The error that the library ended with, if it refused.
};

/// Has the library compose without a sink from the configuration that is loaded, and listens to it.
list_reading_t read_lists();

/// Returns whether an entry of which this was said is left out.
bool is_skipped(const entry_messages_t &messages);

}  // namespace edid_cli
