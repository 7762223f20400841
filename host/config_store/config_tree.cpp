#include "config_tree.h"

#include <bit>
#include <cstring>

namespace edid_config_store {
namespace {

std::uint64_t eight_characters(const char *characters) {
  std::uint64_t word = 0;
  std::memcpy(&word, characters, sizeof word);
  return word;
}

/// Sixteen characters at a time, in two sums that don't wait for each other: a composition looks some seventy paths of
/// fifty characters up.
std::uint32_t hash_of(std::string_view path) {
  constexpr std::uint64_t odd = 0x9E3779B97F4A7C15U;
  const char *next = path.data();
  const char *const end = next + path.size();
  std::uint64_t first = path.size();
  std::uint64_t second = odd;
  for (; end - next >= 16; next += 16) {
    first = (first ^ eight_characters(next)) * odd;
    second = (second ^ eight_characters(next + 8)) * odd;
  }
  if (path.size() >= 16) {
    // The rest, and as many characters before it as fill sixteen.
    first = (first ^ eight_characters(end - 16)) * odd;
    second = (second ^ eight_characters(end - 8)) * odd;
  } else {
    for (; next != end; ++next)
      first = (first ^ static_cast<unsigned char>(*next)) * odd;
  }
  const std::uint64_t mixed = (first ^ first >> 29) * odd ^ (second ^ second >> 32) * odd;
  return static_cast<std::uint32_t>(mixed >> 32);
}

}  // namespace

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
  index_.assign(std::bit_ceil(2 * nodes_.size()), slot_t{});
  const std::size_t mask = index_.size() - 1;
  for (node_handle_t node = 0; node < nodes_.size(); ++node) {
    const std::uint32_t hash = hash_of(view(nodes_[node].path));
    std::size_t slot = hash & mask;
    while (index_[slot].node != no_node) {
      slot = (slot + 1) & mask;
    }
    index_[slot] = {hash, node};
  }
}

std::optional<node_handle_t> config_tree_t::find(std::string_view path) const {
  const std::size_t mask = index_.size() - 1;
  const std::uint32_t hash = hash_of(path);
  for (std::size_t slot = hash & mask; index_[slot].node != no_node; slot = (slot + 1) & mask) {
    if (index_[slot].hash == hash && view(nodes_[index_[slot].node].path) == path) {
      return index_[slot].node;
    }
  }
  return std::nullopt;
}

config_tree_t::span_t config_tree_t::store(std::string_view characters) {
  const span_t span{static_cast<std::uint32_t>(characters_.size()), static_cast<std::uint32_t>(characters.size())};
  characters_ += characters;
  return span;
}

}  // namespace edid_config_store
