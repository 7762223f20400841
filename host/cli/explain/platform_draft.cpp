#include "explain/platform_draft.h"

#include <algorithm>
#include <cstdlib>

#include "platform/platform_keys.h"
#include "text/hexadecimal.h"

namespace edid_cli {
namespace {

std::string literal(const configuration_node_t &node) {
  const auto number = node.integer();
  return number ? std::to_string(*number) : quoted(node.text().value_or(""));
}

draft_entry_t read_entry(const configuration_node_t &node, const std::string &key) {
  draft_entry_t entry{key, node.is_branch(), {}, node.position().line};
  if (!entry.is_list) {
    entry.values.push_back({literal(node), entry.line});
    return entry;
  }
  for (const configuration_node_t &child : node.children()) {
    // A table inside of a list is not a value for the library either.
    entry.values.push_back({literal(child), child.position().line});
  }
  return entry;
}

/// The key without its table, and its value.
std::string assignment(const draft_entry_t &entry) {
  std::string values;
  for (const draft_value_t &value : entry.values) {
    values += (values.empty() ? "" : ", ") + value.text;
  }
  const std::string key = entry.key.substr(entry.key.find('.') + 1);
  return quoted(key) + " = " + (entry.is_list ? "[" + values + "]" : values) + "\n";
}

}  // namespace

u32 leading_number(const std::string &value) {
  const std::size_t first = value.find_first_not_of('"');
  return first == std::string::npos ? 0 : static_cast<u32>(std::strtol(value.c_str() + first, nullptr, 0));
}

std::string quoted(const std::string &text) {
  std::string result = "\"";
  for (const char character : text) {
    const auto byte = static_cast<unsigned char>(character);
    if (byte < 0x20 || byte == 0x7F) {
      result += "\\u" + hex_digits(byte, 4);
    } else {
      result += character == '"' || character == '\\' ? "\\" : "";
      result += character;
    }
  }
  return result + "\"";
}

platform_draft_t::platform_draft_t() {
  read_table(platform_domain, "");
  for (const char *const table : inner_tables) {
    read_table(platform_path(table), std::string(table) + ".");
  }
}

void platform_draft_t::read_table(const std::string &path, const std::string &prefix) {
  const auto table = configuration_node_t::find(path);
  for (const configuration_node_t &node : table ? table->children() : std::vector<configuration_node_t>{}) {
    const std::string key = prefix + node.name();
    if (!is_inner_table(key) || !node.is_branch()) {
      entries_.push_back(read_entry(node, key));
    }
  }
}

const draft_entry_t *platform_draft_t::find(const std::string &key) const {
  const auto found =
      std::find_if(entries_.begin(), entries_.end(), [&key](const draft_entry_t &entry) { return entry.key == key; });
  return found != entries_.end() ? &*found : nullptr;
}

i32 platform_draft_t::number(const std::string &key, i32 otherwise) const {
  const draft_entry_t *const entry = find(key);
  const bool is_number = entry != nullptr && !entry->is_list && !entry->values.front().text.starts_with('"');
  return is_number ? static_cast<i32>(leading_number(entry->values.front().text)) : otherwise;
}

draft_entry_t &platform_draft_t::at(const std::string &key) {
  const auto found =
      std::find_if(entries_.begin(), entries_.end(), [&key](const draft_entry_t &entry) { return entry.key == key; });
  return found != entries_.end() ? *found : entries_.emplace_back(draft_entry_t{key, false, {}, 0});
}

void platform_draft_t::set(const std::string &key, const std::string &value) {
  draft_entry_t &entry = at(key);
  entry.is_list = false;
  entry.values = {{value}};
}

void platform_draft_t::erase(const std::string &key) {
  std::erase_if(entries_, [&key](const draft_entry_t &entry) { return entry.key == key; });
}

void platform_draft_t::add_to_list(const std::string &key, const std::string &value) {
  draft_entry_t &entry = at(key);
  if (!entry.is_list) {
    entry.values.clear();
    entry.is_list = true;
  }
  entry.values.push_back({value});
}

void platform_draft_t::take_out_of_list(const std::string &key, const std::string &value) {
  auto &values = at(key).values;
  const auto last =
      std::find_if(values.rbegin(), values.rend(), [&value](const auto &one) { return one.text == value; });
  if (last != values.rend()) {
    values.erase(std::next(last).base());
  }
}

void platform_draft_t::replace_in_list(const std::string &key, const std::string &old_value, const std::string &value) {
  auto &values = at(key).values;
  const auto last =
      std::find_if(values.rbegin(), values.rend(), [&old_value](const auto &one) { return one.text == old_value; });
  if (last != values.rend()) {
    last->text = value;
  }
}

std::string platform_draft_t::keys_of(const std::string &table) const {
  std::string keys;
  for (const draft_entry_t &entry : entries_) {
    keys += inner_table_of(entry.key) == table ? assignment(entry) : "";
  }
  return keys;
}

std::string platform_draft_t::toml() const {
  std::string text = "[" + std::string(platform_domain) + "]\n" + keys_of("");
  for (const char *const table : inner_tables) {
    text += "[" + platform_path(table) + "]\n" + keys_of(table);
  }
  return text;
}

}  // namespace edid_cli
