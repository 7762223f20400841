#include "platform/platform_check.h"

#include <algorithm>

#include "edid_composer.h"
#include "platform/list_reading.h"
#include "platform/platform_keys.h"
#include "platform/unknown_keys.h"
#include "text/hexadecimal.h"

namespace edid_cli {
namespace {

std::string quoted(const std::string &text) {
  return "\"" + text + "\"";
}

std::string range_text(const platform_key_t &key) {
  return std::to_string(key.min) + " to " + std::to_string(key.max);
}

/// A number as the library takes it: unsigned ones are compared as such.
std::int64_t number_of(const platform_key_t &key, i32 value) {
  return key.kind == key_kind_t::unsigned_number ? static_cast<u32>(value) : std::int64_t{value};
}

/// Behind the number of an audio format.
std::string kind_of(const short_audio_desc_t &format) {
  return std::string(" (") + short_audio_string(format.type) + ", " + std::to_string(format.channels) +
         (format.channels == 1 ? " channel)" : " channels)");
}

class checker_t {
 public:
  platform_check_t run() && {
    check_.findings = find_missing_table();
    has_table_ = check_.findings.empty();
    lists_ = read_lists();
    for (const platform_key_t &key : platform_keys()) {
      read(key);
    }
    read_audio_entries();
    if (has_table_) {
      const auto unknown = find_unknown_keys();
      check_.findings.insert(check_.findings.end(), unknown.begin(), unknown.end());
    }
    if (!lists_.was_composed) {
      check_.findings.push_back({{}, "", "the library refuses to compose: " + lists_.refusal});
    }
    std::stable_sort(check_.findings.begin(), check_.findings.end(), [](const auto &left, const auto &right) {
      return std::pair(left.position.line, left.position.column) <
             std::pair(right.position.line, right.position.column);
    });
    return std::move(check_);
  }

 private:
  void find(const position_t &position, const std::string &key, const std::string &text) {
    check_.findings.push_back({position, key, text});
  }

  void read(const platform_key_t &key) {
    const auto node = configuration_node_t::find(platform_path(key.name));
    const bool is_list = key.kind == key_kind_t::text_list || key.kind == key_kind_t::number_list;
    if (is_list) {
      read_list(key, node);
    } else if (key.kind == key_kind_t::text) {
      read_text(key, node);
    } else {
      read_number(key, node);
    }
  }

  void read_number(const platform_key_t &key, const std::optional<configuration_node_t> &node) {
    const auto stored = node ? node->integer() : std::nullopt;
    std::int64_t value = key.default_number;
    if (stored) {
      const std::int64_t written = number_of(key, *stored);
      value = std::clamp(written, key.min, key.max);
      if (value != written) {
        find(
            node->position(), key.name,
            std::to_string(written) + " is not within " + range_text(key) + ": " + std::to_string(value) + " is taken");
      } else if (key.gap.last != 0 && value >= key.gap.first && value <= key.gap.last) {
        value = key.gap.counts_as;
        find(node->position(), key.name,
             std::to_string(written) + " has no meaning: " + std::to_string(value) + " is taken");
      }
    } else if (node) {
      find_wrong_kind(key, *node, "an integer", "the default " + std::to_string(value) + " is taken");
    }
    add(key, std::to_string(value), std::to_string(key.default_number), range_text(key), node && stored, node);
  }

  void read_text(const platform_key_t &key, const std::optional<configuration_node_t> &node) {
    const auto stored = node ? node->text() : std::nullopt;
    std::string value = key.default_text;
    if (stored) {
      value = stored->substr(0, static_cast<std::size_t>(key.max));
      if (value != *stored) {
        find(node->position(), key.name,
             "longer than " + std::to_string(key.max) + " characters: " + quoted(value) + " is taken");
      }
    } else if (node) {
      find_wrong_kind(key, *node, "a text", "the default " + quoted(value) + " is taken");
    }
    const bool is_short = value.size() < static_cast<std::size_t>(key.min) || value.starts_with(' ');
    if (key.short_effect != nullptr && is_short && has_table_) {
      find(node ? node->position() : position_t{}, key.name,
           quoted(value) + " is no name, which has 2 characters or more and begins with no blank: " + key.short_effect);
    }
    add(key, quoted(value), quoted(key.default_text), std::to_string(key.max) + " characters", stored.has_value(),
        node);
  }

  void read_list(const platform_key_t &key, const std::optional<configuration_node_t> &node) {
    const std::string limits =
        key.kind == key_kind_t::number_list ? range_text(key) + " each" : std::to_string(key.max) + " characters each";
    const bool is_list = node && node->is_branch();
    const auto entries = is_list ? node->children() : std::vector<configuration_node_t>{};
    const std::size_t taken = check_entries(key, entries);
    if (!node && has_table_) {
      find({}, key.name, "is missing: it counts as empty, and each composition tells an error");
    } else if (node && !is_list) {
      find_wrong_kind(key, *node, "a list", "it counts as empty");
    } else if (node && taken == 0 && !key.may_be_empty) {
      find(node->position(), key.name, "no entry is left, and each composition tells an error: no mode of it counts");
    }
    const std::string count = std::to_string(entries.size()) + (entries.size() == 1 ? " entry" : " entries");
    add(key, taken == entries.size() ? count : std::to_string(taken) + " of " + count, "empty", limits, is_list, node);
  }

  /// How many entries count.
  std::size_t check_entries(const platform_key_t &key, const std::vector<configuration_node_t> &entries) {
    const auto read = lists_.lists.find(key.name);
    std::size_t taken = 0;
    for (std::size_t index = 0; index < entries.size(); ++index) {
      const bool was_read = read != lists_.lists.end() && index < read->second.size();
      const entry_messages_t messages = was_read ? read->second[index] : entry_messages_t{};
      const std::string entry = key.name + std::string("[") + std::to_string(index) + "]";
      const bool skipped = is_skipped(messages);
      if (!messages.empty()) {
        find(entries[index].position(), entry, (skipped ? "skipped: " : "") + messages.front());
      } else if (key.kind == key_kind_t::text_list &&
                 entries[index].text().value_or("").size() > static_cast<std::size_t>(key.max)) {
        find(entries[index].position(), entry,
             "longer than " + std::to_string(key.max) + " characters: the rest is not read");
      }
      if (!skipped && key.most_entries != 0 && taken == key.most_entries) {
        find(entries[index].position(), entry,
             "has no effect: only the first " + std::to_string(key.most_entries) + " entries count");
      } else if (!skipped) {
        ++taken;
      }
    }
    return taken;
  }

  void read_audio_entries() {
    std::size_t taken = 0;
    bool is_any = false;
    for (const std::string &key : audio_entry_keys()) {
      if (const auto node = configuration_node_t::find(platform_path(key))) {
        is_any = true;
        read_audio_entry(key, *node, taken);
      }
    }
    if (!is_any) {
      check_.readings.push_back({"audio.entry_a to audio.entry_z", "absent", "absent", "24 bits", {}});
    }
  }

  void read_audio_entry(const std::string &key, const configuration_node_t &node, std::size_t &taken) {
    const auto stored = node.integer();
    if (!stored) {
      find(node.position(), key, std::string("holds ") + node.kind() + ", but an integer is read: skipped");
      check_.readings.push_back({key, "absent", "absent", "24 bits", {}});
      return;
    }
    const auto value = static_cast<u32>(*stored);
    const std::string number = hex_number(value, 6);
    short_audio_desc_t format{};
    const bool decodes = decode_edid_short_audio(static_cast<u8>(value), static_cast<u8>(value >> 8),
                                                 static_cast<u8>(value >> 16), &format) != 0;
    if (value > largest_audio_entry) {
      find(node.position(), key, number + " has more than 24 bits: those above are not read");
    }
    if (!decodes) {
      find(node.position(), key, number + " is no audio format: skipped");
    } else if (format.type == 0) {
      find(node.position(), key,
           number +
               " is an extended format without a meaning: what offers it is "
               "refused");
    } else if (taken == most_audio_entries) {
      find(node.position(), key, "has no effect: only " + std::to_string(most_audio_entries) + " formats are encoded");
    } else {
      ++taken;
    }
    check_.readings.push_back({key, number + (decodes ? kind_of(format) : ""), "absent", "24 bits", node.position()});
  }

  void find_wrong_kind(const platform_key_t &key, const configuration_node_t &node, const char *wanted,
                       const std::string &effect) {
    find(node.position(), key.name, std::string("holds ") + node.kind() + ", but " + wanted + " is read: " + effect);
  }

  void add(const platform_key_t &key, const std::string &value, const std::string &default_value,
           const std::string &limits, bool is_from_file, const std::optional<configuration_node_t> &node) {
    check_.readings.push_back({key.name, value, default_value, limits, is_from_file ? node->position() : position_t{}});
  }

  platform_check_t check_;
  list_reading_t lists_;
  bool has_table_ = false;
};

}  // namespace

platform_check_t check_platform() {
  return checker_t().run();
}

}  // namespace edid_cli
