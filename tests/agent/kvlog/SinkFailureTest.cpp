// A destination that fails: the caller never notices, the problem is
// reported once, and the destination recovers by itself.

#include "LoggerFixture.h"
#include "SyslogRecorder.h"

#include <sys/stat.h>
#include <syslog.h>
#include <thread>
#include <unistd.h>

#include <gmock/gmock.h>

namespace {

using ::testing::ElementsAre;
using ::testing::HasSubstr;
using ::testing::IsEmpty;
using kvlogtest::fileSink;
using kvlogtest::logMessage;
using kvlogtest::syslogCalls;
using kvlogtest::writtenMessages;
using KVLog::Channel;

class SinkFailure : public kvlogtest::LoggerTest {
protected:
  SinkFailure() { kvlogtest::clearSyslogCalls(); }

  const std::string missingDirectory = directory.file("not-yet");
  const std::string logFile = missingDirectory + "/tvr.log";
};

TEST_F(SinkFailure, UnopenableFileDoesNotThrow) {
  KVLog::configureSink(Channel::Log, fileSink(logFile));
  EXPECT_NO_THROW(logMessage(6000, "dropped"));
}

TEST_F(SinkFailure, UnopenableFileIsReportedOnceToSyslog) {
  KVLog::configureSink(Channel::Log, fileSink(logFile));
  for (int i = 0; i < 5; ++i)
    logMessage(6000, "dropped");
  std::this_thread::sleep_for(std::chrono::milliseconds(1100));
  logMessage(6000, "dropped after the retry");

  const auto calls = syslogCalls();
  ASSERT_EQ(calls.size(), 1u);
  EXPECT_EQ(calls[0].priority, LOG_DAEMON | LOG_ERR);
  EXPECT_THAT(calls[0].text, HasSubstr(logFile));
  EXPECT_THAT(calls[0].text, HasSubstr("No such file or directory"));
}

TEST_F(SinkFailure, UnopenableFileRecoversWhenTheDirectoryAppears) {
  KVLog::configureSink(Channel::Log, fileSink(logFile));
  logMessage(6000, "dropped");
  ASSERT_EQ(::mkdir(missingDirectory.c_str(), 0755), 0);
  std::this_thread::sleep_for(std::chrono::milliseconds(1100));
  logMessage(6000, "written");
  EXPECT_THAT(writtenMessages(logFile), ElementsAre("written"));
}

TEST_F(SinkFailure, OpenIsNotRetriedWithinASecondOfAFailure) {
  KVLog::configureSink(Channel::Log, fileSink(logFile));
  logMessage(6000, "dropped");
  ASSERT_EQ(::mkdir(missingDirectory.c_str(), 0755), 0);
  logMessage(6000, "dropped as well");
  EXPECT_THAT(writtenMessages(logFile), IsEmpty());
}

TEST_F(SinkFailure, EachFailingFileIsReportedOnItsOwn) {
  KVLog::configureSink(Channel::Log, fileSink(logFile));
  KVLog::configureSink(Channel::Trace, fileSink(missingDirectory + "/trace.log"));
  logMessage(6000, "dropped");
  kvlogtest::traceMessage(6000, "dropped");
  logMessage(6000, "dropped");
  EXPECT_EQ(syslogCalls().size(), 2u);
}

TEST_F(SinkFailure, FullDiskDropsMessagesAndIsReportedOnce) {
  // A path of this test's own, so that no earlier test has used its sink.
  const std::string fullDisk = directory.file("full");
  ASSERT_EQ(::symlink("/dev/full", fullDisk.c_str()), 0);
  KVLog::configureSink(Channel::Log, fileSink(fullDisk));
  for (int i = 0; i < 3; ++i)
    EXPECT_NO_THROW(logMessage(6000, "dropped"));
  const auto calls = syslogCalls();
  ASSERT_EQ(calls.size(), 1u);
  EXPECT_THAT(calls[0].text, HasSubstr(fullDisk));
  EXPECT_THAT(calls[0].text, HasSubstr("No space left on device"));
}

} // namespace
