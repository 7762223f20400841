#include "platform/list_reading.h"

#include <algorithm>
#include <iterator>
#include <string_view>

#include "composition/composition.h"
#include "composition/library_line.h"

namespace edid_cli {
namespace {

// With tracing on, this operation announces each list, and each of its entries, before it is read.
constexpr std::string_view announcer = "print_platform_node";
constexpr std::string_view list_announcement = "\tRoot Node:Name of node is:";
constexpr std::string_view entry_announcement = "\tNext Node:Name of node is:";

/// The operations that report on the entry that was announced last.
constexpr std::string_view entry_readers[] = {
    "_get_generic_platform_list", "_get_vic_list_callback",   "_get_4k_x_2k_mode_callback",
    "_get_est_timing_callback",   "_get_std_timing_callback",
};
/// This one is taken, with its refresh rate rounded up.
constexpr std::string_view rounded_entry = "Only whole refresh rates";

class listener_t {
 public:
  void hear(const compose_log_line_t &line) {
    if (is_diagnostic(line)) {
      hear_diagnostic(line);
    } else if (line.kind == COMPOSE_LOG_TRACE && line.function == announcer) {
      hear_announcement(line.text);
    }
  }

  list_reading_t finish(bool was_composed) && {
    reading_.was_composed = was_composed;
    return std::move(reading_);
  }

 private:
  void hear_announcement(std::string_view text) {
    if (text.starts_with(list_announcement)) {
      entries_ = &reading_.lists[std::string(text.substr(list_announcement.size()))];
    } else if (text.starts_with(entry_announcement) && entries_ != nullptr) {
      entries_->emplace_back();
    }
  }

  void hear_diagnostic(const compose_log_line_t &line) {
    std::string message = message_of(line);
    const bool is_of_entry =
        std::find(std::begin(entry_readers), std::end(entry_readers), line.function) != std::end(entry_readers);
    if (is_of_entry && message.starts_with("Unabled to find")) {
      entries_ = nullptr;
    } else if (is_of_entry && entries_ != nullptr && !entries_->empty()) {
      entries_->back().push_back(std::move(message));
    } else if (line.kind == COMPOSE_LOG_ERROR) {
      reading_.refusal = std::move(message);
    }
  }

  list_reading_t reading_;
  std::vector<entry_messages_t> *entries_ = nullptr;
};

}  // namespace

list_reading_t read_lists() {
  composition_options_t options;
  options.settings.audio_mask = 0xFFFFFFFF;
  options.debug = true;
  listener_t listener;
  const bool was_composed =
      compose(options, 0, {}, [&listener](const compose_log_line_t &line) { listener.hear(line); }).is_composed;
  debug_enable(false);
  return std::move(listener).finish(was_composed);
}

bool is_skipped(const entry_messages_t &messages) {
  return std::any_of(messages.begin(), messages.end(),
                     [](const std::string &message) { return !message.starts_with(rounded_entry); });
}

}  // namespace edid_cli
