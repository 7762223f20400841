#include "support/configuration_tree.h"

#include <algorithm>
#include <deque>
#include <map>
#include <mutex>
#include <optional>

namespace test_support {
namespace {

constexpr int done = 0;
constexpr int holds_no_such_value = 1;
constexpr int not_found = 2;

struct node_t {
  std::string name;
  std::size_t parent = 0;
  std::vector<std::size_t> children;
  std::optional<i32> number;
  std::optional<std::string> text;
};

std::recursive_mutex guard;
std::vector<configuration_tree_t::state_t *> living_trees;

}  // namespace

struct configuration_tree_t::state_t {
  std::deque<node_t> nodes{node_t{}};  // The first is the root; handles are positions.
  std::vector<config_call_t> calls;
  std::map<config_operation_t, int> answers;

  std::optional<std::size_t> child(std::size_t parent, const std::string &name) const {
    for (const std::size_t node : nodes[parent].children) {
      if (nodes[node].name == name) return node;
    }
    return std::nullopt;
  }

  std::size_t append(std::size_t parent, const std::string &name) {
    node_t node;
    node.name = name;
    node.parent = parent;
    nodes.push_back(node);
    nodes[parent].children.push_back(nodes.size() - 1);
    return nodes.size() - 1;
  }

  /// The node at a full path; null when there is none. With @p make, missing nodes are made.
  std::optional<std::size_t> at(const std::string &path, bool make) {
    std::size_t node = 0;
    for (std::size_t start = 0; start <= path.size();) {
      const std::size_t end = std::min(path.find('.', start), path.size());
      const std::string name = path.substr(start, end - start);
      std::optional<std::size_t> next = child(node, name);
      if (!next && !make) return std::nullopt;
      node = next ? *next : append(node, name);
      start = end + 1;
    }
    return node;
  }

  std::size_t make(const std::string &key) { return *at("platform.software.drivers.vorex.edid." + key, true); }

  node_t &make_entry(const std::string &key, const std::string &name) {
    const std::size_t list = make(key);
    const std::string default_name = "entry_" + std::to_string(nodes[list].children.size());
    return nodes[append(list, name.empty() ? default_name : name)];
  }

  node_t *node(u32 handle) { return handle < nodes.size() ? &nodes[handle] : nullptr; }

  /// What the operation answers when the tree's own answer would be @p status.
  int answer(config_operation_t operation, int status) const {
    const auto found = answers.find(operation);
    return found == answers.end() ? status : found->second;
  }
};

namespace {

int copy_text(const std::string &text, char *buffer, u32 size) {
  if (size == 0) return done;
  const std::size_t length = std::min<std::size_t>(text.size(), size - 1);
  text.copy(buffer, length);
  buffer[length] = '\0';
  return done;
}

/// Records the call and lets @p work answer it from the current tree.
template <typename work_t>
int serve(const config_call_t &call, const work_t &work) {
  const std::lock_guard<std::recursive_mutex> lock(guard);
  if (living_trees.empty()) return not_found;
  configuration_tree_t::state_t &tree = *living_trees.back();
  tree.calls.push_back(call);
  return tree.answer(call.operation, work(tree));
}

int number_of(const node_t *node, i32 *value) {
  if (node == nullptr) return not_found;
  if (!node->number) return holds_no_such_value;
  *value = *node->number;
  return done;
}

int text_of(const node_t *node, char *buffer, u32 size) {
  if (node == nullptr) return not_found;
  return node->text ? copy_text(*node->text, buffer, size) : holds_no_such_value;
}

const node_t *node_at(configuration_tree_t::state_t &tree, const char *path) {
  const std::optional<std::size_t> found = tree.at(path, false);
  return found ? &tree.nodes[*found] : nullptr;
}

}  // namespace

configuration_tree_t::configuration_tree_t() : state_(std::make_unique<state_t>()) {
  const std::lock_guard<std::recursive_mutex> lock(guard);
  living_trees.push_back(state_.get());
}

configuration_tree_t::~configuration_tree_t() {
  const std::lock_guard<std::recursive_mutex> lock(guard);
  living_trees.erase(std::find(living_trees.begin(), living_trees.end(), state_.get()));
}

void configuration_tree_t::set(const std::string &key, std::int64_t value) {
  node_t &node = state_->nodes[state_->make(key)];
  node.number = static_cast<i32>(static_cast<u32>(value));
  node.text.reset();
}

void configuration_tree_t::set(const std::string &key, const std::string &value) {
  node_t &node = state_->nodes[state_->make(key)];
  node.text = value;
  node.number.reset();
}

void configuration_tree_t::add(const std::string &key, std::int64_t value, const std::string &name) {
  state_->make_entry(key, name).number = static_cast<i32>(static_cast<u32>(value));
}

void configuration_tree_t::add(const std::string &key, const std::string &value, const std::string &name) {
  state_->make_entry(key, name).text = value;
}

void configuration_tree_t::add_empty(const std::string &key, const std::string &name) {
  state_->make_entry(key, name);
}

void configuration_tree_t::add_list(const std::string &key) {
  state_->make(key);
}

void configuration_tree_t::remove(const std::string &key) {
  const std::size_t node = state_->make(key);
  std::vector<std::size_t> &siblings = state_->nodes[state_->nodes[node].parent].children;
  siblings.erase(std::find(siblings.begin(), siblings.end(), node));
}

void configuration_tree_t::clear() {
  state_->nodes = {node_t{}};
}

void configuration_tree_t::answer(config_operation_t operation, int status) {
  state_->answers[operation] = status;
}

int configuration_tree_t::lookups() const {
  return static_cast<int>(state_->calls.size());
}

std::vector<config_call_t> configuration_tree_t::calls() const {
  return state_->calls;
}

int configuration_tree_t::forget_calls(const std::string &path) {
  const std::lock_guard<std::recursive_mutex> lock(guard);
  if (living_trees.empty()) return 0;
  return static_cast<int>(
      std::erase_if(living_trees.back()->calls, [&](const config_call_t &call) { return call.path == path; }));
}

bool configuration_tree_t::is_there() {
  const std::lock_guard<std::recursive_mutex> lock(guard);
  return !living_trees.empty();
}

void configuration_tree_t::fill_completely() {
  static const std::vector<std::pair<const char *, i32>> numbers{
      {"native_refresh_rate", 50},
      {"current_mode_set_to_priority", 1},
      {"audio.pass_through", 1},
      {"underscan", 1},
      {"is_tv", 1},
      {"geometry_limit", 1},
      {"dc_30bit", 1},
      {"dc_36bit", 1},
      {"tmds_override", 300},
      {"supports_ai", 1},
      {"speaker_entry", 79},
      {"xvYCC601", 1},
      {"xvYCC709", 2},
      {"native_bit", 0},
      {"product_id", 0x1234},
      {"serial", 0x01020304},
      {"week", 20},
      {"year", 2014},
      {"CNC0", 1},
      {"CNC1", 2},
      {"CNC2", 1},
      {"CNC3", 2},
      {"audio.entry_a", 0x070709},
      {"audio.entry_c", 0x500715},
  };
  static const std::vector<std::pair<const char *, const char *>> texts{
      {"manufacturer_id", "TST"}, {"monitor_name", "Living room"}, {"monitor_serial", "SN-0042"}};
  static const std::vector<std::pair<const char *, std::vector<const char *>>> text_lists{
      {"50_hz_priority_list", {"31 FP TBH", "19 FP TBH", "20 SBSH", "17"}},
      {"50_hz_addition_list", {"18", "21"}},
      {"60_hz_priority_list", {"16 FP TBH", "4 FP TBH", "5 SBSH", "2"}},
      {"60_hz_addition_list", {"3", "1"}},
      {"standard_timings", {"1280 1024 60", "1920x1080x60"}}};
  static const std::vector<std::pair<const char *, std::vector<i32>>> number_lists{
      {"4k_x_2k_priority_list", {1, 2, 3}}, {"4k_x_2k_addition_list", {4}}, {"established_timings_1", {5, 0}},
      {"established_timings_2", {3}},       {"manufacturer_timings", {7}},
  };
  for (const auto &[key, value] : numbers)
    set(key, value);
  for (const auto &[key, value] : texts)
    set(key, std::string(value));
  for (const auto &[key, values] : text_lists) {
    for (const char *value : values)
      add(key, std::string(value));
  }
  for (const auto &[key, values] : number_lists) {
    for (const i32 value : values)
      add(key, value);
  }
}

}  // namespace test_support

using test_support::config_operation_t;

int config_get_int(u32 root, const char *path, i32 *value) {
  return test_support::serve({config_operation_t::get_int, root, path, 0}, [&](auto &tree) {
    return test_support::number_of(test_support::node_at(tree, path), value);
  });
}

int config_get_str(u32 root, const char *path, char *buffer, u32 size) {
  return test_support::serve({config_operation_t::get_str, root, path, size}, [&](auto &tree) {
    return test_support::text_of(test_support::node_at(tree, path), buffer, size);
  });
}

int config_node_find(u32 root, const char *path, u32 *node) {
  return test_support::serve({config_operation_t::node_find, root, path, 0}, [&](auto &tree) {
    const auto found = tree.at(path, false);
    if (!found) return test_support::not_found;
    *node = static_cast<u32>(*found);
    return test_support::done;
  });
}

int config_node_first_child(u32 node, u32 *child) {
  return test_support::serve({config_operation_t::node_first_child, node, "", 0}, [&](auto &tree) {
    const auto *found = tree.node(node);
    if (found == nullptr || found->children.empty()) return test_support::not_found;
    *child = static_cast<u32>(found->children.front());
    return test_support::done;
  });
}

int config_node_next_sibling(u32 node, u32 *sibling) {
  return test_support::serve({config_operation_t::node_next_sibling, node, "", 0}, [&](auto &tree) {
    const auto *found = tree.node(node);
    if (found == nullptr) return test_support::not_found;
    const std::vector<std::size_t> &siblings = tree.nodes[found->parent].children;
    const auto self = std::find(siblings.begin(), siblings.end(), node);
    if (self == siblings.end() || self + 1 == siblings.end()) return test_support::not_found;
    *sibling = static_cast<u32>(*(self + 1));
    return test_support::done;
  });
}

int config_node_get_name(u32 node, char *buffer, u32 size) {
  return test_support::serve({config_operation_t::node_get_name, node, "", size}, [&](auto &tree) {
    const auto *found = tree.node(node);
    return found == nullptr ? test_support::not_found : test_support::copy_text(found->name, buffer, size);
  });
}

int config_node_get_int(u32 node, i32 *value) {
  return test_support::serve({config_operation_t::node_get_int, node, "", 0},
                             [&](auto &tree) { return test_support::number_of(tree.node(node), value); });
}

int config_node_get_str(u32 node, char *buffer, u32 size) {
  return test_support::serve({config_operation_t::node_get_str, node, "", size},
                             [&](auto &tree) { return test_support::text_of(tree.node(node), buffer, size); });
}
