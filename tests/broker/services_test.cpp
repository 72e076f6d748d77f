// The broker's operating-system services (xft) and memory services (mft),
// used by a provider while it serves a request.
#include "BrokerTestSupport.h"

#include <cerrno>

namespace tvr::broker::test {
namespace {

using ServicesTest = TestProviderTest;

Instance reportOf(ObjectManager& om, const std::string& className) {
  const Response r = om.enumerateInstances(classPath(className));
  EXPECT_TRUE(r.ok()) << statusName(r.rc) << " " << r.message.value_or("");
  EXPECT_EQ(r.instances().size(), 1u);
  return r.instances().empty() ? Instance() : r.instances()[0];
}

TEST_F(ServicesTest, ThreadsStartSignalAndJoinWithTheirResults) {
  const Instance report = reportOf(om, "TVR_Threads");
  EXPECT_EQ(*report.property("Arrived"), Value::sint32(3));
  EXPECT_EQ(*report.property("JoinRc"), Value::sint32(0));
  EXPECT_EQ(*report.property("JoinedSum"), Value::sint32(100 + 101 + 102));
}

TEST_F(ServicesTest, ThreadOnceRunsItsFunctionOnceForAllThreads) {
  EXPECT_EQ(*reportOf(om, "TVR_Threads").property("OnceRuns"), Value::sint32(1));
}

TEST_F(ServicesTest, ThreadKeysHoldOneValuePerThread) {
  const Instance report = reportOf(om, "TVR_Threads");
  EXPECT_EQ(*report.property("CreateKeyRc"), Value::sint32(0));
  EXPECT_EQ(*report.property("WorkerKeysStartedEmpty"), Value::boolean(true));
  EXPECT_EQ(*report.property("WorkerKeysKeptOwnValue"), Value::boolean(true));
  EXPECT_EQ(*report.property("MainKeyKeptOwnValue"), Value::boolean(true));
  EXPECT_EQ(*report.property("DestroyKeyRc"), Value::sint32(0));
}

TEST_F(ServicesTest, TimedConditionWaitWithoutSignalTimesOut) {
  const Instance report = reportOf(om, "TVR_Threads");
  EXPECT_EQ(*report.property("TimedWaitRc"), Value::sint32(ETIMEDOUT));
}

TEST_F(ServicesTest, MemoryFromMallocIsAlignedLikeMalloc) {
  EXPECT_EQ(*reportOf(om, "TVR_Memory").property("MallocAligned"), Value::boolean(true));
}

TEST_F(ServicesTest, ReallocKeepsTheContent) {
  EXPECT_EQ(*reportOf(om, "TVR_Memory").property("ReallocKeptContent"), Value::boolean(true));
}

TEST_F(ServicesTest, CallocGivesZeroedMemory) {
  EXPECT_EQ(*reportOf(om, "TVR_Memory").property("CallocZeroed"), Value::boolean(true));
}

TEST_F(ServicesTest, StrDupCopiesTheText) {
  EXPECT_EQ(*reportOf(om, "TVR_Memory").property("StrDupEqual"), Value::boolean(true));
}

TEST_F(ServicesTest, MarkAndReleaseSucceed) {
  const Instance report = reportOf(om, "TVR_Memory");
  EXPECT_EQ(*report.property("MarkRc"), Value::sint32(CMPI_RC_OK));
  EXPECT_EQ(*report.property("ReleaseRc"), Value::sint32(CMPI_RC_OK));
}

TEST_F(ServicesTest, ServicesWorkForRequestAfterRequest) {
  for (int i = 0; i < 3; ++i) {
    EXPECT_EQ(*reportOf(om, "TVR_Threads").property("OnceRuns"), Value::sint32(1));
    EXPECT_EQ(*reportOf(om, "TVR_Memory").property("ReleaseRc"), Value::sint32(CMPI_RC_OK));
  }
}

TEST_F(ServicesTest, ResolveFileNameGivesTheLibraryFileName) {
  char* name = om.broker()->xft->resolveFileName("tvrbrokertestprovider");
  ASSERT_NE(name, nullptr);
  EXPECT_STREQ(name, "libtvrbrokertestprovider.so");
  std::free(name);
  EXPECT_EQ(om.broker()->xft->resolveFileName(nullptr), nullptr);
}

} // namespace
} // namespace tvr::broker::test
