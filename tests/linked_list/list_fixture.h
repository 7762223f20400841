// Lists of numbers for the tests of the list.
#pragma once

#include <gtest/gtest.h>

#include <cstdint>
#include <initializer_list>
#include <string>
#include <vector>

#include "support/list_contents.h"
#include "support/output_capture.h"

namespace linked_list_tests {

inline std::string error(const std::string &function, const std::string &message) {
  return test_support::error_line("linked_list", function, message);
}

inline std::string bug(const std::string &function, const std::string &message) {
  return test_support::bug_line("linked_list", function, message);
}

/// The number that marks a head as initialised at its address, as it is printed.
inline std::string printed_magic(const ll_list_t *list) {
  const auto bits = static_cast<u32>(reinterpret_cast<std::uintptr_t>(list) & 0xFFFFFFFF);
  return std::to_string(static_cast<i32>(bits ^ 0xA0A06060));
}

/// A head that is initialised for numbers, and emptied after the test however the test left it.
class list_of_int_t {
 public:
  list_of_int_t() { EXPECT_TRUE(ll_init(&head_, "int")); }
  list_of_int_t(std::initializer_list<i32> numbers) : list_of_int_t() {
    for (const i32 number : numbers)
      test_support::append_to(head_, "int", number);
  }
  list_of_int_t(const list_of_int_t &) = delete;
  list_of_int_t &operator=(const list_of_int_t &) = delete;
  ~list_of_int_t() {
    for (ll_entry_t *entry = head_.head; entry != nullptr;) {
      ll_entry_t *const next = entry->next;
      ll_delete_entry(entry);
      entry = next;
    }
  }

  ll_list_t *get() { return &head_; }
  ll_list_t *operator->() { return &head_; }
  std::vector<i32> numbers() const { return test_support::elements_of<i32>(head_); }

 private:
  ll_list_t head_{};
};

/// An entry in no list, deleted after the test unless a list took it.
class free_entry_t {
 public:
  explicit free_entry_t(i32 number, const char *type = "int") {
    void *payload = nullptr;
    EXPECT_TRUE(ll_create_entry(sizeof(i32), &entry_, &payload, type));
    *static_cast<i32 *>(payload) = number;
  }
  free_entry_t(const free_entry_t &) = delete;
  free_entry_t &operator=(const free_entry_t &) = delete;
  ~free_entry_t() {
    if (entry_ != nullptr) ll_delete_entry(entry_);
  }

  ll_entry_t *get() const { return entry_; }
  void release() { entry_ = nullptr; }

 private:
  ll_entry_t *entry_ = nullptr;
};

/// A head as it was, to see whether an operation left it alone.
struct head_copy_t {
  explicit head_copy_t(const ll_list_t &list) : magic(list.magic), type(list.type), size(list.size), head(list.head) {}
  bool operator==(const head_copy_t &) const = default;

  u32 magic;
  u32 type;
  u32 size;
  const ll_entry_t *head;
};

}  // namespace linked_list_tests
