// A file that becomes another one when it is complete.
#pragma once

#include <sys/types.h>

#include <string>
#include <string_view>

#include "io/file_descriptor.h"

namespace edid_cli {

/// Has INT, TERM and HUP, where they end the program, remove the temporary files first; and has a write that would make
/// a file larger than the system allows fail instead of ending the program. To be called once, when the program begins.
void remove_temporary_files_on_signals();

/// Stands beside the file that it is to replace, and is removed unless it has done so.
class temporary_file_t {
 public:
  /// Throws bad_input_t, as the others do.
  explicit temporary_file_t(const std::string &target);
  ~temporary_file_t();
  temporary_file_t(const temporary_file_t &) = delete;
  temporary_file_t &operator=(const temporary_file_t &) = delete;

  void write(std::string_view content, mode_t mode, bool is_flushed);
  void take_the_place_of_the_target();

 private:
  bool create();

  std::string target_;
  std::string path_;
  std::size_t slot_;
  file_descriptor_t descriptor_{-1};
  bool is_in_place_ = false;
};

/// Writes all of it, or throws bad_input_t that names @p name.
void write_all(int descriptor, std::string_view content, const std::string &name);

/// Throws bad_input_t with what errno says.
[[noreturn]] void refuse_to_write(const std::string &name);

std::string directory_of(const std::string &file);

}  // namespace edid_cli
