#include "platform/platform_places.h"

#include "platform/configuration_readings.h"
#include "platform/platform_keys.h"

namespace edid_cli {
namespace {

std::string text_of(const configuration_node_t &node) {
  const auto number = node.integer();
  return number ? std::to_string(*number) : node.text().value_or("");
}

}  // namespace

std::string platform_list::priority(u32 family) {
  return std::to_string(family) + "_hz_priority_list";
}

std::string platform_list::addition(u32 family) {
  return std::to_string(family) + "_hz_addition_list";
}

platform_places_t::platform_places_t(std::string name) : name_(std::move(name)) {
  for (const kept_reading_t &reading : compose_without_sink(default_settings()).readings) {
    const auto node = reading.place < 0 ? std::nullopt : node_of(reading);
    if (node) {
      const bool is_audio = reading.key->kind == CONFIGURATION_AUDIO_FORMATS;
      lists_[is_audio ? platform_list::audio : reading.key->name].push_back(
          {name_of(reading), text_of(*node), node->position()});
    }
  }
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
