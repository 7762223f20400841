#include "config_tree.h"

#include <bit>
#include <functional>

namespace edid_config_store {

config_tree_t::config_tree_t() {
  nodes_.emplace_back();
  build_index();
}

node_handle_t config_tree_t::add_branch(node_handle_t parent, std::string_view name, node_position_t position) {
  return add(parent, name, position, node_kind_t::branch);
}

void config_tree_t::add_integer(node_handle_t parent, std::string_view name, node_position_t position,
                                std::int32_t number) {
  const node_handle_t node = add(parent, name, position, node_kind_t::integer);
  nodes_[node].number = number;
}

void config_tree_t::add_text(node_handle_t parent, std::string_view name, node_position_t position,
                             std::string_view text) {
  const node_handle_t node = add(parent, name, position, node_kind_t::text);
  nodes_[node].text = store(text);
}

node_handle_t config_tree_t::add(node_handle_t parent, std::string_view name, node_position_t position,
                                 node_kind_t kind) {
  std::string path(view(nodes_[parent].path));
  if (!path.empty()) {
    path += '.';
  }
  path += name;

  const auto node = static_cast<node_handle_t>(nodes_.size());
  node_t entry;
  entry.kind = kind;
  entry.position = position;
  entry.path = store(path);
  entry.name_length = static_cast<std::uint32_t>(name.size());
  nodes_.push_back(entry);

  if (nodes_[parent].last_child == no_node) {
    nodes_[parent].first_child = node;
  } else {
    nodes_[nodes_[parent].last_child].next_sibling = node;
  }
  nodes_[parent].last_child = node;
  return node;
}

void config_tree_t::build_index() {
  index_.assign(std::bit_ceil(2 * nodes_.size()), no_node);
  const std::size_t mask = index_.size() - 1;
  for (node_handle_t node = 0; node < nodes_.size(); ++node) {
    std::size_t slot = std::hash<std::string_view>{}(view(nodes_[node].path)) & mask;
    while (index_[slot] != no_node) {
      slot = (slot + 1) & mask;
    }
    index_[slot] = node;
  }
}

std::optional<node_handle_t> config_tree_t::find(std::string_view path) const {
  const std::size_t mask = index_.size() - 1;
  std::size_t slot = std::hash<std::string_view>{}(path)&mask;
  while (index_[slot] != no_node) {
    if (view(nodes_[index_[slot]].path) == path) {
      return index_[slot];
    }
    slot = (slot + 1) & mask;
  }
  return std::nullopt;
}

std::optional<node_handle_t> config_tree_t::first_child(node_handle_t node) const {
  const node_t *entry = at(node);
  if (entry == nullptr || entry->first_child == no_node) {
    return std::nullopt;
  }
  return entry->first_child;
}

std::optional<node_handle_t> config_tree_t::next_sibling(node_handle_t node) const {
  const node_t *entry = at(node);
  if (entry == nullptr || entry->next_sibling == no_node) {
    return std::nullopt;
  }
  return entry->next_sibling;
}

std::optional<std::string_view> config_tree_t::path(node_handle_t node) const {
  const node_t *entry = at(node);
  if (entry == nullptr) {
    return std::nullopt;
  }
  return view(entry->path);
}

std::optional<std::string_view> config_tree_t::name(node_handle_t node) const {
  const node_t *entry = at(node);
  if (entry == nullptr) {
    return std::nullopt;
  }
  const std::string_view path = view(entry->path);
  return path.substr(path.size() - entry->name_length);
}

std::optional<std::int32_t> config_tree_t::integer(node_handle_t node) const {
  const node_t *entry = at(node);
  if (entry == nullptr || entry->kind != node_kind_t::integer) {
    return std::nullopt;
  }
  return entry->number;
}

std::optional<std::string_view> config_tree_t::text(node_handle_t node) const {
  const node_t *entry = at(node);
  if (entry == nullptr || entry->kind != node_kind_t::text) {
    return std::nullopt;
  }
  return view(entry->text);
}

std::optional<node_position_t> config_tree_t::position(node_handle_t node) const {
  const node_t *entry = at(node);
  if (entry == nullptr || node == root_handle) {
    return std::nullopt;
  }
  return entry->position;
}

config_tree_t::span_t config_tree_t::store(std::string_view characters) {
  const span_t span{static_cast<std::uint32_t>(characters_.size()), static_cast<std::uint32_t>(characters.size())};
  characters_ += characters;
  return span;
}

std::string_view config_tree_t::view(span_t span) const {
  return std::string_view(characters_).substr(span.offset, span.length);
}

const config_tree_t::node_t *config_tree_t::at(node_handle_t node) const {
  return node < nodes_.size() ? &nodes_[node] : nullptr;
}

}  // namespace edid_config_store
