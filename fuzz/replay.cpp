// Runs a target over files and folders of inputs, with any compiler: replay PATH...
#include <algorithm>
#include <cstdio>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <vector>

#include "fuzz_target.h"

extern "C" int LLVMFuzzerInitialize(int *argc, char ***argv);

namespace {

std::vector<std::filesystem::path> inputs_of(const std::filesystem::path &path) {
  if (!std::filesystem::is_directory(path)) return {path};
  std::vector<std::filesystem::path> files;
  for (const auto &entry : std::filesystem::directory_iterator(path)) {
    if (entry.is_regular_file()) files.push_back(entry.path());
  }
  std::sort(files.begin(), files.end());
  return files;
}

bool run(const std::filesystem::path &path) {
  std::ifstream file(path, std::ios::binary);
  if (!file) {
    std::fprintf(stderr, "replay: can't read %s\n", path.c_str());
    return false;
  }
  const std::vector<char> content((std::istreambuf_iterator<char>(file)), std::istreambuf_iterator<char>());
  const std::vector<u8> input(content.begin(), content.end());
  LLVMFuzzerTestOneInput(input.data(), input.size());
  return true;
}

}  // namespace

int main(int argc, char **argv) {
  if (LLVMFuzzerInitialize(&argc, &argv) != 0) return 2;
  int runs = 0;
  for (int i = 1; i < argc; ++i) {
    for (const auto &input : inputs_of(argv[i])) {
      if (!run(input)) return 2;
      ++runs;
    }
  }
  std::fprintf(stderr, "replayed %d inputs\n", runs);
  return runs > 0 ? 0 : 2;
}
