// Many writers on one file: every message is one whole line, none is lost.

#include "LoggerFixture.h"

#include <set>
#include <sys/wait.h>
#include <thread>
#include <unistd.h>

#include <gmock/gmock.h>

namespace {

using kvlogtest::fileSink;
using kvlogtest::logMessage;
using kvlogtest::parseWrittenLine;
using KVLog::Channel;
using tvr::testing::readFile;
using tvr::testing::splitLines;

/// Long enough that a line written in pieces would very likely interleave.
const std::string kPadding(200, '.');

std::string messageText(int writer, int sequence) {
  return "writer=" + std::to_string(writer) + " seq=" + std::to_string(sequence) + " " + kPadding;
}

/// Checks that \p path holds exactly the lines messageText(w, s) for every
/// writer w < writers and sequence s < perWriter, in any order.
void expectEveryMessageOnceAsWholeLine(const std::string& path, int writers, int perWriter) {
  const auto lines = splitLines(readFile(path));
  EXPECT_EQ(lines.size(), static_cast<size_t>(writers * perWriter));
  std::set<std::string> seen;
  int malformed = 0;
  for (const std::string& line : lines) {
    const auto parsed = parseWrittenLine(line);
    if (!parsed || parsed->level != 6000 || parsed->category != "Stress") {
      ++malformed;
      continue;
    }
    seen.insert(parsed->message);
  }
  EXPECT_EQ(malformed, 0);
  for (int writer = 0; writer < writers; ++writer)
    for (int sequence = 0; sequence < perWriter; ++sequence)
      if (!seen.count(messageText(writer, sequence)))
        ADD_FAILURE() << "missing: " << messageText(writer, sequence).substr(0, 24);
}

void writeMessages(int writer, int count) {
  for (int sequence = 0; sequence < count; ++sequence)
    logMessage(6000, messageText(writer, sequence), "Stress");
}

using ConcurrentWriting = kvlogtest::LoggerTest;

TEST_F(ConcurrentWriting, EightThreadsWriteWholeLinesAndLoseNone) {
  const std::string logFile = directory.file("threads.log");
  KVLog::configureSink(Channel::Log, fileSink(logFile));
  constexpr int kThreads = 8;
  constexpr int kPerThread = 2000;
  std::vector<std::thread> threads;
  for (int writer = 0; writer < kThreads; ++writer)
    threads.emplace_back(writeMessages, writer, kPerThread);
  for (std::thread& thread : threads)
    thread.join();
  expectEveryMessageOnceAsWholeLine(logFile, kThreads, kPerThread);
}

TEST_F(ConcurrentWriting, TwoProcessesWriteWholeLinesAndLoseNone) {
  const std::string logFile = directory.file("processes.log");
  KVLog::configureSink(Channel::Log, fileSink(logFile));
  constexpr int kPerProcess = 4000;
  const pid_t child = ::fork();
  ASSERT_GE(child, 0);
  if (child == 0) {
    writeMessages(1, kPerProcess);
    ::_exit(0);
  }
  writeMessages(0, kPerProcess);
  int status = 0;
  ASSERT_EQ(::waitpid(child, &status, 0), child);
  ASSERT_TRUE(WIFEXITED(status) && WEXITSTATUS(status) == 0);
  expectEveryMessageOnceAsWholeLine(logFile, 2, kPerProcess);
}

TEST_F(ConcurrentWriting, ReconfiguringWhileThreadsWriteLosesNoLine) {
  const std::string first = directory.file("first.log");
  const std::string second = directory.file("second.log");
  KVLog::configureSink(Channel::Log, fileSink(first));
  constexpr int kThreads = 4;
  constexpr int kPerThread = 2000;
  std::atomic<int> running{kThreads};
  std::vector<std::thread> threads;
  for (int writer = 0; writer < kThreads; ++writer)
    threads.emplace_back([writer, &running] {
      writeMessages(writer, kPerThread);
      --running;
    });
  for (int switches = 0; running > 0; ++switches)
    KVLog::configureSink(Channel::Log, fileSink(switches % 2 ? first : second));
  for (std::thread& thread : threads)
    thread.join();
  const std::string both = directory.file("both.log");
  tvr::testing::writeFile(both, readFile(first) + readFile(second));
  expectEveryMessageOnceAsWholeLine(both, kThreads, kPerThread);
}

} // namespace
