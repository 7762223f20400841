// The configuration tree: named nodes that hold an integer, a text or children, found by path or by handle.
#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace edid_config_store {

/// A handle is the node's position in the tree's node table; the root is 0.
using node_handle_t = std::uint32_t;
inline constexpr node_handle_t root_handle = 0;

enum class node_kind_t : std::uint8_t { branch, integer, text };

/// Where a node stands in the document that it comes from, counted from 1.
struct node_position_t {
  std::uint32_t line = 0;
  std::uint32_t column = 0;
};

/// Built once with the add operations, then sealed by build_index() and only read.
class config_tree_t {
 public:
  config_tree_t();

  /// Appends a child to @p parent. @p name is unique among its siblings and not empty.
  node_handle_t add_branch(node_handle_t parent, std::string_view name, node_position_t position);
  void add_integer(node_handle_t parent, std::string_view name, node_position_t position, std::int32_t number);
  void add_text(node_handle_t parent, std::string_view name, node_position_t position, std::string_view text);

  /// Makes the nodes added so far known to find().
  void build_index();

  /// Finds the node at a path from the root; the empty path is the root. Takes the same time for any size of the tree.
  std::optional<node_handle_t> find(std::string_view path) const;

  std::optional<node_handle_t> first_child(node_handle_t node) const {
    const node_t *entry = at(node);
    return entry == nullptr || entry->first_child == no_node ? std::nullopt : std::optional(entry->first_child);
  }
  std::optional<node_handle_t> next_sibling(node_handle_t node) const {
    const node_t *entry = at(node);
    return entry == nullptr || entry->next_sibling == no_node ? std::nullopt : std::optional(entry->next_sibling);
  }

  /// What a node is and holds. Views live as long as the tree; for a handle of no node there is nothing.
  std::optional<std::string_view> path(node_handle_t node) const {
    const node_t *entry = at(node);
    return entry == nullptr ? std::nullopt : std::optional(view(entry->path));
  }
  std::optional<std::string_view> name(node_handle_t node) const {
    const node_t *entry = at(node);
    if (entry == nullptr) {
      return std::nullopt;
    }
    return view({entry->path.offset + entry->path.length - entry->name_length, entry->name_length});
  }
  std::optional<std::int32_t> integer(node_handle_t node) const {
    const node_t *entry = at(node);
    return entry == nullptr || entry->kind != node_kind_t::integer ? std::nullopt : std::optional(entry->number);
  }
  std::optional<std::string_view> text(node_handle_t node) const {
    const node_t *entry = at(node);
    return entry == nullptr || entry->kind != node_kind_t::text ? std::nullopt : std::optional(view(entry->text));
  }
  /// The root has none.
  std::optional<node_position_t> position(node_handle_t node) const {
    const node_t *entry = at(node);
    return entry == nullptr || node == root_handle ? std::nullopt : std::optional(entry->position);
  }

 private:
  static constexpr node_handle_t no_node = 0xFFFFFFFF;

  /// A stretch of characters_.
  struct span_t {
    std::uint32_t offset = 0;
    std::uint32_t length = 0;
  };

  struct node_t {
    node_kind_t kind = node_kind_t::branch;
    node_position_t position;
    std::int32_t number = 0;
    span_t path;  ///< The name is its end.
    std::uint32_t name_length = 0;
    span_t text;
    node_handle_t first_child = no_node;
    node_handle_t last_child = no_node;
    node_handle_t next_sibling = no_node;
  };

  node_handle_t add(node_handle_t parent, std::string_view name, node_position_t position, node_kind_t kind);
  span_t store(std::string_view characters);
  std::string_view view(span_t span) const { return {characters_.data() + span.offset, span.length}; }
  const node_t *at(node_handle_t node) const { return node < nodes_.size() ? &nodes_[node] : nullptr; }

  std::vector<node_t> nodes_;
  std::string characters_;
  struct slot_t {
    std::uint32_t hash = 0;  ///< Of the node's path; compared before the path is.
    node_handle_t node = no_node;
  };
  /// Open addressing by the path's hash, with at least half of the slots free. Its size is a power of two.
  std::vector<slot_t> index_;
};

}  // namespace edid_config_store
