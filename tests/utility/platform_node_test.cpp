// The trace of a configuration node's name.
#include <gtest/gtest.h>

#include "support/configuration_tree.h"
#include "utility/utility_lines.h"

namespace utility_tests {
namespace {

using test_support::config_operation_t;
using test_support::configuration_tree_t;

u32 node_of(const char *path) {
  u32 node = 0;
  EXPECT_EQ(config_node_find(0, path, &node), 0);
  return node;
}

TEST(PrintPlatformNode, TracesTheNodesName) {
  configuration_tree_t tree;
  tree.add_list("standard_timings");
  const u32 node = node_of("platform.software.drivers.vorex.edid.standard_timings");
  EXPECT_EQ(traced_output_of([&] { print_platform_node(node, "\tRoot Node"); }),
            trace_line("print_platform_node", "\tRoot Node:Name of node is:standard_timings"));
  EXPECT_EQ(tree.calls().back().operation, config_operation_t::node_get_name);
  EXPECT_EQ(tree.calls().back().handle, node);
  EXPECT_EQ(tree.calls().back().size, 256u);
}

TEST(PrintPlatformNode, TracesThatTheNameCouldNotBeRead) {
  configuration_tree_t tree;
  EXPECT_EQ(traced_output_of([] { print_platform_node(4711, "label"); }),
            trace_line("print_platform_node", "label:Failed trying to get name"));
  tree.answer(config_operation_t::node_get_name, 1);
  EXPECT_EQ(traced_output_of([] { print_platform_node(0, ""); }),
            trace_line("print_platform_node", ":Failed trying to get name"));
}

TEST(PrintPlatformNode, NeitherAsksNorPrintsWhileTracingIsOff) {
  const configuration_tree_t tree;
  EXPECT_EQ(output_of([] { print_platform_node(0, "label"); }), "");
  EXPECT_EQ(tree.lookups(), 0);
}

TEST(PrintPlatformNode, PrintsANameThatFillsTheBuffer) {
  configuration_tree_t tree;
  const std::string name(300, 'n');
  tree.add("list", 1, name);
  const u32 node = node_of(("platform.software.drivers.vorex.edid.list." + name).c_str());
  EXPECT_EQ(traced_output_of([&] { print_platform_node(node, "label"); }),
            trace_line("print_platform_node", "label:Name of node is:" + name.substr(0, 255)));
}

}  // namespace
}  // namespace utility_tests
