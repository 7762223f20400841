// Temporary files go, however the program ends. In processes of their own, which end.
#include "io/temporary_file.h"

#include <gtest/gtest.h>
#include <signal.h>
#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

#include <filesystem>
#include <functional>

#include "io/bad_input.h"

namespace edid_cli {
namespace {

class TemporaryFile : public testing::Test {
 protected:
  TemporaryFile() {
    std::filesystem::create_directories(folder_);
    // Whatever ran these tests, a shell in the background or nohup, may ignore them.
    for (const int number : {SIGINT, SIGTERM, SIGHUP})
      signal(number, SIG_DFL);
  }
  ~TemporaryFile() override { std::filesystem::remove_all(folder_); }

  /// How a child that does this ended.
  static int status_after(const std::function<void()> &action) {
    const pid_t child = fork();
    if (child == 0) {
      remove_temporary_files_on_signals();
      action();
      _exit(0);
    }
    int status = -1;
    EXPECT_EQ(waitpid(child, &status, 0), child);
    return status;
  }

  bool is_empty() const { return std::filesystem::is_empty(folder_); }

  const std::string folder_ = testing::TempDir() + "temporary_file_test." + std::to_string(getpid());
  const std::string target_ = folder_ + "/new.bin";
};

TEST_F(TemporaryFile, TakesThePlaceOfItsTarget) {
  {
    temporary_file_t file(target_);
    file.write("text", 0640, true);
    file.take_the_place_of_the_target();
  }
  EXPECT_EQ(std::filesystem::file_size(target_), 4U);
  std::filesystem::remove(target_);
  EXPECT_TRUE(is_empty());
}

TEST_F(TemporaryFile, GoesWithSignalsThatEndTheProgram) {
  for (const int signal : {SIGINT, SIGTERM, SIGHUP}) {
    const int status = status_after([&] {
      temporary_file_t first(target_);
      temporary_file_t second(target_);
      second.write("text", 0640, false);
      raise(signal);
    });
    EXPECT_TRUE(WIFSIGNALED(status));
    EXPECT_EQ(WTERMSIG(status), signal);
    EXPECT_TRUE(is_empty()) << signal;
  }
}

TEST_F(TemporaryFile, ASignalThatIsIgnoredStaysIgnored) {
  signal(SIGHUP, SIG_IGN);
  const int status = status_after([&] {
    temporary_file_t file(target_);
    raise(SIGHUP);
    file.write("text", 0640, false);
    file.take_the_place_of_the_target();
  });
  signal(SIGHUP, SIG_DFL);
  EXPECT_EQ(status, 0);
  EXPECT_TRUE(std::filesystem::exists(target_));
}

TEST_F(TemporaryFile, ThatMayNotGrowSoFarIsRefusedAndGoes) {
  const int status = status_after([&] {
    const rlimit limit{2, 2};
    setrlimit(RLIMIT_FSIZE, &limit);
    try {
      temporary_file_t file(target_);
      file.write("text", 0640, false);
    } catch (const bad_input_t &problem) {
      _exit(std::string(problem.what()).ends_with("/new.bin: cannot write: File too large") ? 7 : 8);
    }
  });
  EXPECT_TRUE(WIFEXITED(status));
  EXPECT_EQ(WEXITSTATUS(status), 7);
  EXPECT_TRUE(is_empty());
}

}  // namespace
}  // namespace edid_cli
