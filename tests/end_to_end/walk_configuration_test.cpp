// Everything that the reading of the configuration says, provoked by whole compositions.
#include "diagnostics_walk.h"
#include "support/configuration_tree.h"
#include "support/records.h"

namespace diagnostics_walk {
namespace {

using test_support::configuration_tree_t;

const std::string domain = "platform.software.drivers.vorex.edid.";

row_t composer_warning(const char *function, const std::string &message, std::function<void()> provoke) {
  return warning("edid_composer", function, message, std::move(provoke));
}

row_t composer_error(const char *function, const std::string &message, std::function<void()> provoke) {
  return error("edid_composer", function, message, std::move(provoke));
}

/// Composes from a complete configuration after @p change.
std::function<void()> composing(const std::function<void(configuration_tree_t &)> &change) {
  return [=] {
    configuration_tree_t tree;
    tree.fill_completely();
    change(tree);
    std::vector<u8> bytes(256);
    const compose_cfg_t cfg = test_support::plain_settings();
    compose_edid(nullptr, 0, bytes.data(), 256, &cfg);
  };
}

std::function<void()> composing_with_entry(const char *list, const char *entry) {
  return composing([=](configuration_tree_t &tree) { tree.add(list, std::string(entry), "node"); });
}

std::function<void()> composing_with_entry(const char *list, i32 entry) {
  return composing([=](configuration_tree_t &tree) { tree.add(list, entry, "node"); });
}

std::vector<row_t> values() {
  return {
      composer_warning("_read_platform_values",
                       "Value in the platform config file for the domain \"" + domain +
                           "native_refresh_rate\" is an unrecognized value:55. Valid values: 50,60. Using:60",
                       composing([](configuration_tree_t &tree) { tree.set("native_refresh_rate", 55); })),
      composer_error("_get_generic_platform_list",
                     "Unabled to find the platform node:" + domain + "standard_timings.\n",
                     composing([](configuration_tree_t &tree) { tree.remove("standard_timings"); })),
      composer_error("_get_generic_platform_list",
                     "Invalid platform configuration entry. Expected an integer. Entry name:node",
                     composing_with_entry("established_timings_1", "text")),
      composer_error("_get_generic_platform_list",
                     "Invalid platform configuration entry. Expected a string. Entry name:node\n",
                     composing_with_entry("50_hz_priority_list", 16)),
      composer_error("_get_platform_list",
                     "A mode list (3) is empty. Please verify that all of the video mode lists are properly populated "
                     "with 3D mode formated strings.\n",
                     composing([](configuration_tree_t &tree) { tree.remove("60_hz_addition_list"); })),
      trace("print_platform_node", "\tRoot Node:Name of node is:50_hz_priority_list",
            composing([](configuration_tree_t &) {})),
      trace("print_platform_node", "\tFirst Child Node:Name of node is:entry_0",
            composing([](configuration_tree_t &) {})),
      trace("print_platform_node", "\tNext Node:Name of node is:entry_3", composing([](configuration_tree_t &) {})),
      trace("print_platform_node", "\tRoot Node:Failed trying to get name", composing([](configuration_tree_t &tree) {
              tree.answer(test_support::config_operation_t::node_get_name, 1);
            })),
      trace("_get_platform_list", "Reading 50Hz priority list from platform config.",
            composing([](configuration_tree_t &) {})),
      trace("_get_platform_list", "Reading 60Hz additional list from platform config.",
            composing([](configuration_tree_t &) {})),
  };
}

std::vector<row_t> video_modes() {
  const char *const list = "60_hz_priority_list";
  const char *const parser = "_get_vic_list_callback";
  return {
      trace(parser, "Reading from list:60_hz_priority_list Node:node => 16 FP tbh",
            composing_with_entry(list, "16 FP tbh")),
      trace(parser, "\tFound list entry: node = \"16 FP tbh \"", composing_with_entry(list, "16 FP tbh")),
      composer_warning(parser, "Invalid string \"none\" in 60_hz_priority_list", composing_with_entry(list, "none")),
      composer_warning(parser,
                       "Read a vic value from the platform config file that has an unexpected value:65. Range:(1-64) "
                       "Ignoring and continuing.",
                       composing_with_entry(list, "65")),
      composer_warning(parser, "Invalid 3D flag \"XYZ\" in 60_hz_priority_list",
                       composing_with_entry(list, "16 FP XYZ")),
      composer_warning(parser, "Invalid string \"16 FP XYZ\" in 60_hz_priority_list",
                       composing_with_entry(list, "16 FP XYZ")),
  };
}

std::vector<row_t> numbers() {
  return {
      composer_warning("_get_4k_x_2k_mode_callback",
                       "Detected a 4k x 2k mode that is not supported. Max:4 Received:5 Node:node",
                       composing_with_entry("4k_x_2k_addition_list", 5)),
      trace("_get_4k_x_2k_mode_callback", "Read 4k x 2k mode:3", composing_with_entry("4k_x_2k_addition_list", 3)),
      composer_warning("_get_est_timing_callback", "Mode value is not 0 to 7. Val:-1 Node:node",
                       composing_with_entry("manufacturer_timings", -1)),
      trace("_get_est_timing_callback", "Added timing val:6 for list:manufacturer_timings",
            composing_with_entry("manufacturer_timings", 6)),
  };
}

std::vector<row_t> standard_timings() {
  const char *const list = "standard_timings";
  const char *const parser = "_get_std_timing_callback";
  return {
      composer_warning(parser,
                       "Standard timing width(1366) must be a factor of 8. Entry:node = \"1366 768 60.000000000\"",
                       composing_with_entry(list, "1366 768 60.000000000")),
      composer_warning(parser,
                       "Height(1000) is not in a proper ratio to width(1280). Accepted heights 1:1=>1280 4:3=>960 "
                       "5:4=>1600 16:9=>2275 Entry:1280 1000 60.00000000\n",
                       composing_with_entry(list, "1280 1000 60.00000000")),
      composer_warning(parser,
                       "Only whole refresh rates(59.94) are supported, ie 60 not 59.94. Incrementing refresh rate and "
                       "continuing. Entry:1280 1024 59.94\n",
                       composing_with_entry(list, "1280 1024 59.94")),
      composer_warning(parser, "Invalid Refresh rate(124). Must be 60 to 123. Entry:1280 1024 124.0000\n",
                       composing_with_entry(list, "1280 1024 124.0000")),
  };
}

WALK(ConfiguredValues, values());
WALK(ConfiguredVideoModes, video_modes());
WALK(ConfiguredNumbers, numbers());
WALK(ConfiguredStandardTimings, standard_timings());

}  // namespace
}  // namespace diagnostics_walk
