#include "io/atomic_file.h"

#include <fcntl.h>
#include <stdlib.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <cstdio>
#include <cstring>
#include <filesystem>
#include <memory>

#include "io/bad_input.h"
#include "io/file_descriptor.h"
#include "io/input.h"
#include "io/temporary_file.h"

namespace edid_cli {
namespace {

mode_t creation_mask() {
  const mode_t mask = umask(0);
  umask(mask);
  return mask;
}

/// The permissions of a new file, as the user's mask has them. It can only be read by changing it, which another thread
/// would notice: so it is read once.
mode_t default_mode() {
  static const mode_t mode = 0666 & ~creation_mask();
  return mode;
}

void write_directly(const std::string &file, std::string_view content) {
  file_descriptor_t descriptor(open(file.c_str(), O_WRONLY | O_CLOEXEC));
  if (!descriptor.is_open()) {
    refuse_to_write(file);
  }
  write_all(descriptor.get(), content, file);
  if (!descriptor.close()) {
    refuse_to_write(file);
  }
}

/// A link is followed: what it points at is replaced, not the link. One that points at nothing is refused: it may be a
/// mistake, and nobody asked for a file at its other end.
std::string resolve(const std::string &file) {
  const std::unique_ptr<char, decltype(&free)> path(realpath(file.c_str(), nullptr), free);
  if (path != nullptr) {
    return path.get();
  }
  std::error_code ignored;
  if (std::filesystem::is_symlink(std::filesystem::symlink_status(file, ignored))) {
    throw bad_input_t(file + ": cannot write: is a link to " + std::filesystem::read_symlink(file, ignored).string() +
                      ", which is not there");
  }
  return file;
}

/// The new directory entry outlives a power failure. Some file systems can't do this; the file itself is safe by then.
void flush_directory_of(const std::string &file) {
  const file_descriptor_t descriptor(open(directory_of(file).c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC));
  if (descriptor.is_open()) {
    static_cast<void>(fsync(descriptor.get()));
  }
}

}  // namespace

void write_file_atomically(const std::string &file, std::string_view content, durability_t durability) {
  struct stat existing {};
  const bool exists = stat(file.c_str(), &existing) == 0;
  if (exists && !S_ISREG(existing.st_mode)) {
    write_directly(file, content);
    return;
  }
  const std::string target = resolve(file);
  temporary_file_t temporary(target);
  temporary.write(content, exists ? existing.st_mode & 0777 : default_mode(), durability == durability_t::at_once);
  temporary.take_the_place_of_the_target();
  if (durability == durability_t::at_once) {
    flush_directory_of(target);
  }
}

void write_output(const std::string &file, std::string_view content) {
  if (file == standard_stream) {
    write_all(STDOUT_FILENO, content, "standard output");
  } else {
    write_file_atomically(file, content, durability_t::at_once);
  }
}

}  // namespace edid_cli
