// The syslog destination, observed through the recorded syslog() calls.

#include "LoggerFixture.h"
#include "SyslogRecorder.h"

#include <syslog.h>

#include <gmock/gmock.h>

namespace {

using ::testing::Contains;
using ::testing::IsEmpty;
using kvlogtest::logMessage;
using kvlogtest::syslogCalls;
using kvlogtest::traceMessage;
using KVLog::Channel;

class SyslogSink : public kvlogtest::LoggerTest {
protected:
  SyslogSink() { kvlogtest::clearSyslogCalls(); }
};

TEST_F(SyslogSink, SendsOneCallPerMessageWithLevelCategoryAndText) {
  KVLog::configureSink(Channel::Log, {kvlogtest::Destination::Syslog, {}, 0});
  logMessage(6000, "fan 2 stopped", "TVR_Fan");
  logMessage(6000, "fan 3 stopped", "TVR_Fan");
  const auto calls = syslogCalls();
  ASSERT_EQ(calls.size(), 2u);
  EXPECT_EQ(calls[0].text, "6000 TVR_Fan fan 2 stopped");
  EXPECT_EQ(calls[1].text, "6000 TVR_Fan fan 3 stopped");
}

TEST_F(SyslogSink, UsesFacilityDaemonAndPriorityByLevel) {
  KVLog::configureSink(Channel::Trace, {kvlogtest::Destination::Syslog, {}, -100});
  const std::vector<std::pair<int, int>> priorityOfLevel = {
      {-100, LOG_DEBUG}, {3000, LOG_DEBUG},   {3999, LOG_DEBUG},   {4000, LOG_INFO},
      {4999, LOG_INFO},  {5000, LOG_WARNING}, {5999, LOG_WARNING}, {6000, LOG_ERR},
      {9000, LOG_ERR}};
  for (const auto& [level, priority] : priorityOfLevel)
    traceMessage(level, "text");
  const auto calls = syslogCalls();
  ASSERT_EQ(calls.size(), priorityOfLevel.size());
  for (size_t i = 0; i < calls.size(); ++i)
    EXPECT_EQ(calls[i].priority, LOG_DAEMON | priorityOfLevel[i].second)
        << "level " << priorityOfLevel[i].first;
}

TEST_F(SyslogSink, IdentIsTvr) {
  KVLog::configureSink(Channel::Log, {kvlogtest::Destination::Syslog, {}, 0});
  logMessage(6000, "text");
  const auto opened = kvlogtest::openlogCalls();
  ASSERT_EQ(opened.size(), 1u);
  EXPECT_EQ(opened[0].ident, "tvr");
  EXPECT_EQ(opened[0].facility, LOG_DAEMON);
}

TEST_F(SyslogSink, LineBreaksAreSentAsEscapes) {
  KVLog::configureSink(Channel::Log, {kvlogtest::Destination::Syslog, {}, 0});
  logMessage(6000, "one\ntwo\rthree");
  const auto calls = syslogCalls();
  ASSERT_EQ(calls.size(), 1u);
  EXPECT_EQ(calls[0].text, "6000 Test one\\ntwo\\rthree");
}

TEST_F(SyslogSink, TextIsNotTakenAsAFormat) {
  KVLog::configureSink(Channel::Log, {kvlogtest::Destination::Syslog, {}, 0});
  logMessage(6000, "100% %s %n");
  ASSERT_EQ(syslogCalls().size(), 1u);
  EXPECT_EQ(syslogCalls()[0].text, "6000 Test 100% %s %n");
}

TEST_F(SyslogSink, MessageBelowLevelIsNotSent) {
  KVLog::configureSink(Channel::Log, {kvlogtest::Destination::Syslog, {}, 6000});
  logMessage(5999, "too low");
  EXPECT_THAT(syslogCalls(), IsEmpty());
}

} // namespace
