// Writing a file: whole or not at all.
#include <fcntl.h>
#include <gmock/gmock.h>
#include <sys/stat.h>
#include <unistd.h>

#include <filesystem>

#include "cli/cli_fixture.h"

namespace host_test {
namespace {

using testing::ElementsAre;

class AtomicOutput : public cli_fixture_t {
 protected:
  static mode_t mode_of(const std::string &path) {
    struct stat status {};
    EXPECT_EQ(stat(path.c_str(), &status), 0);
    return status.st_mode & 0777;
  }
};

TEST_F(AtomicOutput, NothingButTheFileIsLeftBehind) {
  composed({});
  EXPECT_THAT(directory_.names(), ElementsAre("composed.bin"));
}

TEST_F(AtomicOutput, AnExistingFileIsReplacedWhole) {
  directory_.write("composed.bin", std::string(1000, 'x'));
  EXPECT_EQ(composed({}).size(), 256U);
  EXPECT_THAT(directory_.names(), ElementsAre("composed.bin"));
}

TEST_F(AtomicOutput, AFileThatIsOpenElsewhereKeepsItsContentThere) {
  const std::string path = directory_.write("composed.bin", "old");
  std::filesystem::create_hard_link(path, directory_.path("other_name"));
  composed({});
  EXPECT_EQ(content_of(directory_.path("other_name")), "old");
}

TEST_F(AtomicOutput, ANewFileHasThePermissionsOfTheUsersMask) {
  process_t process{cli_program(), {"compose", "-o", directory_.path("new.bin")}};
  process.creation_mask = 027;
  ASSERT_EQ(process.run().status, 0);
  EXPECT_EQ(mode_of(directory_.path("new.bin")), 0640U);
}

TEST_F(AtomicOutput, AReplacedFileKeepsItsPermissions) {
  const std::string path = directory_.write("composed.bin", "old");
  ASSERT_EQ(chmod(path.c_str(), 0604), 0);
  composed({});
  EXPECT_EQ(mode_of(path), 0604U);
}

TEST_F(AtomicOutput, ALinkToNothingIsRefused) {
  std::filesystem::create_symlink("nowhere.bin", directory_.path("new.bin"));
  expect_bad_input(run_cli({"compose", "-o", directory_.path("new.bin")}),
                   directory_.path("new.bin") + ": cannot write: is a link to nowhere.bin, which is not there");
  EXPECT_TRUE(std::filesystem::is_symlink(directory_.path("new.bin")));
}

TEST_F(AtomicOutput, ALinkStaysALink) {
  const std::string target = directory_.write("target.bin", "old");
  std::filesystem::create_symlink("target.bin", directory_.path("composed.bin"));
  EXPECT_EQ(composed({}).size(), 256U);
  EXPECT_TRUE(std::filesystem::is_symlink(directory_.path("composed.bin")));
  EXPECT_EQ(std::filesystem::file_size(target), 256U);
  EXPECT_THAT(directory_.names(), ElementsAre("composed.bin", "target.bin"));
}

TEST_F(AtomicOutput, AFileNameWithoutAFolderIsWrittenInTheCurrentOne) {
  const process_result_t result = process_t{
      "/bin/sh",
      {"-c", "cd \"$0\" && exec \"$1\" compose -o new.bin", directory_.path(""),
       cli_program()}}.run();
  EXPECT_EQ(result.status, 0) << result.error;
  EXPECT_THAT(directory_.names(), ElementsAre("new.bin"));
}

TEST_F(AtomicOutput, AFailureHalfWayLeavesTheOldContentAndNoTemporaryFile) {
  const std::string path = directory_.write("kept.bin", "old");
  process_t process{cli_program(), {"compose", "-o", path}};
  process.file_size_limit = 200;
  expect_bad_input(process.run(), path + ": cannot write: File too large");
  EXPECT_EQ(content_of(path), "old");
  EXPECT_THAT(directory_.names(), ElementsAre("kept.bin"));
}

TEST_F(AtomicOutput, AMissingFolderIsAnError) {
  const std::string path = directory_.path("missing/new.bin");
  expect_bad_input(run_cli({"compose", "-o", path}), path + ": cannot write: No such file or directory");
}

TEST_F(AtomicOutput, AFolderIsNoFile) {
  const std::string path = directory_.path("");
  expect_bad_input(run_cli({"compose", "-o", path}), path + ": cannot write: Is a directory");
  EXPECT_TRUE(directory_.names().empty());
}

TEST_F(AtomicOutput, APipeIsWrittenToAndStaysAPipe) {
  const std::string path = directory_.path("pipe");
  ASSERT_EQ(mkfifo(path.c_str(), 0600), 0);
  const int reader = open(path.c_str(), O_RDWR | O_NONBLOCK);
  ASSERT_GE(reader, 0);
  const process_result_t result = run_cli({"compose", "-o", path});
  EXPECT_EQ(result.status, 0) << result.error;
  char bytes[1000];
  EXPECT_EQ(read(reader, bytes, sizeof bytes), 256);
  close(reader);
  EXPECT_TRUE(std::filesystem::is_fifo(path));
  EXPECT_THAT(directory_.names(), ElementsAre("pipe"));
}

}  // namespace
}  // namespace host_test
