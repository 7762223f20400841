#include "toml_edit.h"

#include <algorithm>
#include <iterator>
#include <vector>

#include "config_store.h"
#include "explain/platform_draft.h"
#include "io/bad_input.h"
#include "platform/configuration_node.h"
#include "platform/platform_keys.h"
#include "toml_text.h"

namespace edid_web {
namespace {

using edid_cli::bad_input_t;
using edid_cli::configuration_node_t;
using edid_cli::platform_draft_t;
using edid_cli::step_action_t;
using edid_cli::step_t;

void load(const std::string &text, const std::string &name) {
  if (!config_store_load_text(text.data(), text.size(), name.c_str())) {
    throw bad_input_t(config_store_error());
  }
}

/// One change of a text whose tree is loaded. What it makes of a layout that is not foreseen is refused later.
class editor_t {
 public:
  editor_t(std::string &text, const std::string &key) : text_(text), path_(edid_cli::platform_path(key)), key_(key) {}

  void set(const std::string &value) {
    const auto node = configuration_node_t::find(path_);
    const std::size_t begin = node ? value_at(*node) : std::string::npos;
    if (begin == std::string::npos) {
      insert_key(value);
    } else {
      text_.replace(begin, end_of_value(text_, begin) - begin, value);
    }
  }

  void take_out() {
    const auto node = configuration_node_t::find(path_);
    const std::size_t value = node ? value_at(*node) : std::string::npos;
    if (value != std::string::npos) {
      remove(place_of(*node), end_of_value(text_, value));
    }
  }

  void add_to_list(const std::string &value) {
    const auto node = configuration_node_t::find(path_);
    if (!node || !node->is_branch()) {
      set("[" + value + "]");
      return;
    }
    const auto entries = node->children();
    if (!entries.empty()) {
      insert_after_entry(place_of(entries.back()), value);
    } else if (const std::size_t bracket = value_at(*node); bracket != std::string::npos) {
      text_.insert(bracket + 1, value);
    }
  }

  /// Of several alike it is the last that a step is about.
  void replace_in_list(const std::string &old_value, const std::string &value) {
    const std::size_t begin = last_entry(old_value);
    if (begin != std::string::npos) {
      text_.replace(begin, end_of_value(text_, begin) - begin, value);
    }
  }

  void take_out_of_list(const std::string &value) {
    const std::size_t begin = last_entry(value);
    if (begin == std::string::npos) {
      return;
    }
    const std::size_t end = end_of_value(text_, begin);
    const std::size_t next = text_.find_first_not_of(" \t\r\n", end);
    if (next != std::string::npos && text_[next] == ',') {
      remove(begin, next + 1);
      return;
    }
    const std::size_t comma = text_.rfind(',', begin);
    const bool has_comma = comma != std::string::npos && text_.find_first_not_of(" \t\r\n", comma + 1) == begin;
    remove(has_comma ? comma : begin, end);
  }

 private:
  std::size_t place_of(const configuration_node_t &node) const { return offset_of(text_, node.position()); }
  std::size_t value_at(const configuration_node_t &node) const { return value_of_key(text_, place_of(node)); }

  /// An entry on a line of its own gets a neighbour on the next.
  void insert_after_entry(std::size_t entry, const std::string &value) {
    const std::size_t end = end_of_value(text_, entry);
    const std::size_t next = after_blanks(text_, end);
    const bool has_comma = next < text_.size() && text_[next] == ',';
    if (!begins_line(text_, entry) || !ends_line(text_, has_comma ? next + 1 : end)) {
      text_.insert(end, ", " + value);
      return;
    }
    const std::size_t line = begin_of_line(text_, entry);
    text_.insert(end_of_line(text_, entry), "\n" + text_.substr(line, entry - line) + value + ",");
    if (!has_comma) {
      text_.insert(end, ",");
    }
  }

  /// After the last key of its table.
  void insert_key(const std::string &value) {
    const std::size_t dot = path_.rfind('.');
    const std::string table = path_.substr(0, dot);
    const std::string line = path_.substr(dot + 1) + " = " + value;
    const auto node = configuration_node_t::find(table);
    if (!node) {
      text_ += (text_.empty() || text_.ends_with('\n') ? "\n[" : "\n\n[") + table + "]\n" + line + "\n";
      return;
    }
    std::size_t place = node->position().line != 0 ? place_of(*node) : 0;
    for (const configuration_node_t &child : node->children()) {
      if (const std::size_t begin = value_at(child); begin != std::string::npos) {
        place = std::max(place, end_of_value(text_, begin));
      }
    }
    text_.insert(end_of_line(text_, place), "\n" + line);
  }

  /// The offset of the last entry that is written so; npos when there is none.
  std::size_t last_entry(const std::string &value) const {
    const platform_draft_t draft;
    const auto *const list = draft.find(key_);
    const auto node = configuration_node_t::find(path_);
    if (list == nullptr || !node) {
      return std::string::npos;
    }
    const auto found = std::find_if(list->values.rbegin(), list->values.rend(),
                                    [&value](const auto &entry) { return entry.text == value; });
    if (found == list->values.rend()) {
      return std::string::npos;
    }
    const auto index = static_cast<std::size_t>(std::distance(list->values.begin(), found.base()) - 1);
    return place_of(node->children().at(index));
  }

  /// Takes the line with it, where nothing else but a comment stands there.
  void remove(std::size_t begin, std::size_t end) {
    if (begins_line(text_, begin) && ends_line(text_, end)) {
      begin = begin_of_line(text_, begin);
      end = std::min(end_of_line(text_, end) + 1, text_.size());
    } else if (end < text_.size() && text_[end] == ' ') {
      ++end;
    }
    text_.erase(begin, end - begin);
  }

  std::string &text_;
  std::string path_;
  std::string key_;
};

void do_step(std::string &text, const step_t &step) {
  editor_t editor(text, step.key);
  switch (step.action) {
    case step_action_t::add_to_list:
      return editor.add_to_list(step.value);
    case step_action_t::take_out_of_list:
      return editor.take_out_of_list(step.value);
    case step_action_t::replace_in_list:
      return editor.replace_in_list(step.old_value, step.value);
    case step_action_t::set_key:
      return editor.set(step.value);
    case step_action_t::take_out_key:
      return editor.take_out();
    case step_action_t::give_option:
    case step_action_t::drop_option:
      return;
  }
}

/// What a text holds: the keys with their values, in an order that does not depend on the text's.
std::vector<std::string> content_of(const std::string &text, const std::string &name) {
  load(text, name);
  std::vector<std::string> content;
  const platform_draft_t draft;
  for (const auto &entry : draft.entries()) {
    std::string line = entry.key + (entry.is_list ? " = [" : " = ");
    for (const auto &value : entry.values) {
      line += value.text + ",";
    }
    content.push_back(line);
  }
  std::sort(content.begin(), content.end());
  return content;
}

}  // namespace

std::string with_steps(std::string text, const std::string &name, const edid_cli::steps_t &steps) {
  load(text, name);
  platform_draft_t expected;
  edid_cli::composition_options_t unused;
  edid_cli::apply(steps, expected, unused);
  for (const step_t &step : steps) {
    do_step(text, step);
    load(text, name);
  }
  if (content_of(text, name) != content_of(expected.toml(), name)) {
    throw bad_input_t(name + ": the steps cannot be written into this layout: please do them by hand");
  }
  return text;
}

}  // namespace edid_web
