// Runs a program as a user would and collects what it printed.
#pragma once

#include <string>
#include <vector>

namespace tvr::test {

struct ProgramResult {
  int exitStatus = -1;    ///< the exit status, or -1 if it did not exit normally
  long maxResidentKb = 0; ///< the most memory the program held at once
  std::string out;
  std::string err;
};

/// Runs `program` with `args`, without a shell, and waits for it.
ProgramResult runProgram(const std::string& program, const std::vector<std::string>& args);

} // namespace tvr::test
