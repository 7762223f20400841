#include "platform/platform_places.h"

#include "platform/list_reading.h"
#include "platform/platform_keys.h"

namespace edid_cli {
namespace {

std::string text_of(const configuration_node_t &node) {
  const auto number = node.integer();
  return number ? std::to_string(*number) : node.text().value_or("");
}

std::vector<list_entry_t> entries_that_count(const std::string &key, const std::vector<entry_messages_t> &messages) {
  std::vector<list_entry_t> entries;
  const auto list = configuration_node_t::find(platform_path(key));
  const auto nodes = list && list->is_branch() ? list->children() : std::vector<configuration_node_t>{};
  for (std::size_t index = 0; index < nodes.size(); ++index) {
    if (index >= messages.size() || !is_skipped(messages[index])) {
      entries.push_back({key + "[" + std::to_string(index) + "]", text_of(nodes[index]), nodes[index].position()});
    }
  }
  return entries;
}

std::vector<list_entry_t> audio_entries() {
  std::vector<list_entry_t> entries;
  for (const std::string &key : audio_entry_keys()) {
    const auto node = configuration_node_t::find(platform_path(key));
    if (node && node->integer()) {
      entries.push_back({key, text_of(*node), node->position()});
    }
  }
  return entries;
}

}  // namespace

std::string platform_list::priority(u32 family) {
  return std::to_string(family) + "_hz_priority_list";
}

std::string platform_list::addition(u32 family) {
  return std::to_string(family) + "_hz_addition_list";
}

platform_places_t::platform_places_t(std::string name) : name_(std::move(name)) {
  for (const auto &[key, messages] : read_lists().lists) {
    lists_[key] = entries_that_count(key, messages);
  }
  lists_[platform_list::audio] = audio_entries();
}

const std::vector<list_entry_t> &platform_places_t::entries(const std::string &list) const {
  static const std::vector<list_entry_t> none;
  const auto found = lists_.find(list);
  return found != lists_.end() ? found->second : none;
}

const list_entry_t *platform_places_t::entry(const std::string &list, i32 place) const {
  const std::vector<list_entry_t> &all = entries(list);
  return place >= 0 && static_cast<std::size_t>(place) < all.size() ? &all[static_cast<std::size_t>(place)] : nullptr;
}

std::string platform_places_t::place_of(const std::string &key) const {
  return place_of(position_of(key));
}

std::string platform_places_t::place_of(const position_t &position) const {
  return position.line == 0 ? name_ : name_ + ":" + std::to_string(position.line);
}

position_t platform_places_t::position_of(const std::string &key) {
  const auto node = configuration_node_t::find(platform_path(key));
  return node ? node->position() : position_t{};
}

i32 platform_places_t::number_at(const std::string &key, i32 otherwise) {
  const auto node = configuration_node_t::find(platform_path(key));
  return node ? node->integer().value_or(otherwise) : otherwise;
}

std::string platform_places_t::value_at(const std::string &key) {
  const auto node = configuration_node_t::find(platform_path(key));
  return !node || node->is_branch() ? "" : node->integer() ? text_of(*node) : "\"" + text_of(*node) + "\"";
}

}  // namespace edid_cli
