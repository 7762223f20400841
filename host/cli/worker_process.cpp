#include "worker_process.h"

#include <signal.h>
#include <string.h>
#include <sys/socket.h>
#include <sys/wait.h>
#include <unistd.h>

#include <array>
#include <cerrno>
#include <cstdint>
#include <cstdio>
#include <exception>

#include "bad_input.h"

namespace edid_cli {
namespace {

/// False at the end of the channel, or when the other side is gone.
bool read_whole(int channel, void *target, std::size_t size) {
  auto *bytes = static_cast<char *>(target);
  while (size > 0) {
    const ssize_t got = recv(channel, bytes, size, 0);
    if (got < 0 && errno == EINTR) {
      continue;
    }
    if (got <= 0) {
      return false;
    }
    bytes += got;
    size -= static_cast<std::size_t>(got);
  }
  return true;
}

bool write_whole(int channel, const void *source, std::size_t size) {
  const auto *bytes = static_cast<const char *>(source);
  while (size > 0) {
    const ssize_t sent = send(channel, bytes, size, MSG_NOSIGNAL);
    if (sent < 0 && errno == EINTR) {
      continue;
    }
    if (sent < 0) {
      return false;
    }
    bytes += sent;
    size -= static_cast<std::size_t>(sent);
  }
  return true;
}

/// In the worker, until the other side is gone: a number comes, the size and the bytes of its result go.
void serve(int channel, const work_t &work) {
  std::uint64_t number = 0;
  while (read_whole(channel, &number, sizeof number)) {
    const std::string result = work(number);
    const std::uint64_t size = result.size();
    if (!write_whole(channel, &size, sizeof size) || !write_whole(channel, result.data(), result.size())) {
      return;
    }
  }
}

}  // namespace

worker_process_t::worker_process_t(const work_t &work, const std::function<void()> &in_child) : channel_(-1) {
  std::array<int, 2> ends{};
  if (socketpair(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0, ends.data()) != 0) {
    throw bad_input_t(std::string("cannot start a worker process: ") + strerror(errno));
  }
  file_descriptor_t ours(ends[0]);
  file_descriptor_t theirs(ends[1]);
  // What is buffered now would be written by both.
  std::fflush(nullptr);
  process_ = fork();
  if (process_ < 0) {
    throw bad_input_t(std::string("cannot start a worker process: ") + strerror(errno));
  }
  if (process_ > 0) {
    channel_.reset(ours.release());
    return;
  }
  try {
    ours.close();
    in_child();
    serve(theirs.get(), work);
    _exit(0);
  } catch (const std::exception &) {
    _exit(1);
  }
}

worker_process_t::~worker_process_t() {
  channel_.close();
  if (process_ > 0) {
    waitpid(process_, nullptr, 0);
  }
}

bool worker_process_t::give(std::size_t number) {
  const std::uint64_t sent = number;
  return write_whole(channel_.get(), &sent, sizeof sent);
}

std::optional<std::string> worker_process_t::take_result() {
  std::uint64_t size = 0;
  if (!read_whole(channel_.get(), &size, sizeof size)) {
    return std::nullopt;
  }
  std::string result(size, '\0');
  if (!read_whole(channel_.get(), result.data(), result.size())) {
    return std::nullopt;
  }
  return result;
}

std::string worker_process_t::explain_end() {
  channel_.close();
  int status = 0;
  if (waitpid(process_, &status, 0) != process_) {
    return "the worker process is gone";
  }
  process_ = -1;
  if (WIFSIGNALED(status)) {
    return "the worker process was ended by signal " + std::to_string(WTERMSIG(status)) + " (" +
           strsignal(WTERMSIG(status)) + ")";
  }
  return "the worker process ended with status " + std::to_string(WEXITSTATUS(status));
}

void worker_process_t::abandon() {
  channel_.close();
  process_ = -1;
}

}  // namespace edid_cli
