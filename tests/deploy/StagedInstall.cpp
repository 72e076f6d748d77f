#include "StagedInstall.h"

#include <ftw.h>
#include <stdlib.h>
#include <unistd.h>

#include <cstdio>
#include <stdexcept>

namespace tvr::test {

namespace {

int removeEntry(const char* path, const struct stat*, int, struct FTW*) { return std::remove(path); }

} // namespace

void removeTree(const std::string& path) { nftw(path.c_str(), removeEntry, 16, FTW_DEPTH | FTW_PHYS); }

StagedInstall::StagedInstall() {
  const char* tmp = std::getenv("TMPDIR");
  std::string pattern = std::string(tmp && *tmp ? tmp : "/tmp") + "/tvr-staged-install-XXXXXX";
  if (!mkdtemp(pattern.data())) throw std::runtime_error("cannot make a directory like " + pattern);
  root_ = pattern;
  result_ = runCommand({TVR_CMAKE_COMMAND, "--install", TVR_BUILD_DIR, "--prefix", "/usr", "--component", "provider"},
                       withVariable(currentEnvironment(), "DESTDIR", root_));
}

StagedInstall::~StagedInstall() { removeTree(root_); }

const StagedInstall& StagedInstall::get() {
  static const StagedInstall install;
  return install;
}

} // namespace tvr::test
