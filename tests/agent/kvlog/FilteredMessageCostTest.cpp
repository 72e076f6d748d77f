// A message that is filtered out costs a compare: in particular it does not
// allocate (the line is not built).

#include "AllocationCounter.h"
#include "LoggerFixture.h"

#include <gtest/gtest.h>

namespace {

using kvlogtest::allocationCount;
using kvlogtest::fileSink;
using KVLog::Channel;

class FilteredMessageCost : public kvlogtest::LoggerTest {
protected:
  const std::string category = "TVR_PhysicalPackage";
  const std::string text = "ENTERING enumInstances with a parameter list long enough to need heap";
};

TEST_F(FilteredMessageCost, MessageBelowLevelAllocatesNothing) {
  KVLog::configureSink(Channel::Log, fileSink(directory.file("log"), 6000));
  const long before = allocationCount();
  for (int i = 0; i < 100; ++i)
    KVLog::KVLogger::logLevelMessage(__func__, __FILE__, __LINE__, category, 3000, nullptr, 0, 0,
                                     text);
  EXPECT_EQ(allocationCount(), before);
}

TEST_F(FilteredMessageCost, MessageToAChannelThatIsOffAllocatesNothing) {
  const long before = allocationCount();
  for (int i = 0; i < 100; ++i)
    KVLog::KVLogger::traceLevelMessage(__func__, __FILE__, __LINE__, category, 6000, nullptr, 0,
                                       0, text);
  EXPECT_EQ(allocationCount(), before);
}

TEST_F(FilteredMessageCost, WrittenMessageIsCounted) {
  // The counter sees the logger's allocations: a written line is built on
  // the heap.
  KVLog::configureSink(Channel::Log, fileSink(directory.file("log"), 6000));
  kvlogtest::logMessage(6000, "opens the file");
  const long before = allocationCount();
  KVLog::KVLogger::logLevelMessage(__func__, __FILE__, __LINE__, category, 6000, nullptr, 0, 0,
                                   text);
  EXPECT_GT(allocationCount(), before);
}

} // namespace
