// tvr::settings::lookup and configFilePath, each run in a settings_probe
// process with its own environment and configuration file.

#include "ChildProcess.h"
#include "TestFiles.h"

#include <sys/stat.h>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace {

using ::testing::HasSubstr;
using ::testing::IsEmpty;
using tvr::testing::ChildResult;
using tvr::testing::runChild;
using tvr::testing::splitLines;
using tvr::testing::TemporaryDirectory;
using tvr::testing::writeFile;

/// A scratch configuration file and an environment that points at it.
class SettingsLookup : public ::testing::Test {
protected:
  ChildResult probe(std::vector<std::string> environment,
                    const std::vector<std::string>& commands) {
    environment.push_back("TVR_CONFIG_FILE=" + configFile);
    return runChild(SETTINGS_PROBE_PATH, commands, environment);
  }

  TemporaryDirectory directory;
  const std::string configFile = directory.file("platform.conf");
};

TEST_F(SettingsLookup, EnvironmentBeatsFile) {
  writeFile(configFile, "HX_FS_ROOT = /from/file\n");
  const ChildResult result = probe({"HX_FS_ROOT=/from/env"}, {"get", "HX_FS_ROOT"});
  EXPECT_EQ(result.out, "HX_FS_ROOT=/from/env\n");
  EXPECT_EQ(result.exitStatus, 0);
}

TEST_F(SettingsLookup, FileIsUsedWhenEnvironmentLacksTheKey) {
  writeFile(configFile, "HX_FS_ROOT = /from/file\n");
  EXPECT_EQ(probe({}, {"get", "HX_FS_ROOT"}).out, "HX_FS_ROOT=/from/file\n");
}

TEST_F(SettingsLookup, EmptyEnvironmentValueBeatsFile) {
  writeFile(configFile, "HX_HARDWARE_TREE = /tree.json\n");
  EXPECT_EQ(probe({"HX_HARDWARE_TREE="}, {"get", "HX_HARDWARE_TREE"}).out, "HX_HARDWARE_TREE=\n");
}

TEST_F(SettingsLookup, KeyInNeitherSourceIsUnset) {
  writeFile(configFile, "OTHER = 1\n");
  EXPECT_EQ(probe({}, {"get", "KVLOG_LOG"}).out, "KVLOG_LOG unset\n");
}

TEST_F(SettingsLookup, QuotedFileValueIsUnwrapped) {
  writeFile(configFile, "KVLOG_LOG = \" /var/log/tvr.log\"\n");
  EXPECT_EQ(probe({}, {"get", "KVLOG_LOG"}).out, "KVLOG_LOG= /var/log/tvr.log\n");
}

TEST_F(SettingsLookup, LastOfRepeatedFileKeysWins) {
  writeFile(configFile, "KVLOG_LOG = first\nKVLOG_LOG = second\n");
  EXPECT_EQ(probe({}, {"get", "KVLOG_LOG"}).out, "KVLOG_LOG=second\n");
}

TEST_F(SettingsLookup, MissingFileIsNotAProblem) {
  const ChildResult result = probe({"KVLOG_LOG=stderr"}, {"get", "KVLOG_LOG", "get", "HX_FS_ROOT"});
  EXPECT_EQ(result.out, "KVLOG_LOG=stderr\nHX_FS_ROOT unset\n");
  EXPECT_THAT(result.err, IsEmpty());
  EXPECT_EQ(result.exitStatus, 0);
}

TEST_F(SettingsLookup, MalformedLineIsReportedOnceWithItsNumberAndOtherLinesAreUsed) {
  writeFile(configFile, "KVLOG_LOG = stderr\nnot an entry\nKVLOG_TRACE = off\n");
  const ChildResult result =
      probe({}, {"get", "KVLOG_LOG", "get", "KVLOG_TRACE", "get", "KVLOG_LOG"});
  EXPECT_EQ(result.out, "KVLOG_LOG=stderr\nKVLOG_TRACE=off\nKVLOG_LOG=stderr\n");
  ASSERT_EQ(splitLines(result.err).size(), 1u) << result.err;
  EXPECT_THAT(result.err, HasSubstr(configFile));
  EXPECT_THAT(result.err, HasSubstr("line 2"));
}

TEST_F(SettingsLookup, UnreadableFileIsReportedOnceAndIgnored) {
  // A directory opens but cannot be read, whatever the user's privileges.
  const std::string notAFile = directory.file("conf.d");
  ASSERT_EQ(::mkdir(notAFile.c_str(), 0755), 0);
  const ChildResult result = runChild(SETTINGS_PROBE_PATH, {"get", "A", "get", "A"},
                                      {"TVR_CONFIG_FILE=" + notAFile, "A=1"});
  EXPECT_EQ(result.out, "A=1\nA=1\n");
  ASSERT_EQ(splitLines(result.err).size(), 1u) << result.err;
  EXPECT_THAT(result.err, HasSubstr(notAFile));
  EXPECT_THAT(result.err, HasSubstr("Is a directory"));
  EXPECT_EQ(result.exitStatus, 0);
}

TEST_F(SettingsLookup, EnvironmentChangedAfterFirstLookupIsNotSeen) {
  const ChildResult result =
      probe({"KVLOG_LOG=stderr"},
            {"get", "KVLOG_LOG", "setenv", "KVLOG_LOG", "off", "setenv", "KVLOG_TRACE", "stderr",
             "get", "KVLOG_LOG", "get", "KVLOG_TRACE"});
  EXPECT_EQ(result.out, "KVLOG_LOG=stderr\nKVLOG_LOG=stderr\nKVLOG_TRACE unset\n");
}

TEST_F(SettingsLookup, EnvironmentIsReadBeforeMainRuns) {
  // The probe wipes its environment before the first lookup, as an object
  // manager overwriting its command line would.
  const ChildResult result = probe({"HX_FS_ROOT=/root"}, {"clearenv", "get", "HX_FS_ROOT"});
  EXPECT_EQ(result.out, "HX_FS_ROOT=/root\n");
}

TEST_F(SettingsLookup, FileChangedAfterLoadIsNotSeen) {
  writeFile(configFile, "HX_FS_ROOT = /root\n");
  const ChildResult result = probe({}, {"truncate", configFile, "get", "HX_FS_ROOT"});
  EXPECT_EQ(result.out, "HX_FS_ROOT=/root\n");
  EXPECT_EQ(result.exitStatus, 0);
}

TEST(ConfigFilePath, DefaultsToTheInstalledFile) {
  const ChildResult result = runChild(SETTINGS_PROBE_PATH, {"path"}, {});
  EXPECT_EQ(result.out, "path=/etc/opt/tvr/platform.conf\n");
}

TEST(ConfigFilePath, ComesFromTheEnvironmentWhenSet) {
  const ChildResult result =
      runChild(SETTINGS_PROBE_PATH, {"path"}, {"TVR_CONFIG_FILE=/somewhere/else.conf"});
  EXPECT_EQ(result.out, "path=/somewhere/else.conf\n");
}

TEST(ConfigFilePath, EmptyValueMeansNoFile) {
  const ChildResult result =
      runChild(SETTINGS_PROBE_PATH, {"path", "get", "HX_FS_ROOT"}, {"TVR_CONFIG_FILE="});
  EXPECT_EQ(result.out, "path=\nHX_FS_ROOT unset\n");
  EXPECT_THAT(result.err, IsEmpty());
}

} // namespace
