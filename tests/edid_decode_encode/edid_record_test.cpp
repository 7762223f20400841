#include <array>
#include <cstring>

#include "codec_fixture.h"

namespace codec_test {
namespace {

using list_member_t = ll_list_t edid_t::*;

struct record_list_t {
  list_member_t list;
  const char *type_name;
  const char *not_initialised_name;
  const char *deletion_name;
};

// In the order in which the record's operations go through them.
constexpr std::array<record_list_t, 4> record_lists{{
    {&edid_t::std_timings, "std_timing_t", "standard_timing_list", "standard_timing_list"},
    {&edid_t::dtd_list, "detailed_timing_t", "detailed_timing_list", "detailed_timing_list"},
    {&edid_t::video_list, "short_video_desc_t", "short_video_description_timing_list", "short_video_description_list"},
    {&edid_t::audio_list, "short_audio_desc_t", "short_audio_description_timing_list", "short_audio_description_list"},
}};

std::string not_initialised_line(const record_list_t &list) {
  return codec_error("edid_destroy", std::string("List is not initialized. List:") + list.not_initialised_name + ".");
}

void add_one_entry_to_each_list(edid_t &edid) {
  append(edid.std_timings, std_timing_t{1280, 2, 60});
  append(edid.dtd_list, detailed_timing_t{});
  append(edid.video_list, short_video_desc_t{0, 16, 0});
  append(edid.audio_list, short_audio_desc_t{});
}

}  // namespace

TEST(EdidRecord, PrepareClearsARecordFullOfGarbage) {
  edid_t edid;
  std::memset(static_cast<void *>(&edid), 0xA5, sizeof(edid));
  EXPECT_EQ(output_of([&] { EXPECT_EQ(edid_prepare(&edid), 1); }), "");

  const edid_t zero{};
  EXPECT_EQ(fields_of(edid), fields_of(zero));
  EXPECT_EQ(std::string(edid.manufacturer, sizeof(edid.manufacturer)), std::string(4, '\0'));
  EXPECT_EQ(std::string(edid.serial_string, sizeof(edid.serial_string)), std::string(14, '\0'));
  EXPECT_EQ(std::string(edid.data_string, sizeof(edid.data_string)), std::string(14, '\0'));
  EXPECT_EQ(std::string(edid.monitor_name, sizeof(edid.monitor_name)), std::string(14, '\0'));
  for (const record_list_t &each : record_lists) {
    SCOPED_TRACE(each.type_name);
    EXPECT_TRUE(ll_is_initialized(&(edid.*each.list)));
    EXPECT_TRUE(ll_verify_list_type(&(edid.*each.list), each.type_name));
    EXPECT_TRUE(ll_verify_integrity(&(edid.*each.list)));
    EXPECT_EQ(ll_size(&(edid.*each.list)), 0);
  }
  EXPECT_EQ(edid_destroy(&edid), 1);
}

TEST(EdidRecord, PreparePrintsNothingWhileTracing) {
  edid_t edid;
  EXPECT_EQ(traced_output_of([&] {
              EXPECT_EQ(edid_prepare(&edid), 1);
              EXPECT_EQ(edid_destroy(&edid), 1);
            }),
            "");
}

TEST(EdidRecord, PrepareOfAFilledRecordOverwritesItWithoutAReport) {
  edid_t edid{};
  ASSERT_EQ(edid_prepare(&edid), 1);
  add_one_entry_to_each_list(edid);
  edid.week = 7;
  std::array<ll_entry_t *, 4> orphans{};
  for (std::size_t i = 0; i < record_lists.size(); ++i)
    orphans[i] = (edid.*record_lists[i].list).head;

  EXPECT_EQ(output_of([&] { EXPECT_EQ(edid_prepare(&edid), 1); }), "");
  EXPECT_EQ(fields_of(edid), fields_of(edid_t{}));

  for (ll_entry_t *orphan : orphans)
    EXPECT_TRUE(ll_delete_entry(orphan));
  EXPECT_EQ(edid_destroy(&edid), 1);
}

TEST(EdidRecord, DestroyReleasesTheListsAndKeepsEveryOtherField) {
  edid_t edid{};
  ASSERT_EQ(edid_prepare(&edid), 1);
  add_one_entry_to_each_list(edid);
  edid.valid = 1;
  edid.serial_number = 0x12345678;
  edid.xvycc709 = 1;
  std::memcpy(edid.monitor_name, "NAME", 5);

  EXPECT_EQ(output_of([&] { EXPECT_EQ(edid_destroy(&edid), 1); }), "");
  edid_t expected{};
  expected.valid = 1;
  expected.serial_number = 0x12345678;
  expected.xvycc709 = 1;
  std::memcpy(expected.monitor_name, "NAME", 5);
  EXPECT_EQ(fields_of(edid), fields_of(expected));
  for (const record_list_t &each : record_lists) {
    SCOPED_TRACE(each.type_name);
    EXPECT_FALSE(ll_is_initialized(&(edid.*each.list)));
    EXPECT_EQ((edid.*each.list).size, 0u);
    EXPECT_EQ((edid.*each.list).head, nullptr);
  }
}

TEST(EdidRecord, MayBePreparedAgainOnceDestroyed) {
  edid_t edid{};
  ASSERT_EQ(edid_prepare(&edid), 1);
  append_video(&edid, 4);
  ASSERT_EQ(edid_destroy(&edid), 1);
  EXPECT_EQ(edid_prepare(&edid), 1);
  EXPECT_EQ(ll_size(&edid.video_list), 0);
  EXPECT_EQ(edid_destroy(&edid), 1);
}

TEST(EdidRecord, DestroyRefusesARecordThatWasNeverPrepared) {
  edid_t edid{};
  EXPECT_EQ(output_of([&] { EXPECT_EQ(edid_destroy(&edid), 0); }), not_initialised_line(record_lists[0]));
}

TEST(EdidRecord, DestroyRefusesASecondTime) {
  edid_t edid{};
  ASSERT_EQ(edid_prepare(&edid), 1);
  ASSERT_EQ(edid_destroy(&edid), 1);
  EXPECT_EQ(output_of([&] { EXPECT_EQ(edid_destroy(&edid), 0); }), not_initialised_line(record_lists[0]));
}

TEST(EdidRecord, DestroyNamesTheListThatIsNotInitialisedAndDeletesNothing) {
  for (std::size_t missing = 0; missing < record_lists.size(); ++missing) {
    SCOPED_TRACE(record_lists[missing].type_name);
    edid_t edid{};
    ASSERT_EQ(edid_prepare(&edid), 1);
    add_one_entry_to_each_list(edid);
    ASSERT_TRUE(ll_delete_list(&(edid.*record_lists[missing].list)));

    EXPECT_EQ(output_of([&] { EXPECT_EQ(edid_destroy(&edid), 0); }), not_initialised_line(record_lists[missing]));
    for (std::size_t i = 0; i < record_lists.size(); ++i) {
      EXPECT_EQ((edid.*record_lists[i].list).size, i == missing ? 0u : 1u) << i;
    }
    ASSERT_TRUE(ll_init(&(edid.*record_lists[missing].list), record_lists[missing].type_name));
    EXPECT_EQ(edid_destroy(&edid), 1);
  }
}

TEST(EdidRecord, DestroyNamesOnlyTheFirstOfSeveralListsThatAreNotInitialised) {
  edid_t edid{};
  ASSERT_EQ(edid_prepare(&edid), 1);
  ASSERT_TRUE(ll_delete_list(&edid.dtd_list));
  ASSERT_TRUE(ll_delete_list(&edid.audio_list));
  EXPECT_EQ(output_of([&] { EXPECT_EQ(edid_destroy(&edid), 0); }), not_initialised_line(record_lists[1]));
}

TEST(EdidRecord, DestroyStopsAtAListThatCannotBeDeleted) {
  for (std::size_t corrupt = 0; corrupt < record_lists.size(); ++corrupt) {
    SCOPED_TRACE(record_lists[corrupt].type_name);
    edid_t edid{};
    ASSERT_EQ(edid_prepare(&edid), 1);
    add_one_entry_to_each_list(edid);
    ll_list_t &list = edid.*record_lists[corrupt].list;
    ASSERT_TRUE(ll_delete_entry_at(&list, 0));
    list.size = 1;

    EXPECT_EQ(output_of([&] { EXPECT_EQ(edid_destroy(&edid), 0); }),
              test_support::error_line("linked_list", "ll_verify_integrity",
                                       "Corrupt List: The list's head is NULL, but the size isn't zero. Size:1") +
                  test_support::bug_line("linked_list", "ll_delete_list",
                                         "Failed verifying integrity of the list. list:PTR") +
                  codec_error("edid_destroy",
                              std::string("Failed deleting list: ") + record_lists[corrupt].deletion_name + "."));
    for (std::size_t i = 0; i < corrupt; ++i)
      EXPECT_FALSE(ll_is_initialized(&(edid.*record_lists[i].list))) << i;
    for (std::size_t i = corrupt + 1; i < record_lists.size(); ++i) {
      EXPECT_EQ(ll_size(&(edid.*record_lists[i].list)), 1) << i;
    }

    list.size = 0;
    for (std::size_t i = corrupt; i < record_lists.size(); ++i)
      EXPECT_TRUE(ll_delete_list(&(edid.*record_lists[i].list)));
  }
}

}  // namespace codec_test
