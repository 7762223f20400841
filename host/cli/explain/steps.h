// The changes of a platform and of the settings that answers are made of.
#pragma once

#include "explain/answer.h"

namespace edid_cli {

/// Collects steps; each call is one change.
class steps_t {
 public:
  explicit steps_t(const explained_t &explained) : explained_(explained) {}

  /// Adds an entry, as it is written in the file, to a list that takes up to @p most of them; 0: any number.
  void add_entry(const std::string &list, const std::string &entry, const std::string &remark = "",
                 std::size_t most = 0);
  void take_entry_out(const std::string &list, const list_entry_t &entry);
  /// Sets a key to what is written in the file.
  void set(const std::string &key, const std::string &value, const std::string &remark = "");
  /// What every mode and format needs: that sources read the extension.
  void announce_extension();
  void add_audio_entry(u32 type);
  void give_option(const std::string &option, const std::string &value);
  void drop_option(const std::string &option);

  std::vector<step_t> take() && { return std::move(steps_); }

 private:
  void add(const std::string &text, const std::string &key, unsigned line) { steps_.push_back({text, key, line}); }

  const explained_t &explained_;
  std::vector<step_t> steps_;
};

}  // namespace edid_cli
