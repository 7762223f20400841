#include "list_reading.h"

#include <algorithm>
#include <iterator>
#include <optional>
#include <string_view>

#include "composition.h"
#include "diagnostic_lines.h"
#include "output_capture.h"
#include "text_lines.h"

namespace edid_cli {
namespace {

// With tracing on, each list and each of its entries is announced before it is read.
constexpr std::string_view list_announcement = "\tRoot Node:Name of node is:";
constexpr std::string_view entry_announcement = "\tNext Node:Name of node is:";
constexpr std::string_view name_end = " \t\t\tprint_platform_node():";

/// The operations that report on the entry that was announced last.
constexpr std::string_view entry_readers[] = {
    "_get_generic_platform_list", "_get_vic_list_callback",   "_get_4k_x_2k_mode_callback",
    "_get_est_timing_callback",   "_get_std_timing_callback",
};
/// This one is taken, with its refresh rate rounded up.
constexpr std::string_view rounded_entry = "Only whole refresh rates";

std::optional<std::string_view> announced(std::string_view line, std::string_view announcement) {
  const std::size_t end = line.rfind(name_end);
  if (!line.starts_with(announcement) || end == std::string_view::npos) {
    return std::nullopt;
  }
  return line.substr(announcement.size(), end - announcement.size());
}

class listener_t {
 public:
  void hear(std::string_view line) {
    if (const auto name = announced(line, list_announcement)) {
      entries_ = &reading_.lists[std::string(*name)];
    } else if (entries_ != nullptr && announced(line, entry_announcement)) {
      entries_->emplace_back();
    } else if (const auto diagnostic = parse_diagnostic(line)) {
      hear(*diagnostic);
    }
  }

  list_reading_t finish(bool was_composed) && {
    reading_.was_composed = was_composed;
    return std::move(reading_);
  }

 private:
  void hear(const diagnostic_t &diagnostic) {
    std::string message(trimmed(diagnostic.message));
    const bool is_of_entry =
        std::find(std::begin(entry_readers), std::end(entry_readers), diagnostic.function) != std::end(entry_readers);
    if (is_of_entry && message.starts_with("Unabled to find")) {
      entries_ = nullptr;
    } else if (is_of_entry && entries_ != nullptr && !entries_->empty()) {
      entries_->back().push_back(std::move(message));
    } else if (diagnostic.kind == "ERROR") {
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
  bool was_composed = false;
  std::string output;
  {
    output_capture_t capture;
    was_composed = compose(options, 0, {}).has_value();
    output = capture.take();
  }
  debug_enable(false);
  listener_t listener;
  for (const text_line_t &line : lines_of(output)) {
    listener.hear(line.text);
  }
  return std::move(listener).finish(was_composed);
}

bool is_skipped(const entry_messages_t &messages) {
  return std::any_of(messages.begin(), messages.end(),
                     [](const std::string &message) { return !message.starts_with(rounded_entry); });
}

}  // namespace edid_cli
