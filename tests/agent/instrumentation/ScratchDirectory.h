//===- ScratchDirectory.h - Temporary files for hardware-tree tests -------===//

#ifndef HX_TESTS_SCRATCHDIRECTORY_H
#define HX_TESTS_SCRATCHDIRECTORY_H

#include <gtest/gtest.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <string>

namespace hxtest {

/// A fresh directory under $TMPDIR (or /tmp), removed with everything in it
/// when the test ends.
class ScratchDirectory {
public:
  ScratchDirectory() {
    const char *base = std::getenv("TMPDIR");
    std::string pattern =
        std::string(base && *base ? base : "/tmp") + "/hx-tree-XXXXXX";
    if (::mkdtemp(pattern.data()) == nullptr)
      ADD_FAILURE() << "cannot create a scratch directory from " << pattern;
    Root = pattern;
  }
  ScratchDirectory(const ScratchDirectory &) = delete;
  ScratchDirectory &operator=(const ScratchDirectory &) = delete;
  ~ScratchDirectory() {
    std::error_code ignored;
    std::filesystem::remove_all(Root, ignored);
  }

  /// Writes \p text to the file \p name in the directory (replacing it in
  /// place if it exists) and returns the file's path.
  std::string write(const std::string &name, const std::string &text) const {
    const std::string path = pathOf(name);
    std::ofstream out(path, std::ios::binary | std::ios::trunc);
    out << text;
    out.close();
    EXPECT_TRUE(out.good()) << "cannot write " << path;
    return path;
  }

  std::string pathOf(const std::string &name) const {
    return (Root / name).string();
  }

private:
  std::filesystem::path Root;
};

} // namespace hxtest

#endif // HX_TESTS_SCRATCHDIRECTORY_H
