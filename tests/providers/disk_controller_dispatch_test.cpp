// How DiskController_EnumInstances serves the three classes built from the
// storage controller nodes: the class the request names, in any case of
// letters, picks the presentation; and lcase, through which it compares.
#include "PhysicalAssetProvider.h"
#include "ProviderHarness.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace tvr::test {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;
using broker::FailureShape;
using broker::Fault;
using broker::ResultItem;
using KVLog::Channel;

// An IDE controller, a RAID controller without other identifying
// information, and a second IDE controller.
const char* const kThreeControllers = R"({
  "systemName": "blade.example.com",
  "nodes": [
    {"type": "StorageControllerNode", "name": "ide0", "properties": {"PropOtherIdentifyingInfo": "IDE mode"}},
    {"type": "StorageControllerNode", "name": "raid"},
    {"type": "StorageControllerNode", "name": "ide1", "properties": {"PropOtherIdentifyingInfo": "legacy"}}
  ]})";

class DiskControllerDispatchTest : public ::testing::Test {
protected:
  void SetUp() override { harness.useTree(kThreeControllers); }

  // Sends EnumerateInstances of `className` to DiskControllerProvider,
  // whatever the registration says of that class.
  Response enumerateThroughDiskProvider(const std::string& className) {
    broker::RequestOptions options;
    options.routeTo = "TVRHX_DiskController";
    return harness.om().enumerateInstances(classPath(className), std::nullopt, options);
  }

  static std::vector<std::string> classesOf(const Response& r) {
    std::vector<std::string> out;
    for (const ResultItem& item : r.items) out.push_back(item.path.className);
    return out;
  }

  ProviderHarness harness;
};

TEST_F(DiskControllerDispatchTest, DiskControllerClassInAnyCaseGivesEveryNodeAsDiskController) {
  for (const char* name : {"TVRHX_DiskController", "tvrhx_diskcontroller", "TVRHX_DISKCONTROLLER"}) {
    Response r = enumerateThroughDiskProvider(name);
    EXPECT_TRUE(r.ok()) << name;
    EXPECT_THAT(classesOf(r), ElementsAre("TVRHX_DiskController", "TVRHX_DiskController", "TVRHX_DiskController"))
        << name;
    EXPECT_EQ(r.doneCount, 1) << name;
  }
}

TEST_F(DiskControllerDispatchTest, IDEControllerClassGivesIDEControllersOfQualifyingNodes) {
  Response r = harness.enumerateInstances("TVRHX_IDEController");
  EXPECT_EQ(r.outcomes.at(0).provider, "DiskControllerProvider");
  EXPECT_TRUE(r.ok());
  EXPECT_EQ(r.doneCount, 1);
  ASSERT_EQ(r.items.size(), 2u);
  EXPECT_THAT(classesOf(r), ElementsAre("TVRHX_IDEController", "TVRHX_IDEController"));
  EXPECT_EQ(property(r.items[0].instance, "DeviceID"), Value::chars("/ide0"));
  EXPECT_EQ(property(r.items[1].instance, "DeviceID"), Value::chars("/ide1"));
}

TEST_F(DiskControllerDispatchTest, ChipClassInLowerCaseGivesChipsOfQualifyingNodes) {
  Response r = harness.enumerateInstances("tvrhx_chipidecont");
  EXPECT_EQ(r.outcomes.at(0).provider, "DiskControllerProvider");
  ASSERT_EQ(r.items.size(), 2u);
  EXPECT_THAT(classesOf(r), ElementsAre("TVRHX_ChipIDECont", "TVRHX_ChipIDECont"));
  EXPECT_EQ(property(r.items[0].instance, "Tag"), Value::chars("/ide0"));
  EXPECT_EQ(property(r.items[1].instance, "Tag"), Value::chars("/ide1"));
}

TEST_F(DiskControllerDispatchTest, IDEClassesInMixedCaseAreDispatchedToo) {
  EXPECT_THAT(classesOf(enumerateThroughDiskProvider("Tvrhx_IdeController")),
              ElementsAre("TVRHX_IDEController", "TVRHX_IDEController"));
  EXPECT_THAT(classesOf(enumerateThroughDiskProvider("TVRHX_CHIPIDECONT")),
              ElementsAre("TVRHX_ChipIDECont", "TVRHX_ChipIDECont"));
}

TEST_F(DiskControllerDispatchTest, AnotherClassBuildsNothingAndAnswersOk) {
  LoggerCapture capture;
  Response r = enumerateThroughDiskProvider("CIM_Controller");
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 1);
  EXPECT_THAT(r.traces, IsEmpty());
  // The handler made no class comparison of its own: the list function ran.
  std::vector<std::string> functions;
  for (const LoggedLine& line : capture.lines())
    if (line.channel == Channel::Log) functions.push_back(line.function);
  EXPECT_THAT(functions, ElementsAre("DiskController_EnumInstances", "getAllDiskControllerInstances",
                                     "getAllDiskControllerInstances", "DiskController_EnumInstances"));
}

TEST_F(DiskControllerDispatchTest, NamesLongerOrShorterThanTheClassAreOtherClasses) {
  for (const char* name : {"TVRHX_DiskControllerX", "TVRHX_DiskControlle", "TVRHX_IDEController ",
                           "TVRHX_ChipIDEContainer", "TVRHX_ChipIDE", "CIM_DiskController"}) {
    Response r = enumerateThroughDiskProvider(name);
    EXPECT_EQ(r.rc, CMPI_RC_OK) << name;
    EXPECT_THAT(r.items, IsEmpty()) << name;
  }
}

TEST_F(DiskControllerDispatchTest, IDEBranchTracesTheBuildersAndTheListWithTheDiskControllerText) {
  harness.useTree(R"({"nodes": [
    {"type": "StorageControllerNode", "name": "ide0", "properties": {"PropOtherIdentifyingInfo": "IDE mode"}},
    {"type": "StorageControllerNode", "name": "raid"}]})");
  Response r = harness.enumerateInstances("TVRHX_IDEController");
  EXPECT_THAT(traceTexts(r), ElementsAre("*** Returning COPs of DiskController ***",
                                         "*** Returning an instance of IDEController ***",
                                         "*** Returning an instance of DiskController ***"));
  for (const broker::TraceLine& t : r.traces)
    EXPECT_EQ(t.component, std::optional<std::string>("PhysicalAssetProvider"));
}

TEST_F(DiskControllerDispatchTest, DiskControllerBranchKeepsAFailedInstance) {
  harness.om().faults().failNext(Fault::NewObjectPath, 1);
  Response r = harness.enumerateInstances("TVRHX_DiskController");
  ASSERT_EQ(r.items.size(), 3u);
  EXPECT_EQ(r.items[0].kind, ResultItem::Kind::NullInstance);
  EXPECT_EQ(r.items[1].kind, ResultItem::Kind::Instance);
}

TEST_F(DiskControllerDispatchTest, IDEBranchesDropAFailedInstance) {
  for (const char* ideClass : {"TVRHX_IDEController", "TVRHX_ChipIDECont"}) {
    harness.om().faults().failNext(Fault::NewObjectPath, 1);
    Response r = harness.enumerateInstances(ideClass);
    ASSERT_EQ(r.items.size(), 1u) << ideClass;
    EXPECT_EQ(r.items[0].kind, ResultItem::Kind::Instance) << ideClass;
    EXPECT_EQ(r.items[0].path.keys[0].value, Value::chars("/ide1")) << ideClass;
  }
}

TEST_F(DiskControllerDispatchTest, IDEBranchesKeepAHollowInstance) {
  harness.om().faults().failNext(Fault::NewInstance, 1, FailureShape::Hollow);
  Response r = harness.enumerateInstances("TVRHX_ChipIDECont");
  ASSERT_EQ(r.items.size(), 2u);
  EXPECT_EQ(r.items[0].kind, ResultItem::Kind::NullInstance);
  EXPECT_EQ(r.items[1].kind, ResultItem::Kind::Instance);
}

using HX::PhysicalAssetProvider::lcase;

TEST(LcaseTest, MixedCaseTextComesBackInLowerCaseInBothOutAndResult) {
  char text[] = "TVRHX_ChipIDECont";
  std::string out = "previous";
  const std::string result = lcase(text, out);
  EXPECT_EQ(out, "tvrhx_chipidecont");
  EXPECT_EQ(result, "tvrhx_chipidecont");
  EXPECT_STREQ(text, "TVRHX_ChipIDECont") << "the text itself is left as it was";
}

TEST(LcaseTest, CharactersOtherThanCapitalsAreKept) {
  char text[] = "a1_ Z@[\xC4\xE9";
  std::string out;
  EXPECT_EQ(lcase(text, out), "a1_ z@[\xC4\xE9");
}

TEST(LcaseTest, EmptyTextGivesEmptyText) {
  char text[] = "";
  std::string out = "previous";
  EXPECT_EQ(lcase(text, out), "");
  EXPECT_EQ(out, "");
}

TEST(LcaseTest, MissingTextReadsAsEmpty) {
  std::string out = "previous";
  EXPECT_EQ(lcase(nullptr, out), "");
  EXPECT_EQ(out, "");
}

} // namespace
} // namespace tvr::test
