#include "program.h"

#include <exception>
#include <memory>

#include "timing.h"

namespace bench {

int run_program(int count, char **arguments, void (*measure)(const char *folder, std::FILE *results)) {
  if (count != 3) {
    std::fprintf(stderr, "usage: %s FOLDER RESULTS\n", arguments[0]);
    return 2;
  }
  const std::unique_ptr<std::FILE, int (*)(std::FILE *)> results(std::fopen(arguments[2], "w"), std::fclose);
  if (results == nullptr) {
    std::perror(arguments[2]);
    return 2;
  }
  if (std::freopen("/dev/null", "w", stdout) == nullptr) return 2;
  try {
    stay_on_this_core();
    measure(arguments[1], results.get());
  } catch (const std::exception &error) {
    std::fprintf(stderr, "%s: %s\n", arguments[0], error.what());
    return 2;
  }
  return 0;
}

}  // namespace bench
