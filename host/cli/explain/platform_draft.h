// The platform's configuration as it would be after some changes.
#pragma once

#include <string>
#include <vector>

#include "platform/configuration_node.h"

namespace edid_cli {

/// A value as it is written in the file: 16, 0x077F09 as a decimal number, "16 FP" with its quotes.
struct draft_value_t {
  std::string text;
  unsigned line = 0;  ///< In the platform's file; 0: it isn't there.
};

/// A key, relative to the library's table, with its value or its list's entries.
struct draft_entry_t {
  std::string key;
  bool is_list = false;
  std::vector<draft_value_t> values;
  unsigned line = 0;
};

/// Reads what the configuration store holds on construction. Changes concern the draft only.
class platform_draft_t {
 public:
  platform_draft_t();

  /// nullptr when there is no such key.
  const draft_entry_t *find(const std::string &key) const;
  /// The number at a key; @p otherwise when there is none.
  i32 number(const std::string &key, i32 otherwise) const;
  const std::vector<draft_entry_t> &entries() const { return entries_; }

  void set(const std::string &key, const std::string &value);
  void erase(const std::string &key);
  /// At the end of a list, which is made where it is missing.
  void add_to_list(const std::string &key, const std::string &value);
  void take_out_of_list(const std::string &key, const std::string &value);
  void replace_in_list(const std::string &key, const std::string &old_value, const std::string &value);

  /// The whole as a TOML document.
  std::string toml() const;

 private:
  draft_entry_t &at(const std::string &key);
  void read_table(const std::string &path, const std::string &prefix);
  std::string keys_of(const std::string &table) const;

  std::vector<draft_entry_t> entries_;
};

/// A number as a draft has it in front of a value: 16 of "16 FP"; 0 when there is none.
u32 leading_number(const std::string &value);

/// A text as it is written in the file.
std::string quoted(const std::string &text);

}  // namespace edid_cli
