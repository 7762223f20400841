#include "io/input.h"

#include <fcntl.h>
#include <unistd.h>

#include <cerrno>
#include <cstring>

#include "io/bad_input.h"
#include "io/file_descriptor.h"

namespace edid_cli {
namespace {

constexpr std::size_t max_size = std::size_t{1024} * 1024;

std::string read_all(int descriptor, const std::string &name) {
  std::string content;
  char chunk[4096];
  for (;;) {
    const ssize_t size = read(descriptor, chunk, sizeof chunk);
    if (size < 0 && errno == EINTR) {
      continue;
    }
    if (size < 0) {
      throw bad_input_t(name + ": " + std::strerror(errno));
    }
    if (size == 0) {
      return content;
    }
    content.append(chunk, static_cast<std::size_t>(size));
    if (content.size() > max_size) {
      throw bad_input_t(name + ": larger than 1 MiB");
    }
  }
}

}  // namespace

std::string input_name(const std::string &file) {
  return file == standard_stream ? "standard input" : file;
}

std::string read_input(const std::string &file) {
  if (file == standard_stream) {
    return read_all(STDIN_FILENO, input_name(file));
  }
  const file_descriptor_t descriptor(open(file.c_str(), O_RDONLY | O_CLOEXEC));
  if (!descriptor.is_open()) {
    throw bad_input_t(file + ": " + std::strerror(errno));
  }
  return read_all(descriptor.get(), file);
}

}  // namespace edid_cli
