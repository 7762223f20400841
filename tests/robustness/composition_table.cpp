#include "composition_table.h"

#include <cstdio>

#include "support/hex_text.h"
#include "support/output_capture.h"
#include "support/patterns.h"

namespace robustness {
namespace {

using test_support::bytes_t;
using test_support::platform_configuration_t;

std::string codec_error(const std::string &function, const std::string &message) {
  return test_support::error_line("edid_decode_encode", function, message);
}

std::string composer_error(const std::string &function, const std::string &message) {
  return test_support::error_line("edid_composer", function, message);
}

std::string compose_error(const std::string &message) {
  return composer_error("compose_edid_internal", message);
}

std::string compose_warning(const std::string &message) {
  return test_support::warning_line("edid_composer", "compose_edid_internal", message);
}

// What is composed from a sink, without a word of how.
std::string silently_composed(const sample_sink_t &sink, const platform_values_t *values) {
  std::string words;
  test_support::raw_output_of([&] { words = words_of(test_support::compose(sink.build(), rich_settings(), values)); });
  return words;
}

std::string silently_composed(const platform_configuration_t &configuration) {
  test_support::configuration_tree_t tree;
  configuration.write_to(tree);
  return silently_composed(rich_sink(), nullptr);
}

template <typename element_t>
std::vector<element_t> first_of(const std::vector<element_t> &all, int count) {
  return {all.begin(), all.begin() + count};
}

// Cleaning up what was not prepared yet: two records and the list of modes.
std::string clean_up_of_unprepared_records() {
  const std::string record = codec_error("edid_destroy", "List is not initialized. List:standard_timing_list.");
  return record + compose_error("Failed cleaning up edid.") + record + compose_error("Failed cleaning up new_edid.") +
         test_support::error_line("linked_list", "ll_verify_integrity",
                                  "Corrupt List: List not initialized. Ptr:PTR ExpectedMagic:0 Magic:M Size:0 "
                                  "Head:(nil) ") +
         test_support::bug_line("linked_list", "ll_delete_list", "Failed verifying integrity of the list. list:PTR") +
         compose_error("Failed cleaning up video list.");
}

// An entry of a configured list is missing, and a list that has no other is empty.
template <typename element_t>
stretch_t missing_list_entry(const std::string &name, const std::string &parser,
                             std::vector<element_t> platform_configuration_t::*list, const std::string &when_empty) {
  const std::size_t size = (rich_configuration().*list).size();
  const std::string error = composer_error(parser, "Failed creating entry.");
  return {name, static_cast<int>(size), lines(error + (size == 1 ? when_empty : "")), [list](int entry) {
            platform_configuration_t configuration = rich_configuration();
            (configuration.*list).erase((configuration.*list).begin() + entry);
            return silently_composed(configuration);
          }};
}

stretch_t missing_mode(const std::string &name, int type,
                       std::vector<test_support::mode_pair_t> platform_configuration_t::*list) {
  return missing_list_entry(
      name, "_get_vic_list_callback", list,
      composer_error("_get_platform_list",
                     "A mode list (" + std::to_string(type) +
                         ") is empty. Please verify that all of the video mode lists are properly "
                         "populated with 3D mode formated strings.\n"));
}

std::string bytes_text(const u8 *bytes, int count) {
  std::string text;
  for (int i = 0; i < count; ++i) {
    char byte[8];
    std::snprintf(byte, sizeof byte, " 0x%x", bytes[i]);
    text += byte;
  }
  return text;
}

// A standard timing and a detailed timing of the base block at @p block that are not decoded.
std::string standard_timing_error(const u8 *block, int index) {
  const u8 *const pair = block + 38 + 2 * index;
  char values[32];
  std::snprintf(values, sizeof values, " Val1:0x%x Val2:0x%x", pair[0], pair[1]);
  return codec_error("_decode_edid_standard_timing", "Failed creating entry.") +
         codec_error("decode_edid_block_0",
                     "Failed decoding #" + std::to_string(index + 1) + " standard timing." + values);
}

std::string detailed_timing_error(const u8 *block, int index) {
  return codec_error("_decode_edid_dtd", "Failed creating an entry.") +
         codec_error("decode_edid_block_0",
                     "Failed decoding #" + std::to_string(index) + " DTD." + bytes_text(block + 54 + 18 * index, 18));
}

constexpr int modes_selected = 6;  // VICs 16, 4, 5, 2, 3 and 1.

}  // namespace

table_t reading_stretches() {
  using configuration = platform_configuration_t;
  const std::string audio = composer_error("_read_platform_values", "Failed creating entry.") +
                            compose_error("Failed trying to read the platform config file.") +
                            clean_up_of_unprepared_records();
  return {
      {"audio entry", 3, lines(audio), always("refused\n")},
      missing_mode("50 Hz priority", 0, &configuration::video_50_priority),
      missing_mode("50 Hz addition", 2, &configuration::video_50_additional),
      missing_mode("60 Hz priority", 1, &configuration::video_60_priority),
      missing_mode("60 Hz addition", 3, &configuration::video_60_additional),
      missing_list_entry("standard timing", "_get_std_timing_callback", &configuration::std_timings, ""),
  };
}

table_t decoding_stretches(const platform_values_t *values) {
  using end_t = sample_sink_t::end_t;
  static const bytes_t sink = rich_sink().build();
  const std::string base_failed = compose_error("Failed decoding the edid block 0. Continuing.");
  const std::string extension_failed = compose_error("Failed decoding the extension. Continuing.");
  const std::string extension_error = "decode_edid_extensions";
  return {
      {"sink's standard timing", 2,
       [=](int entry, const std::string &bug) { return bug + standard_timing_error(sink.data(), entry) + base_failed; },
       [=](int entry) {
         sample_sink_t cut = rich_sink();
         cut.std_timings = first_of(cut.std_timings, entry);
         cut.base_timings.clear();
         cut.end = end_t::behind_base_timings;
         return silently_composed(cut, values);
       }},
      {"sink's detailed timing", 2,
       [=](int entry, const std::string &bug) { return bug + detailed_timing_error(sink.data(), entry) + base_failed; },
       [=](int entry) {
         sample_sink_t cut = rich_sink();
         cut.base_timings = first_of(cut.base_timings, entry);
         cut.end = end_t::behind_base_timings;
         return silently_composed(cut, values);
       }},
      // The decoding of the extension goes on without it.
      {"extension's detailed timing", 2, lines(codec_error("_decode_edid_dtd", "Failed creating an entry.")),
       [=](int entry) {
         sample_sink_t without = rich_sink();
         without.extension_timings[static_cast<std::size_t>(entry)] = 0;
         return silently_composed(without, values);
       }},
      {"short video descriptor", 4,
       lines(codec_error(extension_error, "Failed creating new entry.") + extension_failed),
       [=](int entry) {
         sample_sink_t cut = rich_sink();
         cut.video = first_of(cut.video, entry);
         cut.end = end_t::behind_video;
         return silently_composed(cut, values);
       }},
      {"short audio descriptor", 2, lines(codec_error(extension_error, "Failed creating entry.") + extension_failed),
       [=](int entry) {
         sample_sink_t cut = rich_sink();
         cut.audio = first_of(cut.audio, 3 * entry);
         cut.end = end_t::behind_audio;
         return silently_composed(cut, values);
       }},
  };
}

table_t selecting_stretches() {
  const auto refused = always("refused\n");
  const std::string filter = "_filter_video_modes";
  const std::string no_entry = "Failed creating entry.";
  const std::string video_failed = compose_error("Failed filtering the video modes.");
  const std::string in_filter = composer_error(filter, no_entry) + video_failed;
  const std::string in_combining = composer_error("_combine_lists", no_entry);
  const std::string in_audio =
      composer_error("_filter_audio_formats", no_entry) + compose_error("Failed filtering the audio formats.");
  const std::string population_failed = compose_error("Failed populating the new edid.");
  const std::string in_population = composer_error("_populate_new_edid", no_entry) + population_failed;
  const std::string in_copy =
      test_support::bug_line("linked_list", "ll_copy_list", "Failed creating entry for the destination list.");
  return {
      // The standard timings have no VIC.
      {"candidate of a detailed timing", 4, lines(in_filter), refused},
      {"candidate of the sink's video list", 4,
       lines(in_combining + composer_error(filter, "Failed combining short video lists.") + video_failed), refused},
      {"candidate of the addition list", 4,
       lines(in_combining + composer_error(filter, "Failed combining 60Hz lists.") + video_failed), refused},
      {"priority entry, matched or not", 7, lines(in_filter), refused},
      {"current mode", 1, lines(in_filter), refused},
      {"platform's audio format", 3, lines(in_audio), refused},
      {"sink's audio format that the platform hasn't", 1, lines(in_audio), refused},
      {"basic audio", 1, lines(in_audio), refused},
      {"copy of a standard timing", 2, lines(in_copy + population_failed), refused},
      {"detailed timing", 2, lines(in_population), refused},
      {"short video descriptor", modes_selected, lines(in_population), refused},
  };
}

table_t inspecting_stretches(const bytes_t &composed) {
  const std::string base_failed = compose_warning("Failed decoding the new edid block 0.");
  const std::string extension_failed = compose_warning("Failed decoding the new edid extension.");
  const auto same = always(test_support::hex_lines(composed));
  return {
      {"result's standard timing", 2,
       [=](int entry, const std::string &bug) {
         return bug + standard_timing_error(composed.data(), entry) + base_failed;
       },
       same},
      {"result's detailed timing", 2,
       [=](int entry, const std::string &bug) {
         return bug + detailed_timing_error(composed.data(), entry) + base_failed;
       },
       same},
      {"result's detailed timing in the extension", 1,
       lines(codec_error("_decode_edid_dtd", "Failed creating an entry.")), same},
      {"result's short video descriptor", modes_selected,
       lines(codec_error("decode_edid_extensions", "Failed creating new entry.") + extension_failed), same},
      {"result's short audio descriptor", 5,
       lines(codec_error("decode_edid_extensions", "Failed creating entry.") + extension_failed), same},
  };
}

std::string traced_diagnostics_of(const std::function<void()> &action) {
  std::string diagnostics;
  for (const std::string &line : test_support::traced_lines_of(action)) {
    if (test_support::matches(line, "\\w+:N:\\w+\\(\\) (ERROR|WARNING|BUG): .*")) diagnostics += line + "\n";
  }
  return diagnostics;
}

table_t join(const std::vector<table_t> &tables) {
  table_t joined;
  for (const table_t &table : tables)
    joined.insert(joined.end(), table.begin(), table.end());
  return joined;
}

}  // namespace robustness
