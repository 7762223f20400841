#include "io/temporary_file.h"

#include <fcntl.h>
#include <signal.h>
#include <sys/random.h>
#include <sys/stat.h>
#include <unistd.h>

#include <array>
#include <atomic>
#include <cerrno>
#include <cstdint>
#include <cstdio>
#include <cstring>
#include <filesystem>

#include "io/bad_input.h"

namespace edid_cli {
namespace {

/// The paths of the temporary files that are there now, for the signal handler. More than there can be threads that
/// write; a file without a place is left behind by a signal.
std::array<std::atomic<const char *>, 512> g_paths;
static_assert(std::atomic<const char *>::is_always_lock_free);

std::size_t enter(const char *path) {
  std::size_t slot = 0;
  for (; slot < g_paths.size(); ++slot) {
    const char *none = nullptr;
    if (g_paths[slot].compare_exchange_strong(none, path)) {
      break;
    }
  }
  return slot;
}

/// Whoever takes a path out may use it: where the handler was first, the program is about to end.
void leave(std::size_t slot) {
  while (slot < g_paths.size() && g_paths[slot].exchange(nullptr) == nullptr) {
    pause();
  }
}

extern "C" void remove_temporary_files(int signal) {
  for (auto &path : g_paths) {
    if (const char *const file = path.exchange(nullptr)) {
      unlink(file);
    }
  }
  // The handler is gone by now: the signal ends the program as if there had been none.
  raise(signal);
}

/// A name that nobody has, so that the handler may remove it at any time, also before the file is there.
std::string unused_name(const std::string &target) {
  std::uint64_t number = 0;
  if (getrandom(&number, sizeof number, 0) != static_cast<ssize_t>(sizeof number)) {
    refuse_to_write(target);
  }
  return ".edid-composer." + std::to_string(number);
}

}  // namespace

void remove_temporary_files_on_signals() {
  for (const int signal : {SIGINT, SIGTERM, SIGHUP}) {
    struct sigaction current {};
    // One that is ignored, as under nohup, stays ignored.
    if (sigaction(signal, nullptr, &current) == 0 && current.sa_handler == SIG_DFL) {
      struct sigaction removal {};
      removal.sa_handler = remove_temporary_files;
      removal.sa_flags = static_cast<int>(SA_RESETHAND);
      sigaction(signal, &removal, nullptr);
    }
  }
  signal(SIGXFSZ, SIG_IGN);
}

void refuse_to_write(const std::string &name) {
  throw bad_input_t(name + ": cannot write: " + std::strerror(errno));
}

void write_all(int descriptor, std::string_view content, const std::string &name) {
  while (!content.empty()) {
    const ssize_t size = write(descriptor, content.data(), content.size());
    if (size < 0 && errno != EINTR) {
      refuse_to_write(name);
    }
    content.remove_prefix(size < 0 ? 0 : static_cast<std::size_t>(size));
  }
}

std::string directory_of(const std::string &file) {
  const std::string directory = std::filesystem::path(file).parent_path();
  return directory.empty() ? "." : directory;
}

temporary_file_t::temporary_file_t(const std::string &target) : target_(target) {
  constexpr int most_attempts = 100;
  for (int attempt = 0; !create(); ++attempt) {
    if (errno != EEXIST || attempt == most_attempts) {
      refuse_to_write(target_);
    }
  }
}

bool temporary_file_t::create() {
  path_ = directory_of(target_) + "/" + unused_name(target_);
  slot_ = enter(path_.c_str());
  descriptor_.reset(open(path_.c_str(), O_RDWR | O_CREAT | O_EXCL | O_CLOEXEC, 0600));
  if (descriptor_.is_open()) {
    return true;
  }
  const int problem = errno;
  leave(slot_);
  errno = problem;
  return false;
}

temporary_file_t::~temporary_file_t() {
  if (!is_in_place_) {
    unlink(path_.c_str());
  }
  leave(slot_);
}

void temporary_file_t::write(std::string_view content, mode_t mode, bool is_flushed) {
  write_all(descriptor_.get(), content, target_);
  if ((is_flushed && fsync(descriptor_.get()) != 0) || fchmod(descriptor_.get(), mode) != 0 || !descriptor_.close()) {
    refuse_to_write(target_);
  }
}

void temporary_file_t::take_the_place_of_the_target() {
  if (std::rename(path_.c_str(), target_.c_str()) != 0) {
    refuse_to_write(target_);
  }
  is_in_place_ = true;
}

}  // namespace edid_cli
