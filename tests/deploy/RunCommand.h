// Running a program from a test: its argument vector, the environment it
// gets, and what it wrote and how it ended.
#pragma once

#include <string>
#include <vector>

namespace tvr::test {

struct CommandResult {
  int exitStatus = -1; ///< the exit status, or 128 + the signal that ended it
  std::string out;
  std::string err;
};

/// The environment of this process, one "NAME=value" per entry.
std::vector<std::string> currentEnvironment();
/// `environment` without the variable `name`.
std::vector<std::string> withoutVariable(std::vector<std::string> environment, const std::string& name);
/// `environment` with `name` set to `value` (replacing an earlier value).
std::vector<std::string> withVariable(std::vector<std::string> environment, const std::string& name,
                                      const std::string& value);

/// Runs `argv` (argv[0] a path, or a name looked up in this process's PATH)
/// with exactly `environment`, and waits for it. Throws std::runtime_error
/// when the program cannot be started.
CommandResult runCommand(const std::vector<std::string>& argv, const std::vector<std::string>& environment);
/// The same in this process's environment.
CommandResult runCommand(const std::vector<std::string>& argv);

} // namespace tvr::test
