// The course of decoding a base block: what is refused, in which order, and what stays of it.
#include <cstdio>

#include "codec_fixture.h"
#include "support/failing_allocation.h"

namespace codec_test {
namespace {

constexpr const char *function = "decode_edid_block_0";

std::string error(const std::string &message) {
  return codec_error(function, message);
}

// What decoding the block prints; its result must be as given.
std::string output_of_decoding(const bytes_t &block, edid_t *edid, u8 result) {
  return output_of([&] { EXPECT_EQ(decode_base_block(block, edid), result); });
}

bytes_t with_version(u8 version, u8 revision) {
  return blank_base_block().byte(18, version).byte(19, revision).build();
}

// A block with something in every step of the decoding.
test_support::base_block_builder_t filled_base_block() {
  return blank_base_block()
      .byte(8, 0x04)
      .byte(9, 0x43)
      .byte(10, 0x34)
      .byte(12, 0x78)
      .byte(16, 9)
      .byte(17, 30)
      .byte(21, 100)
      .byte(23, 120)
      .byte(24, 0x02)
      .byte(35, 0x20)
      .standard_timing(0, 0x81, 0x80)
      .descriptor(0, test_support::text_descriptor(0xFC, "NAME"))
      .extensions(1);
}

const fields_t identity_of_filled_block = {{"manufacturer", "ABC"}, {"product_code", "52"}, {"serial_number", "120"},
                                           {"week", "9"},           {"year", "2020"},       {"version", "1"},
                                           {"revision", "3"}};

}  // namespace

TEST(BaseBlockDecoder, DecodesABlankBlockToTheFieldsThatItMustSet) {
  scoped_edid_t edid;
  const fields_t before = fields_of(*edid.get());
  const bytes_t block = blank_base_block().build();
  EXPECT_EQ(output_of_decoding(block, edid.get(), 1), "");
  EXPECT_EQ(difference(before, fields_of(*edid.get())), (fields_t{{"valid", "1"},
                                                                  {"manufacturer", "@@@"},
                                                                  {"version", "1"},
                                                                  {"revision", "3"},
                                                                  {"year", "1990"},
                                                                  {"digital", "1"},
                                                                  {"checksum", std::to_string(block[127])}}));
}

TEST(BaseBlockDecoder, PrintsNothingForABlankBlockWhileTracing) {
  scoped_edid_t edid;
  const bytes_t block = blank_base_block().build();
  EXPECT_EQ(traced_output_of([&] { EXPECT_EQ(decode_base_block(block, edid.get()), 1); }), "");
}

TEST(BaseBlockDecoder, DecodesEveryStepOfAFilledBlock) {
  scoped_edid_t edid;
  const fields_t before = fields_of(*edid.get());
  EXPECT_EQ(output_of_decoding(filled_base_block().build(), edid.get(), 1), "");
  EXPECT_EQ(changes(before, fields_of(*edid.get())),
            together(identity_of_filled_block, {{"valid", "1"},
                                                {"digital", "1"},
                                                {"h_size_cm", "100"},
                                                {"gamma", "120"},
                                                {"preferred_timing", "1"},
                                                {"est_timings_1", "32"},
                                                {"std_timings[0].h_active", "1280"},
                                                {"std_timings[0].aspect_ratio", "2"},
                                                {"std_timings[0].refresh_rate", "60"},
                                                {"monitor_name", "NAME"},
                                                {"extension_count", "1"}}));
}

TEST(BaseBlockDecoder, RefusesAMissingBlockFirst) {
  scoped_edid_t edid;
  EXPECT_EQ(output_of([&] { EXPECT_EQ(decode_edid_block_0(nullptr, edid.get()), 0); }),
            error("Function called with edid_block set to NULL."));
  EXPECT_EQ(output_of([&] { EXPECT_EQ(decode_edid_block_0(nullptr, nullptr), 0); }),
            error("Function called with edid_block set to NULL."));
}

TEST(BaseBlockDecoder, RefusesAMissingRecord) {
  EXPECT_EQ(output_of_decoding(blank_base_block().build(), nullptr, 0),
            error("Function called with edid set to NULL."));
  EXPECT_EQ(output_of_decoding(bytes_t(128, 0), nullptr, 0), error("Function called with edid set to NULL."));
}

TEST(BaseBlockDecoder, RefusesARecordWhoseListsAreNotAllInitialised) {
  const struct {
    ll_list_t edid_t::*list;
    const char *type_name;
    const char *message;
  } cases[] = {
      {&edid_t::std_timings, "std_timing_t", "standard_timing_list: List not initialized."},
      {&edid_t::dtd_list, "detailed_timing_t", "detailed_timing_list: List not initialized."},
      {&edid_t::video_list, "short_video_desc_t", "short_video_description_list: List not initialized."},
      {&edid_t::audio_list, "short_audio_desc_t", "short_audio_description_list: List not initialized."},
  };
  for (const auto &each : cases) {
    SCOPED_TRACE(each.message);
    scoped_edid_t edid;
    ASSERT_TRUE(ll_delete_list(&(edid.get()->*each.list)));
    EXPECT_EQ(output_of_decoding(blank_base_block().build(), edid.get(), 0), error(each.message));
    EXPECT_EQ(edid->valid, 0);
    ASSERT_TRUE(ll_init(&(edid.get()->*each.list), each.type_name));
  }
}

TEST(BaseBlockDecoder, TestsTheListsInOrderAndBeforeTheHeader) {
  edid_t edid{};
  EXPECT_EQ(output_of_decoding(bytes_t(128, 0), &edid, 0), error("standard_timing_list: List not initialized."));
  ASSERT_TRUE(ll_init(&edid.std_timings, "std_timing_t"));
  EXPECT_EQ(output_of_decoding(bytes_t(128, 0), &edid, 0), error("detailed_timing_list: List not initialized."));
  ASSERT_TRUE(ll_init(&edid.dtd_list, "detailed_timing_t"));
  EXPECT_EQ(output_of_decoding(bytes_t(128, 0), &edid, 0),
            error("short_video_description_list: List not initialized."));
  ASSERT_TRUE(ll_init(&edid.video_list, "short_video_desc_t"));
  EXPECT_EQ(output_of_decoding(bytes_t(128, 0), &edid, 0),
            error("short_audio_description_list: List not initialized."));
}

TEST(BaseBlockDecoder, RefusesAnotherHeaderAndPrintsBothAs64BitNumbers) {
  bytes_t block = blank_base_block().build();
  for (std::size_t i = 0; i < 8; ++i)
    block[i] = byte_of(static_cast<u32>(i) + 1);
  scoped_edid_t edid;
  EXPECT_EQ(output_of_decoding(block, edid.get(), 0),
            error("Failed verifying the header. Expected:  ffffffffffff00 Received: 807060504030201"));
  EXPECT_EQ(fields_of(*edid.get()), fields_of(edid_t{}));

  EXPECT_EQ(output_of_decoding(bytes_t(128, 0), edid.get(), 0),
            error("Failed verifying the header. Expected:  ffffffffffff00 Received:               0"));
  EXPECT_EQ(output_of_decoding(bytes_t(128, 0xFF), edid.get(), 0),
            error("Failed verifying the header. Expected:  ffffffffffff00 Received:ffffffffffffffff"));
}

TEST(BaseBlockDecoder, VerifiesEachByteOfTheHeader) {
  for (u32 offset = 0; offset < 8; ++offset) {
    SCOPED_TRACE(offset);
    scoped_edid_t edid;
    const bytes_t block = blank_base_block().byte(offset, 0x7F).build();
    const std::string output = output_of_decoding(block, edid.get(), 0);
    EXPECT_EQ(test_support::count_of(output, "Failed verifying the header. Expected:  ffffffffffff00 Received:"), 1);
    EXPECT_EQ(test_support::count_of(output, "\n"), 1);
    EXPECT_EQ(edid->valid, 0);
  }
}

TEST(BaseBlockDecoder, MarksTheRecordValidBeforeItRefusesTheChecksum) {
  bytes_t block = filled_base_block().build();
  const u8 right = block[127];
  const u8 wrong = byte_of(right + 1u);
  block[127] = wrong;
  char message[100];
  std::snprintf(message, sizeof(message), "Edid failed the checksum. Calculated:0x%02X Received:0x%02X", right, wrong);

  scoped_edid_t edid;
  EXPECT_EQ(output_of_decoding(block, edid.get(), 0), error(message));
  EXPECT_EQ(difference(fields_of(edid_t{}), fields_of(*edid.get())),
            (fields_t{{"valid", "1"}, {"checksum", std::to_string(wrong)}}));
}

TEST(BaseBlockDecoder, PrintsChecksumsAsTwoUpperCaseDigits) {
  bytes_t block(128, 0);
  std::fill(block.begin() + 1, block.begin() + 7, u8{0xFF});
  block[127] = 0x0B;
  scoped_edid_t edid;
  // The header sums to 0x5FA.
  EXPECT_EQ(output_of_decoding(block, edid.get(), 0), error("Edid failed the checksum. Calculated:0x06 Received:0x0B"));
  block[8] = 0x4A;
  EXPECT_EQ(output_of_decoding(block, edid.get(), 0), error("Edid failed the checksum. Calculated:0xBC Received:0x0B"));
}

TEST(BaseBlockDecoder, TestsTheChecksumBeforeTheVersion) {
  bytes_t block = with_version(2, 0);
  block[127] ^= 0xFF;
  scoped_edid_t edid;
  const std::string output = output_of_decoding(block, edid.get(), 0);
  EXPECT_EQ(test_support::count_of(output, "Edid failed the checksum."), 1);
  EXPECT_EQ(test_support::count_of(output, "\n"), 1);
}

TEST(BaseBlockDecoder, AcceptsEveryRevisionOfVersion1From3On) {
  for (const u8 revision : {u8{3}, u8{4}, u8{5}, u8{255}}) {
    SCOPED_TRACE(u32{revision});
    scoped_edid_t edid;
    EXPECT_EQ(output_of_decoding(with_version(1, revision), edid.get(), 1), "");
    EXPECT_EQ(edid->version, 1);
    EXPECT_EQ(edid->revision, revision);
  }
}

TEST(BaseBlockDecoder, RefusesOtherVersionsAndRevisions) {
  const struct {
    u8 version;
    u8 revision;
    const char *received;
  } cases[] = {{1, 2, "1.2"}, {1, 0, "1.0"}, {2, 3, "2.3"}, {0, 3, "0.3"}, {255, 255, "255.255"}};
  for (const auto &each : cases) {
    SCOPED_TRACE(each.received);
    scoped_edid_t edid;
    EXPECT_EQ(output_of_decoding(with_version(each.version, each.revision), edid.get(), 0),
              error(std::string("Failed EDID Version/Revision check. Expected:1.3 Recieved:") + each.received));
  }
}

TEST(BaseBlockDecoder, KeepsTheIdentityWhenItRefusesTheVersion) {
  scoped_edid_t edid;
  output_of_decoding(filled_base_block().byte(19, 2).build(), edid.get(), 0);
  fields_t expected = together({{"valid", "1"}}, identity_of_filled_block);
  expected["revision"] = "2";
  EXPECT_EQ(changes(fields_of(edid_t{}), fields_of(*edid.get())), expected);
}

TEST(BaseBlockDecoder, DecodesAnAnalogueInputWithAWarning) {
  scoped_edid_t digital;
  ASSERT_EQ(decode_base_block(filled_base_block().build(), digital.get()), 1);
  scoped_edid_t analogue;
  EXPECT_EQ(output_of_decoding(filled_base_block().byte(20, 0x7F).build(), analogue.get(), 1),
            codec_warning(function, "EDID inappropriately set to analog. Continuing."));
  EXPECT_EQ(changes(fields_of(*digital.get()), fields_of(*analogue.get())), (fields_t{{"digital", "0"}}));
}

TEST(BaseBlockDecoder, NamesADescriptorThatItRefusesCountedFrom0) {
  const char *const bytes = "0x0 0x0 0xa 0xfc 0x0 0x41 0xa 0x20 0x20 0x20 0x20 0x20 0x20 0x20 0x20 0x20 0x20 0x20";
  for (u32 slot = 0; slot < 4; ++slot) {
    SCOPED_TRACE(slot);
    bytes_t descriptor = test_support::text_descriptor(0xFC, "A");
    descriptor[2] = 0x0A;
    scoped_edid_t edid;
    EXPECT_EQ(
        output_of_decoding(
            filled_base_block().descriptor(0, test_support::dummy_descriptor()).descriptor(slot, descriptor).build(),
            edid.get(), 0),
        codec_error("_decode_edid_dtd",
                    "Malformed DTD: The DTD's pixel clock is 0 indicating that the byte 0x2 and byte 0x4 should be "
                    "zero, but they are not. Byte2:0x0A Byte4:0x00") +
            error("Failed decoding #" + std::to_string(slot) + " DTD. " + bytes));
    EXPECT_EQ(edid->extension_count, 0);
  }
}

TEST(BaseBlockDecoder, PrintsEachByteOfADescriptorThatItRefuses) {
  bytes_t descriptor(18, 0);
  for (u32 i = 2; i < 18; ++i)
    descriptor[i] = byte_of(0xA0 + i);
  scoped_edid_t edid;
  const std::string output = output_of_decoding(blank_base_block().descriptor(3, descriptor).build(), edid.get(), 0);
  EXPECT_EQ(
      test_support::lines_in(output).at(1) + "\n",
      error("Failed decoding #3 DTD. 0x0 0x0 0xa2 0xa3 0xa4 0xa5 0xa6 0xa7 0xa8 0xa9 0xaa 0xab 0xac 0xad 0xae 0xaf "
            "0xb0 0xb1"));
}

TEST(BaseBlockDecoder, KeepsWhatItDecodedBeforeABadDescriptor) {
  bytes_t bad = test_support::dummy_descriptor();
  bad[4] = 1;
  scoped_edid_t edid;
  output_of_decoding(filled_base_block()
                         .descriptor(1, test_support::timing_descriptor(test_support::timing_of_vic(16)))
                         .descriptor(2, bad)
                         .descriptor(3, test_support::text_descriptor(0xFF, "SERIAL"))
                         .build(),
                     edid.get(), 0);
  EXPECT_EQ(edid->valid, 1);
  EXPECT_EQ(edid->gamma, 120u);
  EXPECT_EQ(elements_of<std_timing_t>(edid->std_timings).size(), 1u);
  EXPECT_EQ(elements_of<detailed_timing_t>(edid->dtd_list).size(), 1u);
  EXPECT_STREQ(edid->monitor_name, "NAME");
  EXPECT_STREQ(edid->serial_string, "");
  EXPECT_EQ(edid->extension_count, 0);
}

TEST(BaseBlockDecoder, NamesAStandardTimingThatItsListRefusesCountedFrom1) {
  scoped_edid_t edid;
  const mistyped_list_t mistyped(edid->std_timings);
  EXPECT_EQ(output_of_decoding(blank_base_block().standard_timing(2, 0xD1, 0xC0).build(), edid.get(), 0),
            mistyped_list_t::refusal(std_timing_tag) +
                codec_error("_decode_edid_standard_timing", "Failed adding entry to the back of the list.") +
                error("Failed decoding #3 standard timing. Val1:0xd1 Val2:0xc0"));
  EXPECT_EQ(edid->std_timings.size, 0u);
}

TEST(BaseBlockDecoder, StopsAtATimingThatItsListRefuses) {
  scoped_edid_t edid;
  const mistyped_list_t mistyped(edid->dtd_list);
  bytes_t descriptor(18, 0);
  descriptor[0] = 0x01;
  descriptor[17] = 0x1E;
  EXPECT_EQ(output_of_decoding(filled_base_block().descriptor(1, descriptor).build(), edid.get(), 0),
            mistyped_list_t::refusal(detailed_timing_tag) +
                codec_error("_decode_edid_dtd", "Failed adding entry to the back.") +
                error("Failed decoding #1 DTD. 0x1 0x0 0x0 0x0 0x0 0x0 0x0 0x0 0x0 0x0 0x0 0x0 0x0 0x0 0x0 0x0 0x0 "
                      "0x1e"));
  EXPECT_EQ(elements_of<std_timing_t>(edid->std_timings).size(), 1u);
}

TEST(BaseBlockDecoder, StopsWhenAnEntryCannotBeAllocated) {
  bytes_t timing(18, 0);
  timing[0] = 0x01;
  const bytes_t block = blank_base_block().standard_timing(0, 0x81, 0x80).descriptor(0, timing).build();
  const std::string no_entry = test_support::bug_line("linked_list", "ll_create_entry",
                                                      "calloc failed to allocate memory for the entry. ptr:PTR");
  const std::string no_payload = test_support::bug_line(
      "linked_list", "ll_create_entry", "calloc failed to allocate memory for the data storage. ptr:PTR");
  const std::string no_standard_timing = codec_error("_decode_edid_standard_timing", "Failed creating entry.") +
                                         error("Failed decoding #1 standard timing. Val1:0x81 Val2:0x80");
  const std::string no_detailed_timing =
      codec_error("_decode_edid_dtd", "Failed creating an entry.") +
      error("Failed decoding #0 DTD. 0x1 0x0 0x0 0x0 0x0 0x0 0x0 0x0 0x0 0x0 0x0 0x0 0x0 0x0 0x0 0x0 0x0 0x0");
  const std::string expected[] = {no_entry + no_standard_timing, no_payload + no_standard_timing,
                                  no_entry + no_detailed_timing, no_payload + no_detailed_timing};
  for (int nth = 1; nth <= 4; ++nth) {
    SCOPED_TRACE(nth);
    scoped_edid_t edid;
    EXPECT_EQ(output_of([&] {
                const test_support::failing_allocation_t failing(nth);
                EXPECT_EQ(decode_base_block(block, edid.get()), 0);
                EXPECT_TRUE(failing.happened());
              }),
              expected[nth - 1]);
    EXPECT_EQ(edid->std_timings.size, nth <= 2 ? 0u : 1u);
    EXPECT_EQ(edid->dtd_list.size, 0u);
  }
}

TEST(BaseBlockDecoder, AppendsToTheListsOfARecordThatIsFilledAlready) {
  scoped_edid_t edid;
  const bytes_t first = blank_base_block().standard_timing(0, 0x81, 0x80).build();
  const bytes_t second = blank_base_block().standard_timing(4, 0xD1, 0xC0).build();
  ASSERT_EQ(decode_base_block(first, edid.get()), 1);
  ASSERT_EQ(decode_base_block(second, edid.get()), 1);
  EXPECT_EQ(test_support::std_timings_of(edid->std_timings),
            (std::vector<test_support::std_timing_words_t>{{1280, 2, 60}, {1920, 3, 60}}));
}

}  // namespace codec_test
