// The Debian package `cpack -G DEB` builds from this build directory: its
// name and dependencies, the settings file as a configuration file, and the
// same files as the staged install of the "provider" component.
#include "StagedInstall.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <dirent.h>
#include <ftw.h>
#include <stdlib.h>
#include <sys/stat.h>

#include <set>
#include <sstream>

namespace tvr::test {
namespace {

using ::testing::HasSubstr;

std::string packageIn(const std::string& directory) {
  std::string found;
  if (DIR* dir = opendir(directory.c_str())) {
    while (const dirent* e = readdir(dir)) {
      const std::string name = e->d_name;
      if (name.size() > 4 && name.compare(name.size() - 4, 4, ".deb") == 0) found = directory + "/" + name;
    }
    closedir(dir);
  }
  return found;
}

std::string field(const std::string& package, const std::string& name) {
  const CommandResult r = runCommand({"dpkg-deb", "--field", package, name});
  EXPECT_EQ(r.exitStatus, 0) << r.err;
  return r.out.substr(0, r.out.find_last_not_of('\n') + 1);
}

/// The files (not directories) of the package, as absolute paths.
std::set<std::string> filesOf(const std::string& package) {
  const CommandResult r = runCommand({"dpkg-deb", "--contents", package});
  EXPECT_EQ(r.exitStatus, 0) << r.err;
  std::set<std::string> files;
  std::istringstream lines(r.out);
  std::string line;
  while (std::getline(lines, line)) {
    // "-rw-r--r-- root/root  1957 2026-01-01 00:00 ./etc/opt/tvr/platform.conf", links with " -> target"
    if (line.empty() || line[0] == 'd') continue;
    std::string path = line.substr(line.find(" ./") + 2);
    path = path.substr(0, path.find(" -> "));
    files.insert(path);
  }
  return files;
}

std::set<std::string> stagedFiles;

int collectStaged(const char* path, const struct stat*, int type, struct FTW*) {
  if (type != FTW_D && type != FTW_DP) stagedFiles.insert(std::string(path).substr(StagedInstall::get().root().size()));
  return 0;
}

class DebianPackageTest : public ::testing::Test {
protected:
  static void SetUpTestSuite() {
    char dir[] = "/tmp/tvr-package-XXXXXX";
    ASSERT_NE(mkdtemp(dir), nullptr);
    directory_ = dir;
    result_ = runCommand({TVR_CPACK_COMMAND, "-G", "DEB", "-B", directory_, "--config",
                          TVR_BUILD_DIR "/CPackConfig.cmake"});
    package_ = packageIn(directory_);
  }
  static void TearDownTestSuite() { removeTree(directory_); }
  void SetUp() override {
    ASSERT_EQ(result_.exitStatus, 0) << result_.out << result_.err;
    ASSERT_FALSE(package_.empty()) << result_.out;
  }

  static std::string directory_;
  static std::string package_;
  static CommandResult result_;
};

std::string DebianPackageTest::directory_;
std::string DebianPackageTest::package_;
CommandResult DebianPackageTest::result_;

TEST_F(DebianPackageTest, IsNamedForTheProjectAndItsVersion) {
  EXPECT_EQ(field(package_, "Package"), "tvr-physical-asset");
  EXPECT_EQ(field(package_, "Version"), TVR_PROJECT_VERSION);
  const CommandResult arch = runCommand({"dpkg", "--print-architecture"});
  EXPECT_EQ(field(package_, "Architecture") + "\n", arch.out);
}

TEST_F(DebianPackageTest, DependsOnTheSystemLibrariesTheBinariesLink) {
  const std::string depends = field(package_, "Depends");
  EXPECT_THAT(depends, HasSubstr("libc6 (>="));
  EXPECT_THAT(depends, HasSubstr("libstdc++6 (>="));
  EXPECT_THAT(depends, HasSubstr("libpci3 (>="));
  // The agent libraries are in the package itself.
  EXPECT_THAT(depends, ::testing::Not(HasSubstr("tvr")));
}

TEST_F(DebianPackageTest, KeepsTheSettingsFileAsAConfigurationFile) {
  const CommandResult r = runCommand({"dpkg-deb", "--info", package_, "conffiles"});
  ASSERT_EQ(r.exitStatus, 0) << r.err;
  EXPECT_EQ(r.out, "/etc/opt/tvr/platform.conf\n");
}

TEST_F(DebianPackageTest, HoldsExactlyTheFilesOfTheStagedInstall) {
  ASSERT_EQ(StagedInstall::get().result().exitStatus, 0) << StagedInstall::get().result().err;
  stagedFiles.clear();
  nftw(StagedInstall::get().root().c_str(), collectStaged, 16, FTW_PHYS);
  EXPECT_EQ(filesOf(package_), stagedFiles);
  EXPECT_EQ(filesOf(package_).count("/opt/tvr/platform/lib/libtvrkvphysicalassetprofileprovider.so"), 1u);
}

} // namespace
} // namespace tvr::test
