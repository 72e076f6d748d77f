//===- HardwareSourceTest.cpp - Choosing the hardware source --------------===//
//
// The source at load comes from the settings, which are read when the
// library is loaded; those tests run this executable again as a child with
// the settings in its environment.
//
//===----------------------------------------------------------------------===//

#include "HX/HardwareSource.h"

#include "ScratchDirectory.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <fstream>
#include <iterator>
#include <string>
#include <vector>

#include <spawn.h>
#include <sys/wait.h>
#include <unistd.h>

extern char **environ;

namespace {

constexpr const char *ReportVariable = "HX_TEST_REPORT_SOURCE_TO";

/// Runs only in the child: writes what the library chose at load.
TEST(HardwareSourceChild, ReportsTheSourceChosenAtLoad) {
  const char *report = std::getenv(ReportVariable);
  if (report == nullptr)
    GTEST_SKIP() << "runs only as the child of HardwareSourceAtLoad tests";
  std::ofstream(report) << HX::describeHardwareSource();
}

/// Runs this test executable's child test with \p settings added to a clean
/// environment and returns what it reported.
std::string sourceChosenWith(const hxtest::ScratchDirectory &scratch,
                             const std::vector<std::string> &settings) {
  const std::string report = scratch.pathOf("report.txt");
  std::vector<std::string> environment = {
      std::string(ReportVariable) + "=" + report, "TVR_CONFIG_FILE=",
      "KVLOG_LOG=off"};
  environment.insert(environment.end(), settings.begin(), settings.end());
  std::vector<char *> envp;
  for (std::string &entry : environment)
    envp.push_back(entry.data());
  envp.push_back(nullptr);

  std::string self = "/proc/self/exe";
  std::string filter =
      "--gtest_filter=HardwareSourceChild.ReportsTheSourceChosenAtLoad";
  char *argv[] = {self.data(), filter.data(), nullptr};
  pid_t child = 0;
  if (::posix_spawn(&child, self.c_str(), nullptr, nullptr, argv,
                    envp.data()) != 0) {
    ADD_FAILURE() << "cannot run the child";
    return {};
  }
  int status = 0;
  ::waitpid(child, &status, 0);
  EXPECT_TRUE(WIFEXITED(status) && WEXITSTATUS(status) == 0);
  std::ifstream in(report);
  return std::string(std::istreambuf_iterator<char>(in), {});
}

TEST(HardwareSourceAtLoad, TreeFileNamedBySettingsIsUsed) {
  hxtest::ScratchDirectory scratch;

  EXPECT_EQ(sourceChosenWith(scratch, {"HX_HARDWARE_TREE=/lab/m7.json",
                                       "HX_FS_ROOT=/srv/m7"}),
            "tree file /lab/m7.json");
}

TEST(HardwareSourceAtLoad, LiveMachineBelowTheRootSettingWithoutATree) {
  hxtest::ScratchDirectory scratch;

  EXPECT_EQ(sourceChosenWith(scratch, {"HX_FS_ROOT=/srv/m7"}),
            "live machine at /srv/m7");
}

TEST(HardwareSourceAtLoad, EmptyTreeSettingMeansTheLiveMachine) {
  hxtest::ScratchDirectory scratch;

  EXPECT_EQ(sourceChosenWith(scratch, {"HX_HARDWARE_TREE="}),
            "live machine at /");
}

TEST(HardwareSourceAtLoad, LiveMachineAtSlashByDefault) {
  hxtest::ScratchDirectory scratch;

  EXPECT_EQ(sourceChosenWith(scratch, {}), "live machine at /");
}

TEST(HardwareTreeSystemName, IsTheTreesSystemName) {
  hxtest::ScratchDirectory scratch;
  HX::useHardwareTree(scratch.write(
      "t.json", R"({"systemName": "lab-7.example.com", "nodes": []})"));

  EXPECT_EQ(HX::hardwareTreeSystemName(), "lab-7.example.com");
}

TEST(HardwareTreeSystemName, IsAbsentWhenTheTreeGivesNone) {
  hxtest::ScratchDirectory scratch;
  HX::useHardwareTree(scratch.write("t.json", R"({"nodes": []})"));

  EXPECT_EQ(HX::hardwareTreeSystemName(), std::nullopt);
}

TEST(HardwareTreeSystemName, IsAbsentAndDoesNotThrowWhenTheTreeIsRefused) {
  hxtest::ScratchDirectory scratch;
  HX::useHardwareTree(scratch.write(
      "t.json", R"({"systemName": "lab-7.example.com", "nodes": 1})"));

  EXPECT_EQ(HX::hardwareTreeSystemName(), std::nullopt);
}

TEST(HardwareTreeSystemName, IsAbsentOnTheLiveMachine) {
  HX::useLiveMachine();

  EXPECT_EQ(HX::hardwareTreeSystemName(), std::nullopt);
}

} // namespace
