// Listeners: every logger call, as made, in order.

#include "LoggerFixture.h"

#include <atomic>
#include <thread>

#include <gmock/gmock.h>

namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;
using kvlogtest::logMessage;
using kvlogtest::traceMessage;
using KVLog::Channel;
using KVLog::Message;

/// A copy of what a listener was given.
struct Heard {
  Channel channel;
  std::string function;
  std::string file;
  int line;
  std::string category;
  int level;
  std::string text;
};

std::string describe(const Heard& heard) {
  return std::string(heard.channel == Channel::Log ? "log " : "trace ") +
         std::to_string(heard.level) + " " + heard.category + " " + heard.text;
}

/// Registers a listener that copies every call, and removes it at the end.
class Listening : public kvlogtest::LoggerTest {
protected:
  Listening() {
    id_ = KVLog::addListener([this](const Message& message) {
      heard.push_back({message.channel, message.function, message.file, message.line,
                       message.category, message.level, message.text});
    });
  }
  ~Listening() override { KVLog::removeListener(id_); }

  std::vector<std::string> described() const {
    std::vector<std::string> lines;
    for (const Heard& entry : heard)
      lines.push_back(describe(entry));
    return lines;
  }

  void stopListening() { KVLog::removeListener(id_); }

  std::vector<Heard> heard;

private:
  int id_ = 0;
};

TEST_F(Listening, HearsEveryCallInOrderWithItsChannel) {
  KVLog::configureSink(Channel::Log, {kvlogtest::Destination::Off, {}, 0});
  KVLog::configureSink(Channel::Trace, kvlogtest::fileSink(directory.file("t.log"), 5000));
  logMessage(3000, "entering", "A");
  traceMessage(3000, "entering", "A");
  traceMessage(6000, "failed", "B");
  logMessage(4000, "done", "A");
  EXPECT_THAT(described(), ElementsAre("log 3000 A entering", "trace 3000 A entering",
                                       "trace 6000 B failed", "log 4000 A done"));
}

TEST_F(Listening, HearsTheCallerLocation) {
  KVLog::KVLogger::logLevelMessage("enumInstances", "src/providers/Chassis.cpp", 42, "Chassis",
                                   3000, nullptr, 0, 0, "ENTERING");
  ASSERT_EQ(heard.size(), 1u);
  EXPECT_EQ(heard[0].function, "enumInstances");
  EXPECT_EQ(heard[0].file, "src/providers/Chassis.cpp");
  EXPECT_EQ(heard[0].line, 42);
}

TEST_F(Listening, HearsMessagesBeforeLineBreaksAreEscaped) {
  logMessage(3000, "a\nb");
  ASSERT_EQ(heard.size(), 1u);
  EXPECT_EQ(heard[0].text, "a\nb");
}

TEST_F(Listening, HearsNothingAfterRemoval) {
  logMessage(3000, "heard");
  stopListening();
  logMessage(3000, "not heard");
  traceMessage(3000, "not heard either");
  EXPECT_THAT(described(), ElementsAre("log 3000 Test heard"));
}

TEST_F(Listening, OtherListenersKeepHearingAfterOneIsRemoved) {
  std::vector<std::string> other;
  const int otherId =
      KVLog::addListener([&other](const Message& message) { other.push_back(message.text); });
  logMessage(3000, "both");
  stopListening();
  logMessage(3000, "other only");
  KVLog::removeListener(otherId);
  EXPECT_THAT(described(), ElementsAre("log 3000 Test both"));
  EXPECT_THAT(other, ElementsAre("both", "other only"));
}

TEST_F(Listening, RemovingAnUnknownIdChangesNothing) {
  KVLog::removeListener(-12345);
  logMessage(3000, "still heard");
  EXPECT_EQ(heard.size(), 1u);
}

TEST_F(Listening, ThrowingListenerDoesNotReachTheCaller) {
  const int throwing =
      KVLog::addListener([](const Message&) -> void { throw std::runtime_error("listener"); });
  EXPECT_NO_THROW(logMessage(3000, "text"));
  KVLog::removeListener(throwing);
  EXPECT_EQ(heard.size(), 1u);
}

TEST_F(Listening, ListenerMayRemoveItselfWhileCalled) {
  int calls = 0;
  int selfId = 0;
  selfId = KVLog::addListener([&](const Message&) {
    ++calls;
    KVLog::removeListener(selfId);
  });
  logMessage(3000, "first");
  logMessage(3000, "second");
  EXPECT_EQ(calls, 1);
  EXPECT_EQ(heard.size(), 2u);
}

TEST(Listener, HearsCallsFromEveryThread) {
  std::atomic<int> calls{0};
  const int id = KVLog::addListener([&calls](const Message&) { ++calls; });
  std::vector<std::thread> threads;
  for (int t = 0; t < 4; ++t)
    threads.emplace_back([] {
      for (int i = 0; i < 500; ++i)
        logMessage(-1, "below every level");
    });
  for (std::thread& thread : threads)
    thread.join();
  KVLog::removeListener(id);
  EXPECT_EQ(calls.load(), 2000);
}

} // namespace
