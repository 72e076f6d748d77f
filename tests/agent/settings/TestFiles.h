// Scratch directories and whole-file helpers for tests.

#ifndef TVR_TESTS_AGENT_TESTFILES_H
#define TVR_TESTS_AGENT_TESTFILES_H

#include <string>
#include <vector>

namespace tvr::testing {

/// A fresh directory under $TMPDIR (or /tmp), removed with its contents on
/// destruction.
class TemporaryDirectory {
public:
  TemporaryDirectory();
  ~TemporaryDirectory();
  TemporaryDirectory(const TemporaryDirectory&) = delete;
  TemporaryDirectory& operator=(const TemporaryDirectory&) = delete;

  const std::string& path() const { return path_; }
  /// path() + "/" + \p name.
  std::string file(const std::string& name) const;

private:
  std::string path_;
};

/// The whole content of \p path; empty if it cannot be read.
std::string readFile(const std::string& path);

/// Replaces the content of \p path with \p text.
void writeFile(const std::string& path, const std::string& text);

/// The lines of \p text without their line feeds; a last line without line
/// feed is included.
std::vector<std::string> splitLines(const std::string& text);

} // namespace tvr::testing

#endif // TVR_TESTS_AGENT_TESTFILES_H
