// The channel settings the library takes from the environment and the
// configuration file at load, each case run in a kvlog_probe process.

#include "ChildProcess.h"
#include "LoggerFixture.h"

#include <ctime>

#include <gmock/gmock.h>

namespace {

using ::testing::ElementsAre;
using ::testing::HasSubstr;
using ::testing::IsEmpty;
using kvlogtest::parseWrittenLine;
using kvlogtest::writtenMessages;
using tvr::testing::ChildResult;
using tvr::testing::runChild;
using tvr::testing::splitLines;
using tvr::testing::TemporaryDirectory;
using tvr::testing::writeFile;

class LoadTimeSettings : public ::testing::Test {
protected:
  /// Runs the probe with \p environment and this test's configuration file.
  ChildResult probe(std::vector<std::string> environment,
                    const std::vector<std::string>& commands) {
    environment.push_back("TVR_CONFIG_FILE=" + configFile);
    return runChild(KVLOG_PROBE_PATH, commands, environment);
  }

  TemporaryDirectory directory;
  const std::string configFile = directory.file("platform.conf");
  const std::string logFile = directory.file("tvr.log");
  const std::string traceFile = directory.file("trace.log");
};

TEST_F(LoadTimeSettings, DefaultsAreLogToSyslogFrom6000AndTraceOff) {
  const ChildResult result = probe({}, {"settings"});
  EXPECT_EQ(result.out, "log=syslog 6000\ntrace=off 0\n");
  EXPECT_THAT(result.err, IsEmpty());
}

TEST_F(LoadTimeSettings, EnvironmentSelectsDestinationsAndLevels) {
  const ChildResult result =
      probe({"KVLOG_LOG=" + logFile, "KVLOG_LOG_LEVEL=4000", "KVLOG_TRACE=" + traceFile,
             "KVLOG_TRACE_LEVEL=3000"},
            {"settings", "log", "3999", "Cat", "log too low", "log", "4000", "Cat", "logged",
             "trace", "2999", "Cat", "trace too low", "trace", "3000", "Cat", "traced"});
  EXPECT_EQ(result.out, "log=" + logFile + " 4000\ntrace=" + traceFile + " 3000\n");
  EXPECT_THAT(writtenMessages(logFile), ElementsAre("logged"));
  EXPECT_THAT(writtenMessages(traceFile), ElementsAre("traced"));
  EXPECT_THAT(result.err, IsEmpty());
}

TEST_F(LoadTimeSettings, ConfigurationFileSelectsDestinationsAndLevels) {
  writeFile(configFile, "KVLOG_LOG = stderr\nKVLOG_LOG_LEVEL = 5000\nKVLOG_TRACE = \"" +
                            traceFile + "\"\nKVLOG_TRACE_LEVEL = 100\n");
  EXPECT_EQ(probe({}, {"settings"}).out, "log=stderr 5000\ntrace=" + traceFile + " 100\n");
}

TEST_F(LoadTimeSettings, EnvironmentBeatsConfigurationFile) {
  writeFile(configFile, "KVLOG_LOG = stderr\nKVLOG_LOG_LEVEL = 5000\n");
  EXPECT_EQ(probe({"KVLOG_LOG=off"}, {"settings"}).out, "log=off 5000\ntrace=off 0\n");
}

TEST_F(LoadTimeSettings, EmptyValuesMeanDefaults) {
  writeFile(configFile, "KVLOG_LOG = stderr\nKVLOG_TRACE_LEVEL = 7\n");
  const ChildResult result = probe({"KVLOG_LOG=", "KVLOG_TRACE_LEVEL="}, {"settings"});
  EXPECT_EQ(result.out, "log=syslog 6000\ntrace=off 0\n");
  EXPECT_THAT(result.err, IsEmpty());
}

TEST_F(LoadTimeSettings, RelativePathFallsBackToDefaultAndIsReportedOnce) {
  const ChildResult result =
      probe({"KVLOG_LOG=logs/tvr.log", "KVLOG_LOG_LEVEL=4000"}, {"settings", "settings"});
  EXPECT_EQ(result.out, "log=syslog 4000\ntrace=off 0\nlog=syslog 4000\ntrace=off 0\n");
  ASSERT_EQ(splitLines(result.err).size(), 1u) << result.err;
  EXPECT_THAT(result.err, HasSubstr("KVLOG_LOG"));
  EXPECT_THAT(result.err, HasSubstr("logs/tvr.log"));
}

TEST_F(LoadTimeSettings, UnknownDestinationFallsBackToDefaultAndIsReported) {
  const ChildResult result = probe({"KVLOG_TRACE=console"}, {"settings"});
  EXPECT_EQ(result.out, "log=syslog 6000\ntrace=off 0\n");
  ASSERT_EQ(splitLines(result.err).size(), 1u) << result.err;
  EXPECT_THAT(result.err, HasSubstr("KVLOG_TRACE"));
  EXPECT_THAT(result.err, HasSubstr("console"));
}

TEST_F(LoadTimeSettings, NonNumericLevelFallsBackToDefaultAndIsReportedOnce) {
  const ChildResult result =
      probe({"KVLOG_LOG=stderr", "KVLOG_LOG_LEVEL=errors"}, {"settings", "settings"});
  EXPECT_EQ(result.out, "log=stderr 6000\ntrace=off 0\nlog=stderr 6000\ntrace=off 0\n");
  ASSERT_EQ(splitLines(result.err).size(), 1u) << result.err;
  EXPECT_THAT(result.err, HasSubstr("KVLOG_LOG_LEVEL"));
  EXPECT_THAT(result.err, HasSubstr("errors"));
}

TEST_F(LoadTimeSettings, EnvironmentWipedAfterLoadChangesNothing) {
  const ChildResult result =
      probe({"KVLOG_LOG=" + logFile}, {"clearenv", "settings", "log", "6000", "Cat", "kept"});
  EXPECT_EQ(result.out, "log=" + logFile + " 6000\ntrace=off 0\n");
  EXPECT_THAT(writtenMessages(logFile), ElementsAre("kept"));
}

TEST_F(LoadTimeSettings, StderrDestinationWritesFormattedLines) {
  const ChildResult result =
      probe({"KVLOG_TRACE=stderr"}, {"trace", "3000", "Cat", "on stderr"});
  const auto lines = splitLines(result.err);
  ASSERT_EQ(lines.size(), 1u) << result.err;
  const auto line = parseWrittenLine(lines[0]);
  ASSERT_TRUE(line) << lines[0];
  EXPECT_EQ(line->level, 3000);
  EXPECT_EQ(line->category, "Cat");
  EXPECT_EQ(line->message, "on stderr");
}

TEST_F(LoadTimeSettings, TimestampIsUtcWhateverTheLocalTimeZone) {
  const std::time_t before = std::time(nullptr);
  probe({"KVLOG_LOG=" + logFile, "TZ=JST-9"}, {"log", "6000", "Cat", "stamped"});
  const std::time_t after = std::time(nullptr);
  const auto lines = splitLines(tvr::testing::readFile(logFile));
  ASSERT_EQ(lines.size(), 1u);
  std::tm utc{};
  ASSERT_TRUE(::strptime(parseWrittenLine(lines[0])->timestamp.c_str(), "%Y-%m-%dT%H:%M:%S", &utc));
  // time() may trail the logger's finer clock by a tick; a local-time stamp
  // would be nine hours off.
  EXPECT_GE(::timegm(&utc), before - 1);
  EXPECT_LE(::timegm(&utc), after + 1);
}

} // namespace
