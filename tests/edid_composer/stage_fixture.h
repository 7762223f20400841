// What the tests of single stages share: the inputs, and lists as a composition keeps them.
#pragma once

#include <gtest/gtest.h>

#include "edid_composer/journal.h"
#include "linked_list/entry_arena.h"
#include "linked_list/typed_list.h"
#include "support/output_capture.h"
#include "support/records.h"

namespace composer_fixtures {

inline constexpr edid_composer::site_t reporter{"edid_composer", "_reporter"};

/// A list whose entries lie in an arena and go with that.
template <typename record_t>
class arena_list_t {
 public:
  explicit arena_list_t(edid_composer::entry_arena_t *arena) : arena_(arena) {
    EXPECT_TRUE(edid_composer::init_list<record_t>(&list_));
  }
  void append(const record_t &record) {
    EXPECT_TRUE(edid_composer::appender_t<record_t>(&list_, arena_, reporter).append(record));
  }

  ll_list_t *get() { return &list_; }
  ll_list_t &operator*() { return list_; }

 private:
  edid_composer::entry_arena_t *arena_;
  ll_list_t list_{};
};

/// Uses an arena up but for @p room bytes, so that the allocation that needs more is the next that can fail.
inline void leave_room(edid_composer::entry_arena_t *arena, u32 room) {
  EXPECT_NE(arena->allocate(edid_composer::entry_arena_t::block_bytes - room), nullptr);
}

class Stage : public testing::Test {
 protected:
  edid_composer::inputs_t inputs(edid_composer::entry_arena_t *arena) {
    return {*sink_.get(), *values_.get(), cfg_, arena};
  }
  edid_composer::inputs_t inputs() { return inputs(&arena_); }

  edid_composer::entry_arena_t arena_;
  edid_composer::journal_t journal_{false, &arena_};
  test_support::scoped_edid_t sink_;
  test_support::scoped_values_t values_;
  compose_cfg_t cfg_ = test_support::plain_settings();
};

}  // namespace composer_fixtures
