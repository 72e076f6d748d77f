// The tracing header: line formats, the shared buffers, the closing lines of
// a handler and the insertion of parameter lists.
#include "ProviderHarness.h"
#include "Trace.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>


namespace tvr::test {
namespace {

using ::testing::ElementsAre;
using KVLog::Channel;

TEST(TraceFormatTest, ParameterLinesOfEveryType) {
  EXPECT_STREQ(HX::tracepara("f", "a.cpp", 7, " x=1", HX::MsgEnter),
               "ENTERING: f() in a.cpp [Line: 7],Parameters List:  x=1");
  EXPECT_STREQ(HX::tracepara("f", "a.cpp", 7, " x=1", HX::MsgExit),
               "EXITING: f() in a.cpp [Line: 7],Parameters List:  x=1");
  EXPECT_STREQ(HX::tracepara("f", "a.cpp", 7, " x=1", HX::MsgMethod),
               "METHOD: f() was invoked in a.cpp [Line: 7],Parameters List:  x=1");
  EXPECT_STREQ(HX::tracepara("text", "a.cpp", 7, " x=1", HX::MsgMessage),
               "MESSAGE [File: a.cpp, Line: 7]: text,Parameters List:  x=1");
}

TEST(TraceFormatTest, UnknownTypeFormatsAsEntering) {
  EXPECT_STREQ(HX::tracepara("f", "a.cpp", 1, "", static_cast<HX::MessageType>(9)),
               "ENTERING: f() in a.cpp [Line: 1],Parameters List: ");
  EXPECT_STREQ(HX::trace("f", "a.cpp", 1, static_cast<HX::MessageType>(9)), "ENTERING: f() in a.cpp [Line: 1]");
}

TEST(TraceFormatTest, LinesWithoutParameters) {
  EXPECT_STREQ(HX::trace("f", "a.cpp", 3, HX::MsgEnter), "ENTERING: f() in a.cpp [Line: 3]");
  EXPECT_STREQ(HX::trace("f", "a.cpp", 3, HX::MsgExit), "EXITING: f() in a.cpp [Line: 3]");
  EXPECT_STREQ(HX::trace("f", "a.cpp", 3, HX::MsgMethod), "METHOD: f() was invoked in a.cpp [Line: 3]");
  EXPECT_STREQ(HX::trace("lost", "a.cpp", 3, HX::MsgMessage), "MESSAGE [File: a.cpp, Line: 3]: lost");
}

TEST(TraceFormatTest, EachKindOfLineHasOneSharedBuffer) {
  char* first = HX::tracepara("f", "a.cpp", 1, "", HX::MsgEnter);
  char* second = HX::tracepara("g", "b.cpp", 2, "", HX::MsgExit);
  EXPECT_EQ(first, second);
  EXPECT_NE(static_cast<void*>(HX::trace("f", "a.cpp", 1, HX::MsgEnter)), static_cast<void*>(first));
  EXPECT_EQ(HX::trace("f", "a.cpp", 1, HX::MsgEnter), HX::trace("g", "b.cpp", 2, HX::MsgExit));
}

TEST(TraceFormatTest, LineLongerThanTheBufferIsCutAt511Bytes) {
  const std::string parameters(2000, 'p');
  const std::string line = HX::tracepara("f", "a.cpp", 1, parameters.c_str(), HX::MsgEnter);
  EXPECT_EQ(line.size(), 511u);
  EXPECT_EQ(line.rfind("ENTERING: f() in a.cpp [Line: 1],Parameters List: ppp", 0), 0u);
}

TEST(TraceFormatTest, ShorterLineLeavesNoRestOfALongerOne) {
  HX::tracepara("a_long_function_name", "a_long_file_name.cpp", 1, " a long list", HX::MsgEnter);
  char* buffer = HX::tracepara("f", "a.cpp", 1, "", HX::MsgExit);
  const std::string line = buffer;
  for (std::size_t i = line.size(); i < 512; ++i) ASSERT_EQ(buffer[i], '\0') << "byte " << i;
}

TEST(TraceParametersTest, NullTextLeavesTheRestOfTheListOut) {
  KVLog::KVMessageBuffer buffer;
  std::ostream& out = buffer;
  const std::string text = buffer.str(out << " a=" << HX::traceText("x") << " b=" << HX::traceText(nullptr)
                                          << " c=" << HX::traceText("y"));
  EXPECT_EQ(text, " a=x b=");
}

TEST(TraceParametersTest, TextsKeepTheBuffersOwnInserter) {
  KVLog::KVMessageBuffer buffer;
  char text[] = "plain";
  char* mutableText = text;
  const char* constText = "const";
  EXPECT_EQ(buffer.str(buffer << mutableText), "plain");
  EXPECT_EQ(buffer.str(buffer << constText), "const");
}

TEST(TraceParametersTest, PointersPrintAsAddresses) {
  KVLog::KVMessageBuffer buffer;
  const CMPIBroker* broker = reinterpret_cast<const CMPIBroker*>(0x1234);
  CMPIInstanceMI* mi = reinterpret_cast<CMPIInstanceMI*>(0x5678);
  EXPECT_EQ(buffer.str(buffer << " broker=" << broker << " mi=" << mi), " broker=0x1234 mi=0x5678");
  EXPECT_EQ(buffer.str(buffer << " mi=" << mi), " mi=0x5678");
}

TEST(TraceEventTest, EventGoesToLogThenTraceEachFormattedAnew) {
  LoggerCapture capture;
  int formatted = 0;
  HX::traceEvent(std::string("Korvane.Test"), HX::MsgEnter, HX::TraceOrigin{"handler", "x.cpp", 12},
                 [&](KVLog::KVMessageBuffer& p) -> const std::string& {
                   ++formatted;
                   return p.str(p << " n=" << "1");
                 });
  EXPECT_EQ(formatted, 2);
  const std::vector<LoggedLine> lines = capture.lines();
  ASSERT_EQ(lines.size(), 2u);
  EXPECT_EQ(lines[0].channel, Channel::Log);
  EXPECT_EQ(lines[1].channel, Channel::Trace);
  for (const LoggedLine& line : lines) {
    EXPECT_EQ(line.text, "ENTERING: handler() in x.cpp [Line: 12],Parameters List:  n=1");
    EXPECT_EQ(line.function, "handler");
    EXPECT_EQ(line.file, "x.cpp");
    EXPECT_EQ(line.line, 12);
    EXPECT_EQ(line.level, 3000);
    EXPECT_EQ(line.category, "Korvane.Test");
  }
}

TEST(TraceEventTest, MessageLineGoesToBothChannelsAtItsLevel) {
  LoggerCapture capture;
  HX::traceMessage(std::string("Korvane.Test"), 6000, HX::TraceOrigin{"handler", "x.cpp", 40}, "Up-call failed");
  const std::vector<LoggedLine> lines = capture.lines();
  ASSERT_EQ(lines.size(), 2u);
  EXPECT_EQ(lines[0].channel, Channel::Log);
  EXPECT_EQ(lines[1].channel, Channel::Trace);
  for (const LoggedLine& line : lines) {
    EXPECT_EQ(line.text, "MESSAGE [File: x.cpp, Line: 40]: Up-call failed");
    EXPECT_EQ(line.level, 6000);
  }
}

TEST(MarkProviderExitTest, WritesTheExitLineAndASeparatorToBothChannels) {
  LoggerCapture capture;
  HX::markProviderExit("Korvane.Test", "Handler_Associators", "src/providers/X.cpp", 99);
  const std::vector<LoggedLine> lines = capture.lines();
  ASSERT_EQ(lines.size(), 4u);
  EXPECT_THAT(capture.texts(Channel::Log),
              ElementsAre("EXITING: Handler_Associators() in src/providers/X.cpp [Line: 99]", std::string(78, '=')));
  EXPECT_THAT(capture.texts(Channel::Trace),
              ElementsAre("EXITING: Handler_Associators() in src/providers/X.cpp [Line: 99]", std::string(78, '=')));
  EXPECT_EQ(lines[0].channel, Channel::Log);
  EXPECT_EQ(lines[1].channel, Channel::Trace);
  for (const LoggedLine& line : lines) {
    EXPECT_EQ(line.level, 4000);
    EXPECT_EQ(line.function, "markProviderExit");
    EXPECT_EQ(line.file, "include/Trace.h");
    EXPECT_EQ(line.category, "Korvane.Test");
  }
}

} // namespace
} // namespace tvr::test
