// File destinations: what is written, where, and when.

#include "LoggerFixture.h"

#include <climits>
#include <cstdio>
#include <ctime>
#include <fcntl.h>
#include <filesystem>
#include <sys/stat.h>
#include <thread>
#include <unistd.h>

#include <gmock/gmock.h>

namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;
using kvlogtest::fileSink;
using kvlogtest::logMessage;
using kvlogtest::parseWrittenLine;
using kvlogtest::traceMessage;
using kvlogtest::writtenMessages;
using KVLog::Channel;
using tvr::testing::readFile;
using tvr::testing::splitLines;
using tvr::testing::writeFile;

/// A file destination checks at most once per second whether its path still
/// names the open file.
void waitPastReplacementCheck() { std::this_thread::sleep_for(std::chrono::milliseconds(1100)); }

class FileSink : public kvlogtest::LoggerTest {
protected:
  const std::string logFile = directory.file("tvr.log");
};

TEST_F(FileSink, MessageBelowLevelIsNotWritten) {
  KVLog::configureSink(Channel::Log, fileSink(logFile, 4000));
  logMessage(3999, "too low");
  EXPECT_EQ(readFile(logFile), "");
}

TEST_F(FileSink, MessageAtLevelIsWritten) {
  KVLog::configureSink(Channel::Log, fileSink(logFile, 4000));
  logMessage(4000, "just enough");
  EXPECT_THAT(writtenMessages(logFile), ElementsAre("just enough"));
}

TEST_F(FileSink, LineIsTimestampLevelCategoryMessage) {
  KVLog::configureSink(Channel::Log, fileSink(logFile));
  logMessage(6000, "disk 3 failed: code=5", "TVR_PhysicalAsset");
  const std::string content = readFile(logFile);
  ASSERT_EQ(content.back(), '\n');
  const auto line = parseWrittenLine(content.substr(0, content.size() - 1));
  ASSERT_TRUE(line) << content;
  EXPECT_EQ(content.substr(line->timestamp.size()), " 6000 TVR_PhysicalAsset disk 3 failed: code=5\n");
}

TEST_F(FileSink, TimestampIsTheCurrentUtcTime) {
  KVLog::configureSink(Channel::Log, fileSink(logFile));
  const std::time_t before = std::time(nullptr);
  logMessage(6000, "now");
  const std::time_t after = std::time(nullptr);
  const auto line = parseWrittenLine(splitLines(readFile(logFile)).at(0));
  ASSERT_TRUE(line);
  std::tm utc{};
  ASSERT_TRUE(::strptime(line->timestamp.c_str(), "%Y-%m-%dT%H:%M:%S", &utc));
  const std::time_t written = ::timegm(&utc);
  EXPECT_GE(written, before);
  EXPECT_LE(written, after);
}

TEST_F(FileSink, LineBreaksInMessageAreWrittenAsEscapes) {
  KVLog::configureSink(Channel::Log, fileSink(logFile));
  logMessage(6000, "first\nsecond\r\nthird");
  EXPECT_THAT(writtenMessages(logFile), ElementsAre("first\\nsecond\\r\\nthird"));
}

TEST_F(FileSink, LineBreaksInCategoryAreWrittenAsEscapes) {
  KVLog::configureSink(Channel::Log, fileSink(logFile));
  logMessage(6000, "text", "Cat\nEgory");
  EXPECT_EQ(splitLines(readFile(logFile)).size(), 1u);
  EXPECT_EQ(parseWrittenLine(splitLines(readFile(logFile)).at(0))->category, "Cat\\nEgory");
}

TEST_F(FileSink, OtherCharactersAreWrittenVerbatim) {
  KVLog::configureSink(Channel::Log, fileSink(logFile));
  const std::string text = "tab\there back\\slash \"quoted\" %s %n \xc3\xa9t\xc3\xa9";
  logMessage(6000, text);
  EXPECT_THAT(writtenMessages(logFile), ElementsAre(text));
}

TEST_F(FileSink, EmptyMessageStillMakesALine) {
  KVLog::configureSink(Channel::Log, fileSink(logFile));
  logMessage(6000, "");
  logMessage(6000, "next");
  EXPECT_THAT(writtenMessages(logFile), ElementsAre("", "next"));
}

TEST_F(FileSink, LogAndTraceChannelsWriteToTheirOwnFiles) {
  const std::string traceFile = directory.file("trace.log");
  KVLog::configureSink(Channel::Log, fileSink(logFile));
  KVLog::configureSink(Channel::Trace, fileSink(traceFile));
  logMessage(6000, "for the log");
  traceMessage(3000, "for the trace");
  EXPECT_THAT(writtenMessages(logFile), ElementsAre("for the log"));
  EXPECT_THAT(writtenMessages(traceFile), ElementsAre("for the trace"));
}

TEST_F(FileSink, ChannelsMayShareOneFile) {
  KVLog::configureSink(Channel::Log, fileSink(logFile));
  KVLog::configureSink(Channel::Trace, fileSink(logFile));
  logMessage(6000, "log");
  traceMessage(3000, "trace");
  logMessage(6000, "log again");
  EXPECT_THAT(writtenMessages(logFile), ElementsAre("log", "trace", "log again"));
}

TEST_F(FileSink, TraceChannelFiltersByItsOwnLevel) {
  KVLog::configureSink(Channel::Log, fileSink(logFile, 6000));
  KVLog::configureSink(Channel::Trace, fileSink(logFile, 3000));
  traceMessage(2999, "trace too low");
  logMessage(3000, "log too low");
  traceMessage(3000, "trace at level");
  EXPECT_THAT(writtenMessages(logFile), ElementsAre("trace at level"));
}

TEST_F(FileSink, ChannelTurnedOffWritesNothingWhateverTheLevel) {
  KVLog::configureSink(Channel::Log, fileSink(logFile));
  logMessage(6000, "before");
  KVLog::configureSink(Channel::Log, {kvlogtest::Destination::Off, {}, INT_MIN});
  logMessage(INT_MAX, "after");
  EXPECT_THAT(writtenMessages(logFile), ElementsAre("before"));
}

TEST_F(FileSink, ReconfiguredChannelWritesToTheNewFile) {
  const std::string otherFile = directory.file("other.log");
  KVLog::configureSink(Channel::Log, fileSink(logFile));
  logMessage(6000, "one");
  KVLog::configureSink(Channel::Log, fileSink(otherFile));
  logMessage(6000, "two");
  EXPECT_THAT(writtenMessages(logFile), ElementsAre("one"));
  EXPECT_THAT(writtenMessages(otherFile), ElementsAre("two"));
}

TEST_F(FileSink, AppendsToAnExistingFile) {
  writeFile(logFile, "earlier line\n");
  KVLog::configureSink(Channel::Log, fileSink(logFile));
  logMessage(6000, "appended");
  const auto lines = splitLines(readFile(logFile));
  ASSERT_EQ(lines.size(), 2u);
  EXPECT_EQ(lines[0], "earlier line");
  EXPECT_EQ(parseWrittenLine(lines[1])->message, "appended");
}

TEST_F(FileSink, CreatesTheFileWithMode0640) {
  const mode_t previousMask = ::umask(022);
  KVLog::configureSink(Channel::Log, fileSink(logFile));
  logMessage(6000, "creates");
  ::umask(previousMask);
  struct stat status {};
  ASSERT_EQ(::stat(logFile.c_str(), &status), 0);
  EXPECT_EQ(status.st_mode & 0777, 0640u);
}

TEST_F(FileSink, DescriptorIsClosedOnExec) {
  KVLog::configureSink(Channel::Log, fileSink(logFile));
  logMessage(6000, "opens");
  int found = 0;
  for (const auto& entry : std::filesystem::directory_iterator("/proc/self/fd")) {
    std::error_code error;
    if (std::filesystem::read_symlink(entry.path(), error) != logFile)
      continue;
    ++found;
    const int fd = std::stoi(entry.path().filename());
    EXPECT_TRUE(::fcntl(fd, F_GETFD) & FD_CLOEXEC);
    EXPECT_TRUE(::fcntl(fd, F_GETFL) & O_APPEND);
  }
  EXPECT_EQ(found, 1);
}

TEST_F(FileSink, RenamedFileKeepsTheLinesOfTheSecondAfterTheLastCheck) {
  KVLog::configureSink(Channel::Log, fileSink(logFile));
  logMessage(6000, "before rotation");
  ASSERT_EQ(std::rename(logFile.c_str(), (logFile + ".1").c_str()), 0);
  logMessage(6000, "right after rotation");
  EXPECT_THAT(writtenMessages(logFile + ".1"), ElementsAre("before rotation", "right after rotation"));
  EXPECT_FALSE(std::filesystem::exists(logFile));
}

TEST_F(FileSink, RenamedFileIsFollowedByANewFileAtThePath) {
  KVLog::configureSink(Channel::Log, fileSink(logFile));
  logMessage(6000, "before rotation");
  ASSERT_EQ(std::rename(logFile.c_str(), (logFile + ".1").c_str()), 0);
  waitPastReplacementCheck();
  logMessage(6000, "after rotation");
  logMessage(6000, "and on");
  EXPECT_THAT(writtenMessages(logFile + ".1"), ElementsAre("before rotation"));
  EXPECT_THAT(writtenMessages(logFile), ElementsAre("after rotation", "and on"));
}

TEST_F(FileSink, RemovedFileIsCreatedAgain) {
  KVLog::configureSink(Channel::Log, fileSink(logFile));
  logMessage(6000, "before removal");
  ASSERT_EQ(::unlink(logFile.c_str()), 0);
  waitPastReplacementCheck();
  logMessage(6000, "after removal");
  EXPECT_THAT(writtenMessages(logFile), ElementsAre("after removal"));
}

TEST_F(FileSink, ReplacedFileIsFollowedByTheReplacement) {
  KVLog::configureSink(Channel::Log, fileSink(logFile));
  logMessage(6000, "old file");
  const std::string replacement = directory.file("replacement");
  writeFile(replacement, "");
  ASSERT_EQ(std::rename(replacement.c_str(), logFile.c_str()), 0);
  waitPastReplacementCheck();
  logMessage(6000, "new file");
  EXPECT_THAT(writtenMessages(logFile), ElementsAre("new file"));
}

} // namespace
