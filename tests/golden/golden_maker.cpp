// Writes the goldens anew, into the directory where they are kept or into the one that is named, and removes those of
// cases that are no more. A new case needs a file NAME.hex with its first two lines.
#include <cstdio>
#include <exception>
#include <filesystem>
#include <fstream>
#include <map>
#include <stdexcept>
#include <string>

#include "composition.h"
#include "golden_cases.h"

namespace {

namespace fs = std::filesystem;

bool is_golden(const fs::path &file) {
  const std::string name = file.filename().string();
  for (const char *ending : {".hex", ".brief.txt", ".explain.txt", ".report.txt", ".trace.txt"}) {
    if (name.ends_with(ending)) return true;
  }
  return false;
}

void write(const fs::path &file, const std::string &text) {
  std::ofstream stream(file, std::ios::binary);
  stream << text;
  stream.close();
  if (!stream) throw std::runtime_error("cannot write " + file.string());
}

void make_goldens(const fs::path &directory) {
  std::map<std::string, std::string> texts;
  for (const auto &golden_case : golden::golden_cases())
    texts.merge(golden::golden_texts(golden_case));

  fs::create_directories(directory);
  for (const auto &entry : fs::directory_iterator(directory)) {
    if (is_golden(entry.path()) && !texts.contains(entry.path().filename().string())) fs::remove(entry.path());
  }
  for (const auto &[name, text] : texts)
    write(directory / name, text);
  std::printf("%zu goldens of %zu cases are in %s\n", texts.size(), golden::golden_cases().size(), directory.c_str());
}

}  // namespace

int main(int argument_count, char **arguments) {
  try {
    make_goldens(argument_count > 1 ? fs::path(arguments[1]) : golden::golden_directory());
  } catch (const std::exception &problem) {
    std::fprintf(stderr, "%s\n", problem.what());
    return 1;
  }
  return 0;
}
