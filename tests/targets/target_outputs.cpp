// Prints what the library does with inputs that are the same on every machine: compositions with all their traces, the
// bytes of the new EDID, and the reports of both EDIDs.
// Usage: target_outputs COMPOSITIONS
#include <array>
#include <cstdio>
#include <cstdlib>
#include <string>

#include "random_situation.h"
#include "random_source.h"
#include "support/composition.h"
#include "support/configuration_tree.h"

namespace {

using properties::random_source_t;
using test_support::bytes_t;

constexpr std::uint64_t first_seed = 20140522;

/// Numbers of more digits than fit, in lists of modes: every target is to keep the same part of them.
void add_long_numbers(random_source_t &random, test_support::configuration_tree_t &tree) {
  constexpr std::array<const char *, 5> lists = {"50_hz_priority_list", "50_hz_addition_list", "60_hz_priority_list",
                                                 "60_hz_addition_list", "standard_timings"};
  for (u32 i = random.between(0, 4); i > 0; --i) {
    const std::uint64_t wraps_to = random.between(1, 64);
    std::uint64_t number = wraps_to + (std::uint64_t{random.between(0, 3)} << random.between(31, 33));
    if (random.chance(10)) number = random.next();
    const char *list = random.one_of(lists);
    tree.add(list, std::to_string(number) + (random.chance(30) ? " 1080 59.94" : ""));
  }
}

void print_bytes(const bytes_t &bytes) {
  std::printf("bytes:");
  for (const u8 byte : bytes)
    std::printf(" %02X", byte);
  std::printf("\n");
}

void print_report(const bytes_t &edid, const char *title) {
  if (edid.size() >= 128) print_edid(edid.data(), static_cast<u32>(edid.size() - edid.size() % 128), 0, title);
}

void print_composition(std::uint64_t number) {
  random_source_t random(first_seed + number);
  properties::situation_t situation = properties::random_situation(random);
  if (random.chance(30)) situation.sink.bytes = properties::random_bytes_of_a_sink(random);
  test_support::configuration_tree_t tree;
  situation.platform.write_to(tree);
  add_long_numbers(random, tree);

  std::printf("composition %u\n", static_cast<u32>(number));
  debug_enable(true);
  const test_support::composition_t composed = test_support::compose(situation.sink.bytes, situation.settings);
  debug_enable(false);
  std::printf("result: %d, address at %u\n", composed.result ? 1 : 0, u32{composed.spa_offset});
  if (composed.result) print_bytes(composed.bytes);
  print_report(situation.sink.bytes, "Sink");
  if (composed.result) print_report(composed.bytes, "New EDID");
}

}  // namespace

int main(int argument_count, char **arguments) {
  const long compositions = argument_count == 2 ? std::strtol(arguments[1], nullptr, 10) : 0;
  if (compositions <= 0) {
    std::fprintf(stderr, "usage: target_outputs COMPOSITIONS\n");
    return 2;
  }
  for (long number = 0; number < compositions; ++number)
    print_composition(static_cast<std::uint64_t>(number));
  return std::fflush(stdout) == 0 && std::ferror(stdout) == 0 ? 0 : 1;
}
