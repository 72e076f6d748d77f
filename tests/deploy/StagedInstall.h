// A staged install of the build: `cmake --install <build> --prefix /usr
// --component provider` with DESTDIR set to a fresh temporary directory, as a
// package build does it. Made once per test program, on first use, and
// removed when the program ends.
#pragma once

#include "RunCommand.h"

#include <string>

namespace tvr::test {

class StagedInstall {
public:
  /// The install of this test program, made on the first call.
  static const StagedInstall& get();

  /// How `cmake --install` ended.
  const CommandResult& result() const { return result_; }
  /// The DESTDIR the build was installed into.
  const std::string& root() const { return root_; }
  /// An installed path: `absolutePath` (e.g. "/usr/bin/tvrpa") under the root.
  std::string operator()(const std::string& absolutePath) const { return root_ + absolutePath; }

  ~StagedInstall();
  StagedInstall(const StagedInstall&) = delete;
  StagedInstall& operator=(const StagedInstall&) = delete;

private:
  StagedInstall();
  std::string root_;
  CommandResult result_;
};

/// Removes a directory tree (not following symbolic links).
void removeTree(const std::string& path);

} // namespace tvr::test
