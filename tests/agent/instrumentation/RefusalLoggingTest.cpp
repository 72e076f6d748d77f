//===- RefusalLoggingTest.cpp - A refused tree file is logged once --------===//

#include "HX/HardwareSource.h"
#include "HX/Instrumentation.h"

#include "KVLog/KVLogConfig.h"

#include "ScratchDirectory.h"

#include <gtest/gtest.h>

#include <mutex>
#include <string>
#include <vector>

namespace {

using namespace HX::NodeLexicon;

struct LoggedMessage {
  std::string category;
  int level;
  std::string text;
};

class RefusalLoggingTest : public ::testing::Test {
protected:
  void SetUp() override {
    SavedLog = KVLog::sinkSettings(KVLog::Channel::Log);
    KVLog::configureSink(KVLog::Channel::Log,
                         {KVLog::SinkSettings::Destination::Off, "", 0});
    ListenerId = KVLog::addListener([this](const KVLog::Message &message) {
      if (message.channel != KVLog::Channel::Log ||
          message.category != "TVR.HX.Instrumentation")
        return;
      std::lock_guard<std::mutex> guard(Lock);
      Logged.push_back({message.category, message.level, message.text});
    });
  }

  void TearDown() override {
    KVLog::removeListener(ListenerId);
    KVLog::configureSink(KVLog::Channel::Log, SavedLog);
  }

  std::vector<LoggedMessage> logged() {
    std::lock_guard<std::mutex> guard(Lock);
    return Logged;
  }

  /// Selects slots \p times times, each expected to fail.
  static void selectFailing(int times) {
    for (int i = 0; i < times; ++i) {
      HX::Instrumentation cursor;
      EXPECT_THROW(cursor.selectNode(SlotNode), HX::InstrumentationError);
    }
  }

  hxtest::ScratchDirectory Scratch;

private:
  KVLog::SinkSettings SavedLog{};
  int ListenerId = 0;
  std::mutex Lock;
  std::vector<LoggedMessage> Logged;
};

TEST_F(RefusalLoggingTest, RefusalIsLoggedOnceAt6000WhileTheFileStaysBroken) {
  const std::string path =
      Scratch.write("t.json", R"({"nodes": [{"type": "SlotNode", "status": -1}]})");
  HX::useHardwareTree(path);

  selectFailing(5);

  const std::vector<LoggedMessage> messages = logged();
  ASSERT_EQ(messages.size(), 1u);
  EXPECT_EQ(messages[0].category, "TVR.HX.Instrumentation");
  EXPECT_EQ(messages[0].level, 6000);
  EXPECT_EQ(messages[0].text,
            path + ": /nodes/0/status: expected an integer from 0 to "
                   "4294967295, found -1");
}

TEST_F(RefusalLoggingTest, ChangedProblemIsLoggedAgainOnce) {
  const std::string path =
      Scratch.write("t.json", R"({"nodes": [{"type": "SlotNode", "nmae": 1}]})");
  HX::useHardwareTree(path);
  selectFailing(2);

  Scratch.write("t.json", R"({"nodes": [{"type": "GizmoNode"}]})");
  selectFailing(3);

  const std::vector<LoggedMessage> messages = logged();
  ASSERT_EQ(messages.size(), 2u);
  EXPECT_EQ(messages[0].text, path + ": /nodes/0/nmae: unknown key");
  EXPECT_EQ(messages[1].text,
            path + ": /nodes/0/type: unknown node type \"GizmoNode\"");
}

TEST_F(RefusalLoggingTest, ProblemReturningAfterARepairIsLoggedAgain) {
  const std::string broken = R"({"nodes": [{"type": "SlotNode", "nmae": 1}]})";
  const std::string path = Scratch.write("t.json", broken);
  HX::useHardwareTree(path);
  selectFailing(2);

  Scratch.write("t.json", R"({"nodes": []})");
  HX::Instrumentation cursor;
  cursor.selectNode(SlotNode);
  Scratch.write("t.json", broken);
  selectFailing(2);

  EXPECT_EQ(logged().size(), 2u);
}

TEST_F(RefusalLoggingTest, MissingFileIsLoggedOnce) {
  const std::string path = Scratch.pathOf("absent.json");
  HX::useHardwareTree(path);

  selectFailing(3);

  const std::vector<LoggedMessage> messages = logged();
  ASSERT_EQ(messages.size(), 1u);
  EXPECT_EQ(messages[0].text,
            path + ": cannot read: No such file or directory");
}

TEST_F(RefusalLoggingTest, CheckingATreeDoesNotLog) {
  const std::string path =
      Scratch.write("t.json", R"({"nodes": [{"type": "GizmoNode"}]})");

  ASSERT_TRUE(HX::checkHardwareTree(path).has_value());

  EXPECT_TRUE(logged().empty());
}

TEST_F(RefusalLoggingTest, AcceptedTreeLogsNothing) {
  HX::useHardwareTree(Scratch.write("t.json", R"({"nodes": []})"));
  HX::Instrumentation cursor;

  cursor.selectNode(SlotNode);

  EXPECT_TRUE(logged().empty());
}

} // namespace
