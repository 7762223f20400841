// Single operations when memory runs out at any of their allocations: decoding, printing, copying a list, reading the
// configuration.
#include <gtest/gtest.h>

#include <cstdio>
#include <cstring>
#include <numeric>

#include "edid_composer/platform/platform_values_reader.h"
#include "edid_decode_encode/record_fields.h"
#include "failure_table.h"
#include "sample.h"
#include "support/memory_image.h"
#include "support/output_capture.h"

namespace robustness {
namespace {

using codec_test::fields_of;
using test_support::bytes_t;
using test_support::error_line;
using test_support::output_of;
using test_support::warning_line;
using end_t = sample_sink_t::end_t;

std::string codec_error(const std::string &function, const std::string &message) {
  return error_line("edid_decode_encode", function, message);
}

std::string text_of(const codec_test::fields_t &fields) {
  std::string text;
  for (const auto &[name, value] : fields)
    text += name + " = " + value + "\n";
  return text;
}

std::string hex(const char *format, u32 value) {
  char text[16];
  std::snprintf(text, sizeof text, format, value);
  return text;
}

// Decodes the base block and, if that succeeds, the extension.
std::string decoded(const bytes_t &sink) {
  const bytes_t base(sink.begin(), sink.begin() + 128);
  const bytes_t extension(sink.begin() + 128, sink.end());
  edid_t edid{};
  edid_prepare(&edid);
  std::string words = "base block failed\n";
  if (decode_edid_block_0(base.data(), &edid) == 1) {
    words = decode_edid_extensions(extension.data(), 128, &edid) == 1 ? "done\n" : "extension failed\n";
  }
  words += text_of(fields_of(edid));
  EXPECT_EQ(edid_destroy(&edid), 1);
  return words;
}

// What is decoded of a sink that is broken where the memory ran out, and whose other bytes are as they were.
std::string decoded_of(const sample_sink_t &cut) {
  bytes_t bytes = cut.build();
  std::string text;
  test_support::raw_output_of([&] { text = decoded(bytes); });
  // The checksums of the broken sink are other ones.
  const std::string checksum = "\nchecksum = ";
  const std::size_t at = text.find(checksum) + checksum.size();
  return text.replace(at, text.find('\n', at) - at, std::to_string(rich_sink().build()[127]));
}

std::vector<u32> first_of(const std::vector<u32> &all, int count) {
  return {all.begin(), all.begin() + count};
}

sample_sink_t without_std_timings_from(int entry) {
  sample_sink_t sink = rich_sink();
  sink.std_timings.resize(static_cast<std::size_t>(entry));
  sink.base_timings.clear();
  sink.end = end_t::behind_base_timings;
  return sink;
}

sample_sink_t without_base_timings_from(int entry) {
  sample_sink_t sink = rich_sink();
  sink.base_timings = first_of(sink.base_timings, entry);
  sink.end = end_t::behind_base_timings;
  return sink;
}

sample_sink_t without_extension_timing(int entry) {
  sample_sink_t sink = rich_sink();
  sink.extension_timings[static_cast<std::size_t>(entry)] = 0;
  return sink;
}

sample_sink_t without_video_from(int entry) {
  sample_sink_t sink = rich_sink();
  sink.video.resize(static_cast<std::size_t>(entry));
  sink.end = end_t::behind_video;
  return sink;
}

sample_sink_t without_audio_from(int entry) {
  sample_sink_t sink = rich_sink();
  sink.audio.resize(3 * static_cast<std::size_t>(entry));
  sink.end = end_t::behind_audio;
  return sink;
}

std::string standard_timing_lines(int entry, const std::string &bug) {
  const auto pair = rich_sink().std_timings[static_cast<std::size_t>(entry)];
  return bug + codec_error("_decode_edid_standard_timing", "Failed creating entry.") +
         codec_error("decode_edid_block_0", "Failed decoding #" + std::to_string(entry + 1) +
                                                " standard timing. Val1:" + hex("0x%x", pair[0]) +
                                                " Val2:" + hex("0x%x", pair[1]));
}

std::string detailed_timing_lines(int entry, const std::string &bug) {
  const bytes_t timing = test_support::timing_descriptor(
      test_support::timing_of_vic(rich_sink().base_timings[static_cast<std::size_t>(entry)]));
  std::string message = "Failed decoding #" + std::to_string(entry) + " DTD.";
  for (const u8 byte : timing)
    message += hex(" 0x%x", byte);
  return bug + codec_error("_decode_edid_dtd", "Failed creating an entry.") +
         codec_error("decode_edid_block_0", message);
}

const std::string extension_timing_line = codec_error("_decode_edid_dtd", "Failed creating an entry.");
const std::string video_line = codec_error("decode_edid_extensions", "Failed creating new entry.");
const std::string audio_line = codec_error("decode_edid_extensions", "Failed creating entry.");

// What is the same in decoding and in printing.
std::vector<stretch_t> table_of(const std::function<std::string(const sample_sink_t &)> &outcome,
                                const std::string &base_failed, const std::string &extension_failed) {
  const auto cut = [outcome](sample_sink_t (*sink)(int)) { return [=](int entry) { return outcome(sink(entry)); }; };
  return {
      {"standard timing", 2,
       [=](int entry, const std::string &bug) { return standard_timing_lines(entry, bug) + base_failed; },
       cut(without_std_timings_from)},
      {"detailed timing", 2,
       [=](int entry, const std::string &bug) { return detailed_timing_lines(entry, bug) + base_failed; },
       cut(without_base_timings_from)},
      {"extension's detailed timing", 2, lines(extension_timing_line), cut(without_extension_timing)},
      {"short video descriptor", 4, lines(video_line + extension_failed), cut(without_video_from)},
      {"short audio descriptor", 2, lines(audio_line + extension_failed), cut(without_audio_from)},
  };
}

TEST(FailingDecoding, ReportsEveryAllocationAndKeepsWhatWasDecodedBefore) {
  const bytes_t sink = rich_sink().build();
  expect_failures(
      table_of(decoded_of, "", ""), [&] { return decoded(sink); }, output_of);
}

TEST(FailingDecoding, SurvivesWithoutAnyMemoryFromAnyAllocationOn) {
  const bytes_t sink = rich_sink().build();
  expect_survival([&] { return decoded(sink); },
                  [](const std::string &words) { return words.find("failed") != std::string::npos; });
}

// The report is the outcome, so that it is told apart from the diagnostics.
std::string printed(const bytes_t &sink) {
  std::string report;
  std::string diagnostics;
  for (const std::string &line :
       test_support::lines_of([&] { print_edid(sink.data(), static_cast<u32>(sink.size()), 0, "Sample"); })) {
    const bool diagnostic = line.find("() BUG: ") != std::string::npos || line.find("() ERROR: ") != std::string::npos;
    (diagnostic ? diagnostics : report) += line + "\n";
  }
  std::fputs(diagnostics.c_str(), stdout);
  return report;
}

TEST(FailingPrinting, ReportsEveryAllocationAndPrintsNoReportOfABlockThatFailed) {
  const bytes_t sink = rich_sink().build();
  const auto failed = [](int block) {
    return error_line("edid_composer", "print_edid", "Failed decoding EDID block " + std::to_string(block) + ".");
  };
  const auto report = [](const sample_sink_t &cut) {
    std::string text;
    test_support::raw_output_of([&] { text = printed(cut.build()); });
    return text;
  };
  EXPECT_NE(report(rich_sink()), "");
  EXPECT_EQ(report(without_base_timings_from(1)), "");
  expect_failures(
      table_of(report, failed(0), failed(1)), [&] { return printed(sink); }, output_of);
}

std::string numbers_of(const ll_list_t &list) {
  std::string text;
  for (const i32 number : test_support::elements_of<i32>(list))
    text += std::to_string(number) + " ";
  return text;
}

TEST(FailingListCopy, ReportsEveryAllocationAndKeepsTheCopiesMadeBefore) {
  test_support::scoped_list_t<i32> source;
  for (i32 i = 0; i < 20; ++i)
    test_support::append(*source, i);
  const std::string source_image = test_support::image_of(*source) + test_support::image_of_entries(*source, 4);
  const auto copied = [&] {
    test_support::scoped_list_t<i32> destination;
    const bool done = ll_copy_list(source.get(), destination.get(), sizeof(i32));
    EXPECT_TRUE(ll_verify_integrity(destination.get()));
    EXPECT_EQ(test_support::image_of(*source) + test_support::image_of_entries(*source, 4), source_image);
    return (done ? "done: " : "failed: ") + numbers_of(*destination);
  };
  expect_failures(
      {{"copy", 20,
        lines(test_support::bug_line("linked_list", "ll_copy_list", "Failed creating entry for the destination list.")),
        [](int entry) {
          std::string text = "failed: ";
          for (int i = 0; i < entry; ++i)
            text += std::to_string(i) + " ";
          return text;
        }}},
      copied, output_of);
  expect_survival(copied, [](const std::string &words) { return words.substr(0, 8) == "failed: "; });
}

// The lists of platform values, each on a line of its own, and whether they were read to the end.
std::string words_of(bool done, const platform_values_t &values) {
  std::string text = done ? "done\n" : "failed\n";
  text += numbers_of(values.audio_list) + "\n";
  for (const ll_list_t *list : {&values.video_50_priority, &values.video_50_additional, &values.video_60_priority,
                                &values.video_60_additional}) {
    for (const auto &[vic, stereo] : test_support::modes_of(*list))
      text += std::to_string(vic) + "/" + std::to_string(stereo) + " ";
    text += "\n";
  }
  for (const auto &[width, ratio, refresh] : test_support::std_timings_of(values.std_timings))
    text += std::to_string(width) + "/" + std::to_string(ratio) + "/" + std::to_string(refresh) + " ";
  return text + "\n" + values.monitor_name + "\n" + std::to_string(values.week) + "\n";
}

std::string read_from_tree() {
  platform_values_t values{};
  EXPECT_TRUE(platform_values_init(&values));
  const bool done = edid_composer::_read_platform_values(&values, nullptr);
  const std::string words = words_of(done, values);
  EXPECT_TRUE(platform_values_destroy(&values));
  return words;
}

std::string read_from(const test_support::platform_configuration_t &configuration) {
  test_support::configuration_tree_t tree;
  configuration.write_to(tree);
  std::string words;
  test_support::raw_output_of([&] { words = read_from_tree(); });
  return words;
}

// Reading goes on without an entry of a mode list or a standard timing.
template <typename element_t>
stretch_t missing_entry(const std::string &name, const std::string &parser, const std::string &when_empty,
                        std::vector<element_t> test_support::platform_configuration_t::*list) {
  const std::size_t size = (rich_configuration().*list).size();
  return {name, static_cast<int>(size),
          lines(error_line("edid_composer", parser, "Failed creating entry.") + (size == 1 ? when_empty : "")),
          [list](int entry) {
            auto configuration = rich_configuration();
            (configuration.*list).erase((configuration.*list).begin() + entry);
            return read_from(configuration);
          }};
}

TEST(FailingPlatformRead, ReportsEveryAllocationAndStopsAtAnAudioEntryOnly) {
  using configuration_t = test_support::platform_configuration_t;
  test_support::configuration_tree_t tree;
  const configuration_t configuration = rich_configuration();
  configuration.write_to(tree);
  const std::string parser = "_get_vic_list_callback";
  const std::string empty = error_line(
      "edid_composer", "_get_platform_list",
      "A mode list (2) is empty. Please verify that all of the video mode lists are properly populated with 3D mode "
      "formated strings.\n");
  const auto stopped_at = [&](int entry) {
    std::string audio;
    for (int i = 0; i < entry; ++i)
      audio += std::to_string(configuration.audio[static_cast<std::size_t>(i)]) + " ";
    return "failed\n" + audio + "\n\n\n\n\n\n\n1\n";
  };
  expect_failures(
      {
          {"audio entry", 3, lines(error_line("edid_composer", "_read_platform_values", "Failed creating entry.")),
           stopped_at},
          missing_entry("50 Hz priority", parser, "", &configuration_t::video_50_priority),
          missing_entry("50 Hz addition", parser, empty, &configuration_t::video_50_additional),
          missing_entry("60 Hz priority", parser, "", &configuration_t::video_60_priority),
          missing_entry("60 Hz addition", parser, "", &configuration_t::video_60_additional),
          missing_entry("standard timing", "_get_std_timing_callback", "", &configuration_t::std_timings),
      },
      read_from_tree, output_of);
}

}  // namespace
}  // namespace robustness
