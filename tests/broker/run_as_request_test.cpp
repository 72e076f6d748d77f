// ObjectManager::runAsRequest: test code calling the broker as a provider
// would, inside a request of its own.
#include "BrokerTestSupport.h"

#include <stdexcept>

namespace tvr::broker::test {
namespace {

using RunAsRequestTest = TestProviderTest;

TEST_F(RunAsRequestTest, BodyGetsTheBrokerAndAContextOfTheNamespace) {
  const CMPIBroker* seen = nullptr;
  std::string nameSpace;
  om.runAsRequest(
      [&](const CMPIBroker* b, const CMPIContext* ctx) {
        seen = b;
        const CMPIData entry = CMGetContextEntry(ctx, CMPIInitNameSpace, nullptr);
        if (entry.type == CMPI_string) nameSpace = CMGetCharsPtr(entry.value.string, nullptr);
      },
      "root/tvrtest");
  EXPECT_EQ(seen, om.broker());
  EXPECT_EQ(nameSpace, "root/tvrtest");
}

TEST_F(RunAsRequestTest, NamespaceDefaultsToRootCimv2) {
  std::string nameSpace;
  om.runAsRequest([&](const CMPIBroker*, const CMPIContext* ctx) {
    nameSpace = CMGetCharsPtr(CMGetContextEntry(ctx, CMPIInitNameSpace, nullptr).value.string, nullptr);
  });
  EXPECT_EQ(nameSpace, "root/cimv2");
}

TEST_F(RunAsRequestTest, ObjectsMadeInsideAreNotLongLived) {
  om.runAsRequest([](const CMPIBroker* b, const CMPIContext*) {
    CMNewInstance(b, CMNewObjectPath(b, "root/tvrtest", "TVR_Echo", nullptr), nullptr);
    CMNewString(b, "inside", nullptr);
    b->mft->cmpiMalloc(b, 64);
  });
  EXPECT_EQ(om.longLivedObjects(), 0u);
}

TEST_F(RunAsRequestTest, TraceCallsAreRecordedInTheResponse) {
  const Response r = om.runAsRequest([](const CMPIBroker* b, const CMPIContext*) {
    CMTraceMessage(b, 3, "direct", "called from the test", nullptr);
  });
  ASSERT_EQ(r.traces.size(), 1u);
  EXPECT_EQ(r.traces[0].str(), "3 direct: called from the test");
  EXPECT_TRUE(r.items.empty());
}

TEST_F(RunAsRequestTest, UpCallsInsideAreServed) {
  std::size_t paths = 0;
  const Response r = om.runAsRequest([&](const CMPIBroker* b, const CMPIContext* ctx) {
    CMPIEnumeration* found =
        CBEnumInstances(b, ctx, CMNewObjectPath(b, "root/tvrtest", "TVR_Echo", nullptr), nullptr, nullptr);
    while (found && CMHasNext(found, nullptr)) paths += CMGetNext(found, nullptr).type == CMPI_instance;
  });
  EXPECT_EQ(paths, 1u);
  ASSERT_EQ(r.traces.size(), 1u);
  EXPECT_EQ(r.traces[0].text, "echo enumerated");
  EXPECT_EQ(om.longLivedObjects(), 0u);
}

TEST_F(RunAsRequestTest, ThrowingBodyLeavesNoRequestBehind) {
  EXPECT_THROW(om.runAsRequest([](const CMPIBroker* b, const CMPIContext*) {
    CMNewString(b, "made before the throw", nullptr);
    throw std::runtime_error("body failed");
  }),
               std::runtime_error);
  // Outside any request again: a new object is long-lived.
  CMNewString(om.broker(), "after", nullptr);
  EXPECT_EQ(om.longLivedObjects(), 1u);
}

} // namespace
} // namespace tvr::broker::test
