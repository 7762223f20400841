// Sentences and sources of decisions made by hand.
#include "explain/reason_texts.h"

#include <gmock/gmock.h>

#include "config_store.h"
#include "explain/reason_table.h"
#include "explain/rows.h"

namespace edid_cli {
namespace {

using testing::AllOf;
using testing::AnyOf;
using testing::ElementsAre;
using testing::EndsWith;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::Not;

constexpr const char *platform = R"([platform.software.drivers.vorex.edid]
monitor_name = "Box"
60_hz_priority_list = ["16", "99", "4"]
60_hz_addition_list = ["16"]
50_hz_priority_list = [
  "31",
  "x",
  "19",
]
50_hz_addition_list = ["31"]
4k_x_2k_priority_list = [7, 1]
4k_x_2k_addition_list = []
geometry_limit = 1
dc_30bit = 1
[platform.software.drivers.vorex.edid.audio]
entry_a = 0x077F09
entry_c = 0x500715
)";

class Reasons : public testing::Test {
 protected:
  Reasons() {
    EXPECT_TRUE(config_store_load_text(platform, std::char_traits<char>::length(platform), "box.toml"))
        << config_store_error();
    options_.settings.audio_mask = 0x3;
  }

  static compose_decision_t decision(compose_subject subject, u32 code, compose_verdict verdict,
                                     compose_reason reason) {
    return {sizeof(compose_decision_t),
            static_cast<u32>(subject),
            code,
            static_cast<u32>(verdict),
            static_cast<u32>(reason),
            0,
            -1,
            -1,
            -1,
            -1,
            {}};
  }

  /// A decision for what has no place in any list.
  static compose_decision_t left_out(compose_reason reason, std::initializer_list<i32> values) {
    compose_decision_t result = decision(COMPOSE_SUBJECT_VIDEO_MODE, 16, COMPOSE_VERDICT_LEFT_OUT, reason);
    std::copy(values.begin(), values.end(), result.value);
    return result;
  }

  void use_50_hz() {
    composition_.decisions.push_back(
        decision(COMPOSE_SUBJECT_NATIVE_RATE, 50, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_RATE_OF_PLATFORM));
  }

  explained_t explained() { return {composition_, no_bytes_, sink_, "", reading_, places_(), options_}; }
  std::string sentence(const compose_decision_t &decision) { return reason_sentence(decision, explained()); }

  std::vector<std::string> sources(const compose_decision_t &decision) {
    composition_.decisions.push_back(decision);
    std::vector<std::string> texts;
    for (const row_t &row : rows_of(explained())) {
      if (row.decision.subject == decision.subject && row.decision.code == decision.code) {
        for (const source_t &source : row.sources) {
          texts.push_back(source.text);
        }
      }
    }
    return texts;
  }

  const platform_places_t &places_() {
    if (!read_) {
      read_.emplace("box.toml");
    }
    return *read_;
  }

  std::optional<platform_places_t> read_;
  composition_t composition_;
  sink_reading_t reading_;
  const std::vector<u8> no_bytes_;
  edid_t sink_{};
  composition_options_t options_;
};

TEST_F(Reasons, AllThatTheLibraryKnowsHaveASentence) {
  u32 reason = 1;
  for (; std::string(compose_reason_string(reason)) != compose_reason_string(0); ++reason) {
    compose_decision_t known = left_out(COMPOSE_REASON_NO_ROOM, {});
    known.reason = reason;
    ASSERT_NE(reason_text(reason).sentence, nullptr) << compose_reason_string(reason);
    EXPECT_THAT(sentence(known), AllOf(EndsWith("."), Not(HasSubstr("{")), Not(HasSubstr("}"))));
  }
  EXPECT_GE(reason, 58U);
}

TEST_F(Reasons, OneThatIsNotKnownIsToldInTheLibrarysWords) {
  compose_decision_t unknown = left_out(COMPOSE_REASON_NO_ROOM, {});
  unknown.reason = 9999;
  EXPECT_EQ(sentence(unknown), compose_reason_string(9999));
}

TEST_F(Reasons, NameTheListsOfTheFamilyInUse) {
  EXPECT_EQ(sentence(left_out(COMPOSE_REASON_NOT_AVAILABLE, {})),
            "60_hz_priority_list names it, but neither the sink nor 60_hz_addition_list has it.");
  use_50_hz();
  EXPECT_EQ(sentence(left_out(COMPOSE_REASON_NOT_AVAILABLE, {})),
            "50_hz_priority_list names it, but neither the sink nor 50_hz_addition_list has it.");
}

TEST_F(Reasons, NameTheListsOf4kModes) {
  EXPECT_EQ(sentence(decision(COMPOSE_SUBJECT_4K_MODE, 1, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_NOT_AVAILABLE)),
            "4k_x_2k_priority_list names it, but neither the sink nor 4k_x_2k_addition_list has it.");
}

TEST_F(Reasons, TellWhoHasWhatThePriorityListDoesNotName) {
  compose_decision_t mode = left_out(COMPOSE_REASON_NOT_IN_PRIORITY_LIST, {});
  mode.origins = COMPOSE_ORIGIN_ADDITION_LIST;
  EXPECT_EQ(sentence(mode), "60_hz_addition_list has it, but 60_hz_priority_list does not name it.");
  mode.sink_index = 0;
  EXPECT_EQ(sentence(mode), "The sink has it, but 60_hz_priority_list does not name it.");
}

TEST_F(Reasons, PutTheirNumbersIntoWords) {
  const struct {
    compose_reason reason;
    std::initializer_list<i32> values;
    const char *sentence;
  } cases[] = {
      {COMPOSE_REASON_TALLER_THAN_SINK,
       {1080, 720},
       "It has 1080 lines, and the sink's tallest mode limits them to 720."},
      {COMPOSE_REASON_NO_ROOM, {10}, "It was chosen, but there is no room for it: a source finds 10 of its kind."},
      {COMPOSE_REASON_TIMING_WITHOUT_VIC, {1366, 768, 60, 0}, "The sink has it; it has no VIC, so it is not offered."},
      {COMPOSE_REASON_PLATFORM_FORMAT, {1}, "The platform has it."},
      {COMPOSE_REASON_NARROWED_TO_SINK,
       {8, 6, 0x7F, 0x07},
       "The platform's format, narrowed to what the sink takes: 8 channels became 6, 32kHz 44.1kHz 48kHz 88.2kHz "
       "96kHz 176.4kHz 192kHz became 32kHz 44.1kHz 48kHz."},
      {COMPOSE_REASON_NARROWED_TO_SINK,
       {8, 6, 0x07, 0x07},
       "The platform's format, narrowed to what the sink takes: 8 channels became 6."},
      {COMPOSE_REASON_NARROWED_TO_SINK,
       {2, 2, 0x0F, 0x07},
       "The platform's format, narrowed to what the sink takes: 32kHz 44.1kHz 48kHz 88.2kHz became 32kHz 44.1kHz "
       "48kHz."},
      {COMPOSE_REASON_NARROWED_TO_SINK,
       {2, 2, 0x07, 0x07},
       "The platform's format, narrowed to what the sink takes: fewer sample sizes, or a lower bit rate."},
      {COMPOSE_REASON_NOT_AN_AUDIO_FORMAT, {0x123407}, "The platform's entry 0x123407 is not an audio format."},
      {COMPOSE_REASON_DUPLICATE, {2, 0}, "Format 1 of those chosen covers it already."},
      {COMPOSE_REASON_AUDIO_MASK, {0x3, 0x40}, "The audio mask in force, 0x3, leaves its type out; its bit is 0x40."},
      {COMPOSE_REASON_AUDIO_MASK, {-2, 1}, "The audio mask in force, 0xFFFFFFFE, leaves its type out; its bit is 0x1."},
      {COMPOSE_REASON_CURRENT_MODE_WITHOUT_VIC, {1920, 540, 50, 1}, "1920x540i50 has no VIC."},
      {COMPOSE_REASON_ADDRESS_BELOW_SINK,
       {3, 0x2000},
       "Input 3 takes the first free place of the sink's address 2.0.0.0."},
      {COMPOSE_REASON_DEEP_COLOR_OF_PLATFORM, {0}, "The platform says no."},
      {COMPOSE_REASON_TMDS_OVERRIDE,
       {300, 0},
       "The platform sets 300 MHz, declared in steps of 5; the sink declares none."},
      {COMPOSE_REASON_TMDS_OF_MODES,
       {148500, 150, 225},
       "The fastest mode has a pixel clock of 148.50 MHz, and the colour depth takes 150 % of it; the sink declares "
       "225 MHz."},
      {COMPOSE_REASON_LATENCY_OF_BOTH,
       {10, 20, 30},
       "10 ms of the platform and 20 ms of the sink are declared as 30 ms."},
      {COMPOSE_REASON_ROOM_ENOUGH, {98, 127}, "98 of 127 bytes are used."},
      {COMPOSE_REASON_BLOCK_TOO_LONG,
       {120, 127, 32, 31},
       "A data block has 32 bytes, but its length field can hold 31 at most: sources read it as shorter."},
  };
  for (const auto &expected : cases) {
    EXPECT_EQ(sentence(left_out(expected.reason, expected.values)), expected.sentence);
  }
}

TEST_F(Reasons, SayWhichRateCountsAsWhich) {
  compose_decision_t rate =
      decision(COMPOSE_SUBJECT_NATIVE_RATE, 60, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_RATE_OF_DETAILED_TIMING);
  rate.value[1] = 60;
  EXPECT_EQ(sentence(rate), "The sink's detailed timing 1 has 60 Hz.");
  rate.value[1] = 59;
  EXPECT_EQ(sentence(rate), "The sink's detailed timing 1 has 59 Hz, which counts as 60.");
}

TEST_F(Reasons, SayWhatALatencyOf0MsIsDeclaredFor) {
  EXPECT_EQ(sentence(decision(COMPOSE_SUBJECT_LATENCY, 0, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_LATENCY_NONE)),
            "Neither the platform nor the sink has a delay.");
  EXPECT_EQ(sentence(decision(COMPOSE_SUBJECT_LATENCY, 0, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_LATENCY_NONE)),
            "Neither the platform nor the sink has a delay: 0 ms is declared, as other latencies are.");
}

TEST_F(Reasons, ForNoRoomAreTheNameThatIsMissing) {
  composition_.decisions.push_back(
      decision(COMPOSE_SUBJECT_EXTENSION_ROOM, 80, COMPOSE_VERDICT_CHANGED, COMPOSE_REASON_NOT_ANNOUNCED));
  EXPECT_EQ(sentence(left_out(COMPOSE_REASON_NO_ROOM, {0})),
            "It was chosen, but without a monitor name sources do not read the extension.");
}

TEST_F(Reasons, OfVicsAbove64WithoutHdmi2AreTheKeyThatTurnsItOn) {
  compose_decision_t mode = left_out(COMPOSE_REASON_NOT_IN_PRIORITY_LIST, {});
  mode.code = 97;
  EXPECT_EQ(sentence(mode), "The sink has it; VICs above 64 are offered with hdmi2.enable = 1 only.");
  mode.code = 95;
  EXPECT_EQ(sentence(mode),
            "The sink has it; VICs above 64 are offered with hdmi2.enable = 1 only. HDMI 1.4 has it as 4k:1.");
}

TEST_F(Reasons, ThatRestOnWhatWasNotReadSaySo) {
  reading_.missing_part = "the sink's extension was not read";
  u32 resting = 0;
  for (u32 reason = 1; std::string(compose_reason_string(reason)) != compose_reason_string(0); ++reason) {
    compose_decision_t known = left_out(COMPOSE_REASON_NO_ROOM, {});
    known.reason = reason;
    const bool says_so = sentence(known).find(reading_.missing_part) != std::string::npos;
    EXPECT_EQ(says_so, rests_on_unread(known, explained())) << sentence(known);
    resting += says_so ? 1 : 0;
  }
  EXPECT_EQ(resting, 16U);
  EXPECT_EQ(sentence(left_out(COMPOSE_REASON_NOT_AVAILABLE, {})),
            "Only 60_hz_priority_list names it, and the sink's extension was not read.");
  EXPECT_FALSE(rests_on_unread(left_out(COMPOSE_REASON_SINK_HAS_IT, {}), explained()));
}

TEST_F(Reasons, ComeFromTheEntryThatCounts) {
  compose_decision_t mode =
      decision(COMPOSE_SUBJECT_VIDEO_MODE, 4, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_SINK_HAS_IT);
  mode.origins = COMPOSE_ORIGIN_DETAILED_TIMING | COMPOSE_ORIGIN_SHORT_VIDEO | COMPOSE_ORIGIN_PRIORITY_LIST;
  mode.sink_index = 2;
  mode.priority_index = 1;
  EXPECT_THAT(sources(mode),
              ElementsAre("sink: detailed timing 3, short video descriptor", "box.toml:3 60_hz_priority_list[2]"));
}

TEST_F(Reasons, ComeFromTheOtherFamilysListWhereOnlyThatNamesIt) {
  compose_decision_t mode =
      decision(COMPOSE_SUBJECT_VIDEO_MODE, 19, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_OTHER_REFRESH_FAMILY);
  mode.origins = COMPOSE_ORIGIN_OTHER_PRIORITY_LIST;
  mode.priority_index = 1;
  mode.value[0] = 60;
  EXPECT_THAT(sources(mode), ElementsAre("box.toml:8 50_hz_priority_list[2]"));
  EXPECT_EQ(sentence(mode), "Only the 50 Hz lists name it, and the 60 Hz lists are in use.");
}

TEST_F(Reasons, ComeFrom4kListsAndAudioEntries) {
  compose_decision_t mode = decision(COMPOSE_SUBJECT_4K_MODE, 1, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_SINK_HAS_IT);
  mode.origins = COMPOSE_ORIGIN_SINK_4K | COMPOSE_ORIGIN_PRIORITY_LIST;
  mode.sink_index = 0;
  mode.priority_index = 0;
  EXPECT_THAT(sources(mode), ElementsAre("sink: HDMI VIC 1", "box.toml:11 4k_x_2k_priority_list[1]"));
  compose_decision_t format =
      decision(COMPOSE_SUBJECT_AUDIO_FORMAT, 2, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_AUDIO_MASK);
  format.origins = COMPOSE_ORIGIN_PLATFORM_AUDIO;
  format.priority_index = 1;
  EXPECT_THAT(sources(format), ElementsAre("box.toml:17 audio.entry_c", "--audio-mask 0x3"));
}

TEST_F(Reasons, ComeFromKeysWithTheirLines) {
  EXPECT_THAT(
      sources(decision(COMPOSE_SUBJECT_GEOMETRY_LIMIT, 1080, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_GEOMETRY_OF_SINK)),
      ElementsAre("box.toml:13 geometry_limit = 1"));
  EXPECT_THAT(
      sources(decision(COMPOSE_SUBJECT_DEEP_COLOR, 30, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_DEEP_COLOR_OF_PLATFORM)),
      ElementsAre("box.toml:14 dc_30bit = 1"));
  EXPECT_THAT(
      sources(decision(COMPOSE_SUBJECT_EXTENSION_ROOM, 80, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_NOT_ANNOUNCED)),
      ElementsAre("box.toml:2 monitor_name = \"Box\""));
  EXPECT_THAT(sources(decision(COMPOSE_SUBJECT_TMDS_CLOCK, 0, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_TMDS_LARGEST)),
              ElementsAre("box.toml tmds_override (not there)"));
}

TEST_F(Reasons, APlaceThatTheListDoesNotHaveIsNotTold) {
  compose_decision_t mode =
      decision(COMPOSE_SUBJECT_VIDEO_MODE, 4, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_SINK_HAS_IT);
  mode.origins = COMPOSE_ORIGIN_PRIORITY_LIST;
  mode.priority_index = 99;
  EXPECT_THAT(sources(mode), IsEmpty());
}

}  // namespace
}  // namespace edid_cli
