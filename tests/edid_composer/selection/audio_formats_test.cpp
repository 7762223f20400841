// Which audio formats a new EDID offers.
#include "edid_composer/selection/audio_formats.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <string>
#include <vector>

#include "edid_composer/composer_lines.h"
#include "edid_composer/stage_fixture.h"
#include "support/failing_allocation.h"
#include "support/output_capture.h"
#include "support/records.h"

namespace {

using composer_lines::error;
using composer_lines::trace;
using composer_lines::warning;
using edid_composer::_filter_audio_formats;
using test_support::append;
using test_support::audio_words_t;
using test_support::output_of;
using test_support::traced_output_of;

using formats_t = std::vector<audio_words_t>;

constexpr const char *filter = "_filter_audio_formats";
constexpr u32 everything = 0xFFFFFFFF;

// As an HDMI sink must support it.
constexpr audio_words_t basic_audio{1, 2, 0x07, 0x5, 0, 0, 0};

// The three bytes of short audio descriptors, packed as the configuration holds them.
constexpr i32 packed(u32 byte1, u32 byte2, u32 byte3) {
  return static_cast<i32>(byte1 | byte2 << 8 | byte3 << 16);
}
constexpr i32 pcm_2ch = packed(0x09, 0x07, 0x05);
constexpr i32 pcm_8ch = packed(0x0F, 0x7F, 0x07);
constexpr i32 ac3_6ch = packed(0x15, 0x07, 0x50);
constexpr i32 dts_6ch = packed(0x3D, 0x06, 0xC0);
constexpr i32 he_aac = packed(0x7D, 0x04, 0x08);

constexpr short_audio_desc_t sink_pcm_2ch{1, 2, 0x07, 0x3, 0, 0, 0};
constexpr short_audio_desc_t sink_pcm_6ch{1, 6, 0x07, 0x7, 0, 0, 0};
constexpr short_audio_desc_t sink_ac3{2, 8, 0x07, 0, 448, 0, 0};
constexpr short_audio_desc_t sink_eac3{10, 8, 0x04, 0, 0, 1, 0};

class AudioFormatFilter : public composer_fixtures::Stage {
 protected:
  void platform(const std::vector<i32> &entries) {
    for (const i32 entry : entries)
      append(values_->audio_list, entry);
  }
  void sink(const std::vector<short_audio_desc_t> &entries) {
    for (const auto &entry : entries)
      append(sink_->audio_list, entry);
  }
  bool run(u32 mask, u32 sink_filter, ll_list_t *formats) {
    cfg_.audio_mask = mask;
    cfg_.audio_sink_filter = sink_filter;
    return _filter_audio_formats(inputs(), formats, &journal_);
  }
  bool run(u32 mask, u32 sink_filter) { return run(mask, sink_filter, formats_.get()); }
  /// The selection, by a run that succeeds and prints nothing.
  formats_t selection(u32 mask = everything, u32 sink_filter = 0) {
    EXPECT_EQ(output_of([&] { EXPECT_TRUE(run(mask, sink_filter)); }), "");
    return test_support::audio_of(*formats_);
  }

  composer_fixtures::arena_list_t<short_audio_desc_t> formats_{&arena_};
};

TEST_F(AudioFormatFilter, OffersBasicAudioWhenThereIsNothingElse) {
  EXPECT_EQ(selection(), formats_t{basic_audio});
}

TEST_F(AudioFormatFilter, PassThrough0OffersThePlatformsFormatsOnly) {
  platform({pcm_2ch, ac3_6ch, he_aac});
  sink({sink_eac3});
  EXPECT_EQ(selection(), (formats_t{basic_audio, {2, 6, 0x07, 0, 640, 0, 0}, {16, 6, 0x04, 0, 0, 0, 0}}));
}

TEST_F(AudioFormatFilter, PassThrough1AddsTheSinksFormatsThatAreNoDuplicates) {
  values_->audio_pass_through = 1;
  platform({pcm_8ch, ac3_6ch, pcm_2ch});
  sink({sink_pcm_6ch, sink_eac3, sink_ac3, sink_eac3});
  EXPECT_EQ(
      selection(),
      (formats_t{basic_audio, {1, 8, 0x7F, 0x7, 0, 0, 0}, {2, 6, 0x07, 0, 640, 0, 0}, {10, 8, 0x04, 0, 0, 1, 0}}));
}

TEST_F(AudioFormatFilter, MultichannelPcmOfTheSinkIsNoDuplicateOfStereoPcm) {
  values_->audio_pass_through = 1;
  platform({pcm_2ch});
  sink({sink_pcm_6ch});
  EXPECT_EQ(selection(), (formats_t{basic_audio, {1, 6, 0x07, 0x7, 0, 0, 0}}));
}

TEST_F(AudioFormatFilter, PassThrough2OffersTheSinksFormatsWithTheirDuplicates) {
  values_->audio_pass_through = 2;
  platform({pcm_8ch, ac3_6ch});
  sink({sink_pcm_2ch, sink_ac3, sink_ac3, sink_pcm_2ch});
  const audio_words_t pcm{1, 2, 0x07, 0x3, 0, 0, 0};
  const audio_words_t ac3{2, 8, 0x07, 0, 448, 0, 0};
  EXPECT_EQ(selection(), (formats_t{pcm, ac3, ac3, pcm}));
}

TEST_F(AudioFormatFilter, PassThrough2DoesNotDecodeThePlatformsFormats) {
  values_->audio_pass_through = 2;
  platform({0});
  EXPECT_EQ(selection(), formats_t{basic_audio});
}

TEST_F(AudioFormatFilter, PlatformsDuplicatesAreLeftOut) {
  platform({pcm_2ch, ac3_6ch, packed(0x17, 0x7F, 0xFF), pcm_2ch, pcm_8ch, pcm_2ch});
  EXPECT_EQ(selection(), (formats_t{basic_audio, {2, 6, 0x07, 0, 640, 0, 0}, {1, 8, 0x7F, 0x7, 0, 0, 0}}));
}

TEST_F(AudioFormatFilter, PlatformFormatThatDoesNotDecodeIsSkippedWithAWarning) {
  platform({0x050700, pcm_2ch, -128});
  EXPECT_EQ(output_of([&] { EXPECT_TRUE(run(everything, 0)); }),
            test_support::error_line("edid_decode_encode", "decode_edid_short_audio",
                                     "Unrecognized audio type found in audio format. Expected:1-15 Received:0") +
                warning(filter, "Failed decoding audio format. Val:0x050700") +
                test_support::error_line("edid_decode_encode", "decode_edid_short_audio",
                                         "Unrecognized audio type found in audio format. Expected:1-15 Received:0") +
                warning(filter, "Failed decoding audio format. Val:0xFFFFFF80"));
  EXPECT_EQ(test_support::audio_of(*formats_), formats_t{basic_audio});
}

TEST_F(AudioFormatFilter, BytesOfAPlatformFormatAreItsThreeLowest) {
  platform({static_cast<i32>(0xAB050709)});
  EXPECT_EQ(selection(), formats_t{basic_audio});
}

TEST_F(AudioFormatFilter, SinkFilterDropsMultichannelPcmOfAStereoSink) {
  platform({pcm_8ch});
  sink({sink_pcm_2ch});
  EXPECT_EQ(selection(everything, 1), formats_t{basic_audio});
}

TEST_F(AudioFormatFilter, SinkFilterNarrowsToWhatTheSinkCan) {
  platform({packed(0x09, 0x14, 0x05), packed(0x17, 0x06, 0x50)});
  sink({sink_pcm_2ch, sink_ac3});
  EXPECT_EQ(selection(everything, 1), (formats_t{{1, 2, 0x04, 0x1, 0, 0, 0}, {2, 8, 0x06, 0, 448, 0, 0}}));
}

TEST_F(AudioFormatFilter, SinkFilterOfASinkWithoutAudioLeavesBasicAudio) {
  platform({pcm_2ch, ac3_6ch});
  EXPECT_EQ(selection(everything, 1), formats_t{basic_audio});
}

TEST_F(AudioFormatFilter, SinksOwnFormatsAreNeitherTestedNorNarrowed) {
  values_->audio_pass_through = 1;
  platform({pcm_8ch});
  sink({sink_pcm_2ch, {1, 8, 0, 0, 0, 0, 0}, {0, 1, 0, 0, 0, 0, 0}});
  // The 8-channel entry shares no rate with anything; type 0 has no bit in the sink's own mask.
  EXPECT_EQ(selection(everything, 1), (formats_t{{1, 2, 0x07, 0x3, 0, 0, 0}, {1, 8, 0, 0, 0, 0, 0}}));
}

TEST_F(AudioFormatFilter, MaskSparesTheFirstFormat) {
  platform({ac3_6ch, pcm_2ch, dts_6ch});
  EXPECT_EQ(selection(0x1), (formats_t{{2, 6, 0x07, 0, 640, 0, 0}, basic_audio}));
}

TEST_F(AudioFormatFilter, UnknownExtendedTypeFallsToAnyMaskUnlessItIsFirst) {
  values_->audio_pass_through = 2;
  const short_audio_desc_t unknown{0, 2, 7, 0, 0, 0, 0};
  sink({unknown, sink_pcm_2ch, unknown});
  EXPECT_EQ(selection(), (formats_t{{0, 2, 7, 0, 0, 0, 0}, {1, 2, 0x07, 0x3, 0, 0, 0}}));
}

TEST_F(AudioFormatFilter, PcmThatIsNoBasicAudioGetsOneInFront) {
  platform({packed(0x09, 0x78, 0x05)});
  EXPECT_EQ(selection(), (formats_t{basic_audio, {1, 2, 0x78, 0x5, 0, 0, 0}}));
}

TEST_F(AudioFormatFilter, BasicAudioMayStandAnywhere) {
  platform({ac3_6ch, dts_6ch, pcm_2ch});
  EXPECT_EQ(selection().size(), 3U);
}

TEST_F(AudioFormatFilter, TakesTwentySixFormats) {
  values_->audio_pass_through = 2;
  sink(std::vector<short_audio_desc_t>(26, sink_ac3));
  EXPECT_EQ(selection().size(), 27U);
}

TEST_F(AudioFormatFilter, PlatformFormatsAreTraced) {
  platform({pcm_2ch, ac3_6ch, packed(0x17, 0x7F, 0xFF)});
  sink({sink_pcm_2ch});
  const auto line = [](const char *message) { return trace(filter, message); };
  const std::string pcm = "Code: 1:PCM Channels:2 Freq:32kHz 44.1kHz 48kHz  Bits:16bits ";
  const std::string ac3 = "Code: 2:AC3 Channels:";
  EXPECT_EQ(
      traced_output_of([&] { EXPECT_TRUE(run(everything, 0)); }),
      line("Create Audio mode list:") + line("\tExamining platform audio formats:") +
          line("\tSink Filter is turned OFF") + line("\tPassThrough Mode:0") +
          line("\tReading the platform audio modes:") + line("\t\t") + pcm + "24bits \n" + line("\t\t") + ac3 +
          "6 Freq:32kHz 44.1kHz 48kHz  Max Rate:640kHz\n" + line("\t\t") + ac3 +
          "8 Freq:32kHz 44.1kHz 48kHz 88.2kHz 96kHz 176.4kHz 192kHz  Max Rate:2040kHz\n" +
          line("\t\tFormat is a duplicate. Ignoring.") + trace("_filter_audio_list_with_mask", "\tMask:0xFFFFFFFF") +
          trace("_filter_audio_list_with_mask", "_filter_audio_list_with_mask() - Printing reverse formats\n") +
          trace("_filter_audio_list_with_mask", "\t\tFormat:") + ac3 + "6 Freq:32kHz 44.1kHz 48kHz  Max Rate:640kHz\n" +
          line("\tEntry:1 Channels:2") + line("\tFound a \"basic audio\" PCM 2-chan entry."));
}

TEST_F(AudioFormatFilter, SinkFormatsAreTraced) {
  values_->audio_pass_through = 1;
  platform({ac3_6ch, dts_6ch});
  sink({sink_ac3, sink_eac3});
  const auto line = [](const char *message) { return trace(filter, message); };
  const std::string platform_ac3 = "Code: 2:AC3 Channels:6 Freq:32kHz 44.1kHz 48kHz  Max Rate:640kHz\n";
  const std::string platform_dts = "Code: 7:DTS Channels:6 Freq:44.1kHz 48kHz  Max Rate:1536kHz\n";
  const std::string ac3 = "Code: 2:AC3 Channels:8 Freq:32kHz 44.1kHz 48kHz  Max Rate:448kHz\n";
  const std::string eac3 = "Code: 10:EAC3/DD+ Channels:8 Freq:48kHz  val:1\n";
  EXPECT_EQ(traced_output_of([&] { EXPECT_TRUE(run(everything, 1)); }),
            line("Create Audio mode list:") + line("\tExamining platform audio formats:") +
                line("\tSink Filter is turned ON") + line("\tPassThrough Mode:1") +
                line("\tReading the platform audio modes:") + line("\t\t") + platform_ac3 + line("\t\t") +
                platform_dts + line("\t\tFormat not in downstream as requested. Ignoring") +
                line("\tExamining downstream audio formats:") + line("\t\t") + ac3 +
                line("\t\t -->Format is a duplicate. Ignoring.") + line("\t\t") + eac3 +
                line("\t\t -->Adding mode.\n") + eac3 + trace("_filter_audio_list_with_mask", "\tMask:0x00000202") +
                trace("_filter_audio_list_with_mask", "_filter_audio_list_with_mask() - Printing reverse formats\n") +
                trace("_filter_audio_list_with_mask", "\t\tFormat:") + eac3 + line("\tEntry:2 Channels:6") +
                line("\tEntry:10 Channels:8") + line("\tNo \"basic audio\" PCM 2-chan entry found. Adding one.") +
                "\tCode: 1:PCM Channels:2 Freq:32kHz 44.1kHz 48kHz  Bits:16bits 24bits \n");
  EXPECT_EQ(test_support::audio_of(*formats_).at(1), (audio_words_t{2, 6, 0x07, 0, 448, 0, 0}));
}

TEST_F(AudioFormatFilter, ListOfAnotherTypeIsReportedAndGoneThrough) {
  values_->audio_pass_through = 1;
  for (ll_list_t *list : {&values_->audio_list, &sink_->audio_list}) {
    ASSERT_TRUE(ll_delete_list(list));
    ASSERT_TRUE(ll_init(list, "std_timing_t"));
  }
  EXPECT_EQ(output_of([&] { EXPECT_TRUE(run(everything, 0)); }),
            error(filter, "The list types don't match.") + error(filter, "The list types don't match."));
  EXPECT_EQ(test_support::audio_of(*formats_), formats_t{basic_audio});
}

TEST_F(AudioFormatFilter, OutputListThatRefusesAFormatFailsTheFilter) {
  composer_fixtures::arena_list_t<i32> wrong(&arena_);
  const auto refusal = [&] { return output_of([&] { EXPECT_FALSE(run(everything, 0, wrong.get())); }); };
  // Basic audio, added to the front, says "back" as well.
  std::string output = refusal();
  EXPECT_NE(output.find("ll_add_entry_to_front() BUG: This entry represents"), std::string::npos);
  EXPECT_EQ(test_support::count_of(output, error(filter, "Failed adding entry to the back of the list.")), 1);

  platform({ac3_6ch});
  output = refusal();
  EXPECT_NE(output.find("ll_add_entry_to_back() BUG: This entry represents"), std::string::npos);
  EXPECT_EQ(test_support::count_of(output, error(filter, "Failed adding entry to the back of the list.")), 1);
}

TEST_F(AudioFormatFilter, EveryFormatThatThereIsNoMemoryForFailsTheFilterAndKeepsWhatStood) {
  values_->audio_pass_through = 1;
  platform({ac3_6ch});
  sink({sink_eac3});
  bool failed = true;
  for (u32 room = 0; failed; room += 8) {
    edid_composer::entry_arena_t arena;
    composer_fixtures::leave_room(&arena, room);
    test_support::scoped_list_t<short_audio_desc_t> formats;
    const std::string output = output_of([&] {
      const test_support::failing_allocation_t failing(1);
      const bool complete = _filter_audio_formats(inputs(&arena), formats.get(), &journal_);
      failed = failing.happened();
      EXPECT_EQ(complete, !failed);
    });
    EXPECT_EQ(output, failed ? test_support::bug_line("linked_list", "ll_create_entry",
                                                      "calloc failed to allocate memory for the entry. ptr:PTR") +
                                   error(filter, "Failed creating entry.")
                             : "");
    EXPECT_EQ(ll_size(formats.get()), std::min(3U, room / 64)) << room;
    *formats = {};
  }
}

}  // namespace
