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

namespace edid_cli {
namespace {

[[noreturn]] void refuse(const std::string &name) {
  throw bad_input_t(name + ": cannot write: " + std::strerror(errno));
}

void write_all(int descriptor, std::string_view content, const std::string &name) {
  while (!content.empty()) {
    const ssize_t size = write(descriptor, content.data(), content.size());
    if (size < 0 && errno != EINTR) {
      refuse(name);
    }
    content.remove_prefix(size < 0 ? 0 : static_cast<std::size_t>(size));
  }
}

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

std::string directory_of(const std::string &file) {
  const std::string directory = std::filesystem::path(file).parent_path();
  return directory.empty() ? "." : directory;
}

/// A file beside the target that is removed again unless it has taken the target's place.
class temporary_file_t {
 public:
  explicit temporary_file_t(const std::string &target)
      : target_(target),
        path_(directory_of(target) + "/.edid-composer.XXXXXX"),
        descriptor_(mkostemp(path_.data(), O_CLOEXEC)) {
    if (!descriptor_.is_open()) {
      refuse(target_);
    }
  }
  ~temporary_file_t() {
    if (!is_in_place_) {
      unlink(path_.c_str());
    }
  }
  temporary_file_t(const temporary_file_t &) = delete;
  temporary_file_t &operator=(const temporary_file_t &) = delete;

  void write(std::string_view content, mode_t mode, durability_t durability) {
    write_all(descriptor_.get(), content, target_);
    const bool flushed = durability == durability_t::later || fsync(descriptor_.get()) == 0;
    if (!flushed || fchmod(descriptor_.get(), mode) != 0 || !descriptor_.close()) {
      refuse(target_);
    }
  }

  void take_the_place_of_the_target() {
    if (std::rename(path_.c_str(), target_.c_str()) != 0) {
      refuse(target_);
    }
    is_in_place_ = true;
  }

 private:
  std::string target_;
  std::string path_;
  file_descriptor_t descriptor_;
  bool is_in_place_ = false;
};

void write_directly(const std::string &file, std::string_view content) {
  file_descriptor_t descriptor(open(file.c_str(), O_WRONLY | O_CLOEXEC));
  if (!descriptor.is_open()) {
    refuse(file);
  }
  write_all(descriptor.get(), content, file);
  if (!descriptor.close()) {
    refuse(file);
  }
}

/// A link is followed: what it points at is replaced, not the link.
std::string resolve(const std::string &file) {
  const std::unique_ptr<char, decltype(&free)> path(realpath(file.c_str(), nullptr), free);
  return path == nullptr ? file : std::string(path.get());
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
  temporary.write(content, exists ? existing.st_mode & 0777 : default_mode(), durability);
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
