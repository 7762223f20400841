#include "support/process.h"

#include <fcntl.h>
#include <signal.h>
#include <sys/resource.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cstdlib>
#include <stdexcept>

#include "support/temporary_directory.h"

namespace host_test {
namespace {

void redirect(int descriptor, const std::string &file, int flags) {
  const int opened = open(file.c_str(), flags, 0600);
  if (opened < 0 || dup2(opened, descriptor) < 0) {
    _exit(126);
  }
  close(opened);
}

/// In the child: becomes the program.
[[noreturn]] void become(const process_t &process, const std::string &input, const std::string &output,
                         const std::string &error) {
  redirect(STDIN_FILENO, input, O_RDONLY);
  redirect(STDOUT_FILENO, output, process.output_file ? O_WRONLY : O_WRONLY | O_CREAT);
  redirect(STDERR_FILENO, error, process.error_file ? O_WRONLY | O_NOCTTY : O_WRONLY | O_CREAT);
  if (process.file_size_limit) {
    signal(SIGXFSZ, SIG_IGN);
    const rlimit limit{*process.file_size_limit, *process.file_size_limit};
    setrlimit(RLIMIT_FSIZE, &limit);
    // Coverage counters that are cut off would make no sense.
    setenv("GCOV_PREFIX", (std::filesystem::path(input).parent_path() / "cut_counters").c_str(), 1);
  }
  if (process.creation_mask) {
    umask(*process.creation_mask);
  }
  for (const std::string &variable : process.environment) {
    putenv(const_cast<char *>(variable.c_str()));
  }
  std::vector<char *> arguments{const_cast<char *>(process.program.c_str())};
  for (const std::string &argument : process.arguments) {
    arguments.push_back(const_cast<char *>(argument.c_str()));
  }
  arguments.push_back(nullptr);
  execv(process.program.c_str(), arguments.data());
  _exit(127);
}

}  // namespace

process_result_t process_t::run() const {
  const temporary_directory_t directory;
  const std::string input_file = directory.write("input", input);
  const std::string error_path = error_file.value_or(directory.path("error"));
  const std::string output_path = output_file.value_or(directory.path("output"));

  const pid_t child = fork();
  if (child < 0) {
    throw std::runtime_error("cannot fork");
  }
  if (child == 0) {
    become(*this, input_file, output_path, error_path);
  }
  int status = 0;
  waitpid(child, &status, 0);

  process_result_t result;
  result.status = WIFEXITED(status) ? WEXITSTATUS(status) : -1;
  result.output = output_file ? "" : content_of(output_path);
  result.error = error_file ? "" : content_of(error_path);
  return result;
}

}  // namespace host_test
