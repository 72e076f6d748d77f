// The staged install of the "provider" component (the content of the Debian
// package): where each file goes, the provider's SONAME, unversioned name and
// run path, and that the loader finds the agent libraries through that run
// path.
#include "DynamicSection.h"
#include "StagedInstall.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <dirent.h>
#include <sys/stat.h>
#include <unistd.h>

#include <climits>
#include <cstdlib>
#include <fstream>
#include <map>
#include <set>
#include <sstream>

namespace tvr::test {
namespace {

using ::testing::IsSupersetOf;

const std::string kPlatformDir = "/opt/tvr/platform/lib";
const std::string kProvider = kPlatformDir + "/libtvrkvphysicalassetprofileprovider.so";
const std::string kShareDir = "/usr/share/tvr-physical-asset";
const std::set<std::string> kAgentLibraries = {"libtvrkvlog.so.1", "libtvrhxinstrumentation.so.1",
                                               "libtvrhxutilities.so.1"};

bool isRegularFile(const std::string& path) {
  struct stat st {};
  return lstat(path.c_str(), &st) == 0 && S_ISREG(st.st_mode);
}

bool isSymbolicLink(const std::string& path) {
  struct stat st {};
  return lstat(path.c_str(), &st) == 0 && S_ISLNK(st.st_mode);
}

bool exists(const std::string& path) {
  struct stat st {};
  return lstat(path.c_str(), &st) == 0;
}

bool isExecutable(const std::string& path) {
  struct stat st {};
  return stat(path.c_str(), &st) == 0 && S_ISREG(st.st_mode) && (st.st_mode & S_IXUSR) && (st.st_mode & S_IXOTH);
}

std::string linkTarget(const std::string& path) {
  char buffer[4096];
  const ssize_t n = readlink(path.c_str(), buffer, sizeof buffer);
  return n < 0 ? "" : std::string(buffer, static_cast<std::size_t>(n));
}

/// The file a chain of symbolic links ends at.
std::string resolvedPath(const std::string& path) {
  char buffer[PATH_MAX];
  return realpath(path.c_str(), buffer) ? std::string(buffer) : "";
}

std::string contentOf(const std::string& path) {
  std::ifstream in(path, std::ios::binary);
  std::stringstream text;
  text << in.rdbuf();
  return text.str();
}

std::vector<std::string> entriesOf(const std::string& directory) {
  std::vector<std::string> names;
  if (DIR* dir = opendir(directory.c_str())) {
    while (const dirent* e = readdir(dir))
      if (std::string(e->d_name) != "." && std::string(e->d_name) != "..") names.push_back(e->d_name);
    closedir(dir);
  }
  return names;
}

bool isElfFile(const std::string& path) {
  return isRegularFile(path) && contentOf(path).compare(0, 4, "\x7f" "ELF") == 0;
}

/// What `ldd` says of each library a file needs: the path it resolves to,
/// or "not found".
std::map<std::string, std::string> lddResolution(const std::string& path, const std::vector<std::string>& env) {
  const CommandResult r = runCommand({"ldd", path}, env);
  EXPECT_TRUE(r.err.empty()) << r.err;
  // "\tlibx.so.1 => /lib/libx.so.1 (0x...)" or "\tlibx.so.1 => not found"
  std::map<std::string, std::string> out;
  std::istringstream lines(r.out);
  std::string text;
  while (std::getline(lines, text)) {
    std::istringstream words(text);
    std::string library;
    std::string arrow;
    std::string where;
    if (!(words >> library >> arrow >> where) || arrow != "=>") continue;
    out[library] = where == "not" ? "not found" : where;
  }
  return out;
}

class InstallLayoutTest : public ::testing::Test {
protected:
  void SetUp() override {
    ASSERT_EQ(install().result().exitStatus, 0) << install().result().out << install().result().err;
  }
  const StagedInstall& install() const { return StagedInstall::get(); }
};

TEST_F(InstallLayoutTest, ProviderLibraryIsInstalledUnderItsSonameAndItsUnversionedName) {
  const std::string real = install()(kProvider + ".1.0.0");
  EXPECT_TRUE(isRegularFile(real));
  ASSERT_TRUE(isSymbolicLink(install()(kProvider + ".1")));
  EXPECT_EQ(linkTarget(install()(kProvider + ".1")), "libtvrkvphysicalassetprofileprovider.so.1.0.0");
  // SFCB and OpenPegasus load exactly lib<location>.so.
  ASSERT_TRUE(isSymbolicLink(install()(kProvider)));
  EXPECT_EQ(linkTarget(install()(kProvider)), "libtvrkvphysicalassetprofileprovider.so.1");
}

TEST_F(InstallLayoutTest, ProviderSonameIsTheMajorVersionName) {
  EXPECT_EQ(readDynamicSection(install()(kProvider + ".1.0.0")).soname, "libtvrkvphysicalassetprofileprovider.so.1");
}

TEST_F(InstallLayoutTest, EveryInstalledBinaryHasExactlyThePlatformRunPath) {
  std::vector<std::string> binaries = {install()("/usr/bin/tvrpa")};
  for (const std::string& name : entriesOf(install()(kPlatformDir)))
    if (isElfFile(install()(kPlatformDir + "/" + name))) binaries.push_back(install()(kPlatformDir + "/" + name));
  ASSERT_GE(binaries.size(), 5u);
  for (const std::string& binary : binaries) {
    const DynamicSection dynamic = readDynamicSection(binary);
    EXPECT_EQ(dynamic.runpath, kPlatformDir) << binary;
    EXPECT_FALSE(dynamic.rpath.has_value()) << binary << ": RPATH " << dynamic.rpath.value_or("");
  }
}

TEST_F(InstallLayoutTest, AgentLibrariesTheProviderNeedsAreInThePlatformDirectory) {
  const DynamicSection dynamic = readDynamicSection(install()(kProvider + ".1"));
  std::set<std::string> ownLibraries;
  for (const std::string& needed : dynamic.needed)
    if (needed.rfind("libtvr", 0) == 0) ownLibraries.insert(needed);
  EXPECT_EQ(ownLibraries, kAgentLibraries);
  for (const std::string& library : kAgentLibraries) {
    const std::string installed = install()(kPlatformDir + "/" + library);
    EXPECT_TRUE(exists(installed)) << installed;
    EXPECT_EQ(readDynamicSection(installed).soname, library);
  }
}

TEST_F(InstallLayoutTest, LddWithoutLibraryPathResolvesEverythingButTheAgentLibrariesFromTheSystem) {
  // The run path names /opt/tvr/platform/lib of the target machine, which
  // this machine does not have: exactly the agent libraries stay unresolved.
  const auto resolution =
      lddResolution(install()(kProvider + ".1"), withoutVariable(currentEnvironment(), "LD_LIBRARY_PATH"));
  std::set<std::string> unresolved;
  for (const auto& [library, where] : resolution) {
    if (where == "not found") {
      unresolved.insert(library);
    } else {
      EXPECT_EQ(where.rfind(install().root(), 0), std::string::npos) << library << " => " << where;
    }
  }
  EXPECT_EQ(unresolved, kAgentLibraries);
  EXPECT_THAT(resolution, ::testing::Contains(::testing::Key("libstdc++.so.6")));
}

TEST_F(InstallLayoutTest, LddResolvesTheAgentLibrariesInTheRunPathDirectoryOfTheStagedTree) {
  const std::string platformDir = install()(kPlatformDir);
  const auto resolution = lddResolution(install()(kProvider + ".1"),
                                        withVariable(currentEnvironment(), "LD_LIBRARY_PATH", platformDir));
  for (const std::string& library : kAgentLibraries) {
    ASSERT_EQ(resolution.count(library), 1u) << library;
    EXPECT_EQ(resolution.at(library), platformDir + "/" + library);
  }
  for (const auto& [library, where] : resolution) EXPECT_NE(where, "not found") << library;
}

TEST_F(InstallLayoutTest, InstalledToolAnswersThroughTheInstalledRegistrationAndProvider) {
  // The run path directory of the staged tree stands in for the target's.
  const std::string platformDir = install()(kPlatformDir);
  const CommandResult r =
      runCommand({install()("/usr/bin/tvrpa"), "ein", "TVRHX_Chassis", "--tree",
                  TVR_SOURCE_DIR "/examples/blade-system.json", "--provider-library", install()(kProvider)},
                 withVariable(currentEnvironment(), "LD_LIBRARY_PATH", platformDir));
  EXPECT_EQ(r.exitStatus, 0) << r.err;
  EXPECT_EQ(r.out, "root/cimv2:TVRHX_Chassis.Tag=\"/System/Blade Chassis\",CreationClassName=\"TVRHX_Chassis\"\n"
                   "root/cimv2:TVRHX_Chassis.Tag=\"/System/PCIe Expansion Unit\",CreationClassName=\"TVRHX_Chassis\"\n");
}

TEST_F(InstallLayoutTest, InstalledRegistrationsNameInstalledLibrariesByTheirUnversionedNames) {
  const std::string directory = install()(kShareDir + "/sfcb");
  std::set<std::string> locations;
  for (const std::string& file : entriesOf(directory)) {
    std::istringstream lines(contentOf(directory + "/" + file));
    std::string line;
    while (std::getline(lines, line)) {
      std::istringstream words(line);
      std::string key;
      std::string value;
      if (words >> key >> value && key == "location:") locations.insert(value);
    }
  }
  EXPECT_EQ(locations.count("tvrkvphysicalassetprofileprovider"), 1u);
  for (const std::string& name : locations) {
    const std::string library = install()(kPlatformDir + "/lib" + name + ".so");
    EXPECT_TRUE(isSymbolicLink(library)) << library;
    EXPECT_TRUE(isElfFile(resolvedPath(library))) << library;
  }
}

TEST_F(InstallLayoutTest, ClassAndRegistrationFilesAreTheFilesTheTestsUse) {
  EXPECT_EQ(contentOf(install()(kShareDir + "/TVRHX_PhysicalAsset.mof")),
            contentOf(TVR_SOURCE_DIR "/schema/TVRHX_PhysicalAsset.mof"));
  EXPECT_EQ(contentOf(install()(kShareDir + "/sfcb/tvrhx-physical-asset.reg")),
            contentOf(TVR_SOURCE_DIR "/registration/sfcb/tvrhx-physical-asset.reg"));
  EXPECT_EQ(contentOf(install()(kShareDir + "/pegasus/TVRHX_PhysicalAssetRegistration.mof")),
            contentOf(TVR_PEGASUS_REGISTRATION_FILE));
}

TEST_F(InstallLayoutTest, CompanionClassAndRegistrationFilesAreInstalledBesideThem) {
  EXPECT_EQ(contentOf(install()(kShareDir + "/TVRHX_Companion.mof")),
            contentOf(TVR_SOURCE_DIR "/schema/TVRHX_Companion.mof"));
  EXPECT_EQ(contentOf(install()(kShareDir + "/sfcb/tvrhx-companion.reg")),
            contentOf(TVR_SOURCE_DIR "/registration/sfcb/tvrhx-companion.reg"));
  EXPECT_THAT(contentOf(install()(kShareDir + "/pegasus/TVRHX_CompanionRegistration.mof")),
              ::testing::HasSubstr("Location = \"tvrhxcompanionproviders\";"));
}

TEST_F(InstallLayoutTest, SettingsFileAndSystemdExampleAreInstalled) {
  EXPECT_EQ(contentOf(install()("/etc/opt/tvr/platform.conf")),
            contentOf(TVR_SOURCE_DIR "/agent/settings/platform.conf"));
  EXPECT_EQ(contentOf(install()(kShareDir + "/systemd/tvr-platform.conf")),
            contentOf(TVR_SOURCE_DIR "/deploy/systemd/tvr-platform.conf"));
}

TEST_F(InstallLayoutTest, ToolManPageAndRegistrationScriptsAreInstalled) {
  EXPECT_TRUE(isExecutable(install()("/usr/bin/tvrpa")));
  EXPECT_TRUE(isRegularFile(install()("/usr/share/man/man1/tvrpa.1")));
  EXPECT_TRUE(isExecutable(install()("/usr/sbin/tvr-register-sfcb")));
  EXPECT_TRUE(isExecutable(install()("/usr/sbin/tvr-register-pegasus")));
}

TEST_F(InstallLayoutTest, NothingForBuildingAgainstTheAgentLibrariesIsInstalled) {
  EXPECT_FALSE(exists(install()("/usr/include")));
  for (const std::string& library : kAgentLibraries) {
    const std::string linkName = library.substr(0, library.size() - 2); // without ".1"
    EXPECT_FALSE(exists(install()(kPlatformDir + "/" + linkName))) << linkName;
  }
}

TEST_F(InstallLayoutTest, EverythingIsInstalledUnderTheKnownDirectories) {
  EXPECT_THAT(entriesOf(install().root()), ::testing::UnorderedElementsAre("etc", "opt", "usr"));
  EXPECT_THAT(entriesOf(install()("/usr")), ::testing::UnorderedElementsAre("bin", "sbin", "share"));
  EXPECT_THAT(entriesOf(install()(kShareDir)), IsSupersetOf({"TVRHX_PhysicalAsset.mof", "sfcb", "pegasus", "systemd"}));
}

} // namespace
} // namespace tvr::test
