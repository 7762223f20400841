#include "commands/diff_command.h"

#include <unistd.h>

#include <algorithm>
#include <cstdio>
#include <memory>
#include <string>
#include <vector>

#include "commands/exit_status.h"
#include "commands/shared_options.h"
#include "edid_input/edid_file.h"
#include "edid_text/alignment.h"
#include "edid_text/decoded_edid.h"
#include "edid_text/edid_fields.h"
#include "io/bad_input.h"
#include "io/input.h"
#include "io/standard_output.h"
#include "text/hexadecimal.h"
#include "text/text_table.h"

namespace edid_cli {
namespace {

struct diff_options_t {
  std::string left;
  std::string right;
  std::string drm_directory;
  bool only_changes = false;
};

constexpr int same_status = 0;
constexpr int different_status = 1;
constexpr const char *difference_mark = "*";

/// One side.
class side_t {
 public:
  side_t(const std::string &source, const std::string &drm_directory)
      : name_(input_name(source)), bytes_(read_edid(source, drm_directory)), edid_(bytes_) {
    if (!edid_.is_complete()) {
      throw bad_input_t(name_ + ": the library refused to decode this EDID");
    }
  }

  const std::string &name() const { return name_; }
  const std::vector<u8> &bytes() const { return bytes_; }
  edid_records_t records() const { return edid_.records(); }

 private:
  std::string name_;
  std::vector<u8> bytes_;
  decoded_edid_t edid_;
};

/// Appends a field's rows; returns whether any differs.
bool add_field(text_table_t &table, const edid_field_t &field, const side_t &left, const side_t &right,
               bool only_changes) {
  bool differs = false;
  for (const aligned_row_t &row : align(field.values(left.records()), field.values(right.records()))) {
    const bool is_same = row.left == row.right;
    differs = differs || !is_same;
    if (!is_same || !only_changes) {
      table.add({is_same ? "" : difference_mark, field.name, row.left.value_or("-"), row.right.value_or("-")});
    }
  }
  return differs;
}

/// What the fields don't show: vendors' blocks, padding, checksums.
std::string byte_differences(const std::vector<u8> &left, const std::vector<u8> &right) {
  const std::size_t common = std::min(left.size(), right.size());
  std::size_t different = std::max(left.size(), right.size()) - common;
  std::size_t first = common;
  for (std::size_t offset = common; offset-- > 0;) {
    if (left[offset] != right[offset]) {
      ++different;
      first = offset;
    }
  }
  return std::to_string(different) + (different == 1 ? " byte differs" : " bytes differ") + ", the first at offset " +
         std::to_string(first) + " (" + hex_number(first, 2) + ")\n";
}

int run(const diff_options_t &options) {
  if (options.left == standard_stream && options.right == standard_stream) {
    throw bad_input_t("A and B cannot both be read from standard input");
  }
  text_table_t table;
  bool fields_differ = false;
  std::string bytes_text;
  {
    // What the library says of an EDID is not part of the table.
    const standard_output_redirect_t redirect(STDERR_FILENO);
    const side_t left(options.left, options.drm_directory);
    const side_t right(options.right, options.drm_directory);
    table.add({"", "FIELD", left.name(), right.name()});
    for (const edid_field_t &field : edid_fields()) {
      fields_differ = add_field(table, field, left, right, options.only_changes) || fields_differ;
    }
    if (left.bytes() != right.bytes()) {
      bytes_text = byte_differences(left.bytes(), right.bytes());
    }
  }
  if (fields_differ || !options.only_changes) {
    std::fputs(table.text().c_str(), stdout);
  }
  if (!bytes_text.empty()) {
    std::printf("%s%s", fields_differ ? "" : "No field differs, but ", bytes_text.c_str());
  }
  return bytes_text.empty() ? same_status : different_status;
}

}  // namespace

command_t diff_command() {
  const auto target = std::make_shared<diff_options_t>();
  return {
      "diff",
      "Print two EDIDs side by side, field by field",
      {flag("--only-changes", target->only_changes, "Omit the fields that are the same"),
       drm_directory_option(target->drm_directory), edid_operand("A", target->left), edid_operand("B", target->right)},
      [target] { return run(*target); }};
}

}  // namespace edid_cli
