// The stderr destination, with the test process's stderr sent to a file.

#include "LoggerFixture.h"

#include <fcntl.h>
#include <unistd.h>

#include <gmock/gmock.h>

namespace {

using ::testing::ElementsAre;
using kvlogtest::logMessage;
using kvlogtest::writtenMessages;
using KVLog::Channel;

/// Sends file descriptor 2 to \p path while it exists.
class StderrRedirection {
public:
  explicit StderrRedirection(const std::string& path) : saved_(::dup(STDERR_FILENO)) {
    const int file = ::open(path.c_str(), O_WRONLY | O_CREAT | O_TRUNC | O_CLOEXEC, 0600);
    ::dup2(file, STDERR_FILENO);
    ::close(file);
  }
  ~StderrRedirection() {
    ::dup2(saved_, STDERR_FILENO);
    ::close(saved_);
  }

private:
  const int saved_;
};

using StderrSink = kvlogtest::LoggerTest;

TEST_F(StderrSink, WritesOneFormattedLinePerMessage) {
  const std::string captured = directory.file("stderr");
  {
    const StderrRedirection redirection(captured);
    KVLog::configureSink(Channel::Log, {kvlogtest::Destination::Stderr, {}, 4000});
    logMessage(3999, "too low");
    logMessage(4000, "first\nline");
    logMessage(6000, "second");
  }
  EXPECT_THAT(writtenMessages(captured), ElementsAre("first\\nline", "second"));
}

} // namespace
