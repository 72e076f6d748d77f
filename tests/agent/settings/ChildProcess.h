// Running a helper executable with a prepared environment.
//
// The agent libraries read their settings once, at load, so a test that
// needs particular environment or configuration-file settings runs a small
// helper executable in a fresh process.

#ifndef TVR_TESTS_AGENT_CHILDPROCESS_H
#define TVR_TESTS_AGENT_CHILDPROCESS_H

#include <string>
#include <vector>

namespace tvr::testing {

struct ChildResult {
  /// Exit code, or 128 + signal number if the child was killed.
  int exitStatus = -1;
  std::string out; ///< Everything the child wrote to stdout.
  std::string err; ///< Everything the child wrote to stderr.
};

/// Runs \p program with \p arguments and waits for it. The child's
/// environment is \p environment ("NAME=value" entries) plus the parent's
/// sanitizer options (ASAN_OPTIONS and the like), nothing else.
ChildResult runChild(const std::string& program, const std::vector<std::string>& arguments,
                     const std::vector<std::string>& environment);

} // namespace tvr::testing

#endif // TVR_TESTS_AGENT_CHILDPROCESS_H
