// The broker's trace and log functions, as the object manager records them
// in the response of the request that made them.
#include "BrokerTestSupport.h"

namespace tvr::broker::test {
namespace {

using TraceTest = TestProviderTest;

TEST_F(TraceTest, TraceCallIsRecordedWithLevelComponentTextAndBroker) {
  const Response r = om.enumerateInstances(classPath("TVR_Traces"));
  ASSERT_EQ(r.traces.size(), 4u);
  const TraceLine& line = r.traces[0];
  EXPECT_EQ(line.source, TraceLine::Source::Trace);
  EXPECT_EQ(line.level, 4);
  EXPECT_EQ(line.component, "TestComponent");
  EXPECT_EQ(line.text, "full trace");
  EXPECT_FALSE(line.string);
  EXPECT_EQ(line.broker, om.broker());
  EXPECT_EQ(line.str(), "4 TestComponent: full trace");
}

TEST_F(TraceTest, NullComponentAndTextAreRecordedAsAbsent) {
  const Response r = om.enumerateInstances(classPath("TVR_Traces"));
  ASSERT_EQ(r.traces.size(), 4u);
  const TraceLine& line = r.traces[1];
  EXPECT_EQ(line.level, 2);
  EXPECT_FALSE(line.component);
  EXPECT_FALSE(line.text);
  EXPECT_EQ(line.str(), "2 (null): (null)");
}

TEST_F(TraceTest, StringArgumentIsRecorded) {
  const Response r = om.enumerateInstances(classPath("TVR_Traces"));
  ASSERT_EQ(r.traces.size(), 4u);
  EXPECT_EQ(r.traces[2].string, "attached");
}

TEST_F(TraceTest, LogMessageIsRecordedWithSeverityAndMessageId) {
  const Response r = om.enumerateInstances(classPath("TVR_Traces"));
  ASSERT_EQ(r.traces.size(), 4u);
  const TraceLine& line = r.traces[3];
  EXPECT_EQ(line.source, TraceLine::Source::LogMessage);
  EXPECT_EQ(line.level, 1);
  EXPECT_EQ(line.component, "TVR0001");
  EXPECT_EQ(line.text, "logged message");
  EXPECT_EQ(line.broker, om.broker());
}

TEST_F(TraceTest, ObserverSeesEachTraceCallAsItIsMade) {
  std::vector<std::string> seen;
  RequestOptions options;
  options.traceObserver = [&](const TraceLine& line) { seen.push_back(line.str()); };
  const Response r = om.enumerateInstances(classPath("TVR_Traces"), std::nullopt, options);
  ASSERT_EQ(r.traces.size(), 4u);
  ASSERT_EQ(seen.size(), 4u);
  for (std::size_t i = 0; i < seen.size(); ++i) EXPECT_EQ(seen[i], r.traces[i].str());
}

TEST_F(TraceTest, TracesCanBeLeftOutOfTheResponse) {
  int seen = 0;
  RequestOptions options;
  options.keepTraces = false;
  options.traceObserver = [&](const TraceLine&) { ++seen; };
  const Response r = om.enumerateInstances(classPath("TVR_Traces"), std::nullopt, options);
  EXPECT_TRUE(r.traces.empty());
  EXPECT_EQ(seen, 4);
}

TEST_F(TraceTest, EachResponseHasOnlyItsOwnTraces) {
  const Response first = om.getInstance(keyedPath("TVR_Echo", {{"Id", "first"}}));
  const Response second = om.getInstance(keyedPath("TVR_Echo", {{"Id", "second"}}));
  ASSERT_EQ(first.traces.size(), 1u);
  ASSERT_EQ(second.traces.size(), 1u);
  EXPECT_EQ(first.traces[0].text, "echo first");
  EXPECT_EQ(second.traces[0].text, "echo second");
}

TEST_F(TraceTest, TraceOutsideAnyRequestIsNotRecordedAnywhere) {
  const CMPIBroker* b = om.broker();
  const CMPIStatus rc = CMTraceMessage(b, 1, "outside", "between requests", nullptr);
  EXPECT_EQ(rc.rc, CMPI_RC_OK);
  EXPECT_TRUE(om.enumerateInstanceNames(classPath("TVR_AllTypes")).traces.empty());
}

TEST_F(TraceTest, TraceThroughAForeignBrokerIsAnInvalidHandle) {
  CMPIBroker foreign = *om.broker();
  foreign.bft = nullptr;
  EXPECT_EQ(om.broker()->eft->trace(&foreign, 1, "c", "t", nullptr).rc, CMPI_RC_ERR_INVALID_HANDLE);
  EXPECT_EQ(om.broker()->eft->logMessage(nullptr, 1, "c", "t", nullptr).rc, CMPI_RC_ERR_INVALID_HANDLE);
}

} // namespace
} // namespace tvr::broker::test
