// What the measuring programs have in common.
#pragma once

#include <cstdio>

namespace bench {

/// A program with the usage "PROGRAM FOLDER RESULTS": runs @p measure with the name of the folder and the open results
/// file, on one core, while what the library prints goes to nowhere. Returns the exit status.
int run_program(int count, char **arguments, void (*measure)(const char *folder, std::FILE *results));

}  // namespace bench
