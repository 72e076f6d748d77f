// The read-handler frame every element provider runs, driven with list
// functions of the test's own: the element providers' lists cannot fail, so
// only this way are the frame's failure branches seen.
#include "ElementProviderFrame.h"
#include "ProviderHarness.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace tvr::test {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;
using namespace HX::PhysicalAssetProvider;

const std::string kCategory = "Korvane.FrameTest";

unsigned short failingPaths(const CMPIBroker*, const CMPIContext*, const CMPIObjectPath*,
                            std::vector<CMPIObjectPath*>&, CMPIStatus* rc) {
  rc->rc = CMPI_RC_ERR_ACCESS_DENIED;
  return 1;
}

unsigned short failingInstances(const CMPIBroker*, const CMPIContext*, const CMPIObjectPath*, const char**,
                                std::vector<CMPIInstance*>&, CMPIStatus* rc) {
  rc->rc = CMPI_RC_ERR_ACCESS_DENIED;
  return 1;
}

unsigned short failingLookup(const CMPIBroker*, const CMPIContext*, const CMPIObjectPath*, const char**,
                             CMPIInstance*&, CMPIStatus* rc) {
  rc->rc = CMPI_RC_ERR_ACCESS_DENIED;
  return 1;
}

const ElementFrame kFailingFrame = {"TEST_Element", "FrameTestProvider", kCategory,
                                    failingPaths,   failingInstances,    failingLookup};

class ElementFrameTest : public ::testing::Test {
protected:
  // Runs one handler of the frame on a path of TEST_Element.
  template <class Handler> Response run(Handler handler) {
    return harness.om().runAsRequest([&](const CMPIBroker* broker, const CMPIContext* ctx, const CMPIResult* result) {
      CMPIObjectPath* ref = CMNewObjectPath(broker, "root/cimv2", "TEST_Element", nullptr);
      status = handler(broker, ctx, result, ref);
    });
  }

  std::vector<std::string> logged() const {
    std::vector<std::string> out;
    for (const std::string& text : capture.texts(KVLog::Channel::Log)) out.push_back(maskedLine(text));
    return out;
  }

  ProviderHarness harness;
  LoggerCapture capture;
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  const HX::TraceOrigin origin{"TEST_Handler", "test.cpp", 7};
};

TEST_F(ElementFrameTest, FailedPathListLeavesEnteringAloneAndTheAnswerOpen) {
  Response r = run([&](const CMPIBroker* broker, const CMPIContext* ctx, const CMPIResult* result, CMPIObjectPath* ref) {
    return enumElementNames(kFailingFrame, broker, origin, nullptr, ctx, result, ref);
  });
  EXPECT_EQ(status.rc, CMPI_RC_ERR_ACCESS_DENIED) << "the status the list function left";
  EXPECT_EQ(r.doneCount, 0);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_THAT(traceTexts(r), ElementsAre("***Can't get Instances, Exiting EnumerateInstanceNames***"));
  EXPECT_EQ(r.traces[0].component, std::optional<std::string>("FrameTestProvider"));
  EXPECT_THAT(logged(), ElementsAre("ENTERING: TEST_Handler() in test.cpp [Line: N],Parameters List:  mi=0 ctx=0x? "
                                    "result=0x? ref=0x?"));
}

TEST_F(ElementFrameTest, FailedInstanceListLeavesEnteringAloneAndTheAnswerOpen) {
  Response r = run([&](const CMPIBroker* broker, const CMPIContext* ctx, const CMPIResult* result, CMPIObjectPath* ref) {
    return enumElementInstances(kFailingFrame, broker, origin, nullptr, ctx, result, ref, nullptr);
  });
  EXPECT_EQ(status.rc, CMPI_RC_ERR_ACCESS_DENIED);
  EXPECT_EQ(r.doneCount, 0);
  EXPECT_THAT(traceTexts(r), ElementsAre("*** Could not get instances, exiting EnumerateInstance ***"));
  EXPECT_EQ(logged().size(), 1u);
}

TEST_F(ElementFrameTest, FailedLookupReturnsItsStatusWithoutTraceOrCompletion) {
  Response r = run([&](const CMPIBroker* broker, const CMPIContext* ctx, const CMPIResult* result, CMPIObjectPath* ref) {
    return getElementInstance(kFailingFrame, broker, origin, nullptr, ctx, result, ref, nullptr);
  });
  EXPECT_EQ(status.rc, CMPI_RC_ERR_ACCESS_DENIED);
  EXPECT_EQ(r.doneCount, 0);
  EXPECT_THAT(r.traces, IsEmpty());
  EXPECT_EQ(logged().size(), 1u);
}

TEST_F(ElementFrameTest, AnotherClassNeverReachesTheListFunctions) {
  const ElementFrame otherClass = {"TEST_Other", "FrameTestProvider", kCategory,
                                   failingPaths, failingInstances,    failingLookup};
  Response r = run([&](const CMPIBroker* broker, const CMPIContext* ctx, const CMPIResult* result, CMPIObjectPath* ref) {
    return enumElementNames(otherClass, broker, origin, nullptr, ctx, result, ref);
  });
  EXPECT_EQ(status.rc, CMPI_RC_OK);
  EXPECT_EQ(r.doneCount, 1);
  EXPECT_EQ(logged().size(), 2u);
}

TEST_F(ElementFrameTest, WithoutClassComparisonAnyClassReachesTheList) {
  const ElementFrame otherClass = {"TEST_Other", "FrameTestProvider", kCategory,
                                   failingPaths, failingInstances,    failingLookup};
  Response r = run([&](const CMPIBroker* broker, const CMPIContext* ctx, const CMPIResult* result, CMPIObjectPath* ref) {
    return enumElementInstances(otherClass, broker, origin, nullptr, ctx, result, ref, nullptr, false);
  });
  EXPECT_EQ(status.rc, CMPI_RC_ERR_ACCESS_DENIED);
  EXPECT_EQ(r.doneCount, 0);
}

} // namespace
} // namespace tvr::test
